#pragma once

#include <QLineEdit>

class QCompleter;
class QStringListModel;

namespace zandor::designer {

/// Where a column or an expression is typed: the names that have the word at the cursor in them are
/// offered, those that begin with it first, and what is wrong is underlined.
class FieldEdit final : public QLineEdit {
    Q_OBJECT

public:
    explicit FieldEdit(QWidget* parent = nullptr);

    void offer(const QStringList& names);
    /// What stands below the field and says something of it, which the list leaves in sight. It
    /// outlives the field.
    void keepInSight(QWidget& below);
    /// Underlines the text from a place on; a negative one nothing.
    void mark(int from);
    int marked() const { return mMarked; }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    QString wordAtCursor() const;
    void complete();
    void showList();
    void take(const QString& word);

    QStringList mNames;
    QCompleter* mCompleter;
    QStringListModel* mOffered; ///< those of the names that are in the list
    QWidget* mBelow = nullptr;
    int mMarked = -1;
};

} // namespace zandor::designer
