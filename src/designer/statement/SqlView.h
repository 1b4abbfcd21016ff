#pragma once

#include <QPlainTextEdit>

namespace zandor::designer {

class SqlHighlighter;

/// Shows a statement. What stays the same when the text changes keeps its selection and its place.
class SqlView final : public QPlainTextEdit {
    Q_OBJECT

public:
    explicit SqlView(QWidget* parent = nullptr);

    void setStatement(const QString& text);
    /// Exactly what was set, which toPlainText() need not be.
    const QString& statement() const { return mStatement; }

    QSize sizeHint() const override;

protected:
    void changeEvent(QEvent* event) override;

private:
    void replace(const QString& text);

    QString mStatement;
    SqlHighlighter* mHighlighter;
};

} // namespace zandor::designer
