#pragma once

#include <QPlainTextEdit>

#include <functional>

namespace zandor::designer {

class SqlHighlighter;

/// Shows a statement, and takes one that is typed once it is not read-only any more. What stays the
/// same when the text changes keeps its selection and its place.
class SqlView final : public QPlainTextEdit {
    Q_OBJECT

public:
    explicit SqlView(QWidget* parent = nullptr);

    /// In place of whatever is there, typed or not; typing() is not emitted.
    void setStatement(const QString& text);
    /// Exactly what was set, which toPlainText() need not be.
    const QString& statement() const { return mStatement; }

    /// What stands there by now; line ends are "\n".
    QString text() const;
    /// The same as one who types it: can be taken back, and typing() is emitted.
    void type(const QString& text);
    /// From now on nothing that was typed can be taken back here.
    void forgetTyping();

    /// Is asked first of each key, and says whether it has dealt with it.
    void setKeyHandler(std::function<bool(QKeyEvent&)> handler) {
        mKeyHandler = std::move(handler);
    }

    /// Puts a wave under the word at a place of the text; a negative one under none.
    void mark(int position);
    /// Whether a wave is there, and where it begins and ends.
    bool isMarked() const { return !extraSelections().isEmpty(); }
    QTextCursor marked() const { return extraSelections().value(0).cursor; }

    QSize sizeHint() const override;

signals:
    /// Somebody has changed the text.
    void typing();
    /// Escape, which nothing else had a use for.
    void left();
    void findWanted();
    /// The keyboard goes elsewhere, or a command of the window's is about to be given.
    void turnedAway();

protected:
    void insertFromMimeData(const QMimeData* source) override;
    void changeEvent(QEvent* event) override;
    bool event(QEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;

private:
    void replace(const QString& text);
    void wrapFor(const QString& text);
    void hear();
    void showMark();

    QString mStatement;
    QString mHeard; ///< the text as it was last set or typed
    int mMarked = -1;
    std::function<bool(QKeyEvent&)> mKeyHandler;
    SqlHighlighter* mHighlighter;
};

} // namespace zandor::designer
