#pragma once

#include <QWidget>

class QLineEdit;

namespace zandor::designer {

class SqlView;

/// Finds text in a statement: a line below it, which Ctrl+F in the statement shows and Escape
/// hides. Enter leads to the next place, Shift+Enter to the one before.
class FindBar final : public QWidget {
    Q_OBJECT

public:
    explicit FindBar(SqlView& view, QWidget* parent = nullptr);

    void open();
    void findNext() { find(false, false); }
    void findBefore() { find(true, false); }

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void close();
    void find(bool backward, bool fromHere);

    SqlView& mView;
    QLineEdit* mText;
};

} // namespace zandor::designer
