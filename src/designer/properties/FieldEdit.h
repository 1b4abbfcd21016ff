#pragma once

#include <QLineEdit>

class QCompleter;
class QStringListModel;

namespace zandor::designer {

/// Where a column or an expression is typed: the names that begin like the word at the cursor are
/// offered, and what is wrong is underlined.
class FieldEdit final : public QLineEdit {
    Q_OBJECT

public:
    explicit FieldEdit(QWidget* parent = nullptr);

    void offer(const QStringList& words);
    /// Underlines the text from a place on; a negative one nothing.
    void mark(int from);
    int marked() const { return mMarked; }

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    QString wordAtCursor() const;
    void complete();
    void take(const QString& word);

    QCompleter* mCompleter;
    QStringListModel* mWords;
    int mMarked = -1;
};

} // namespace zandor::designer
