#pragma once

#include <Zandor/DatabaseReader.h>

#include <QWidget>

class QLabel;
class QLineEdit;
class QListView;
class QStackedWidget;
class QToolButton;

namespace zandor::designer {

class Database;
class ErrorLine;
class TableListModel;

/// The tables of the database, to be found by name and chosen for the drawing: with Enter, a double
/// click, the menu, or by dragging them there.
class TablesPanel final : public QWidget {
    Q_OBJECT

public:
    explicit TablesPanel(Database& database, QWidget* parent = nullptr);

    /// Where typing looks for tables; for a shortcut to the panel.
    QLineEdit& filterBox() { return *mFilter; }

signals:
    void chosen(const std::vector<reader::TableId>& tables);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void lay();
    void showDatabase();
    void filter();
    void showCount();
    void choose();
    void refresh();
    void showMenu(QPoint at);
    bool filterKey(int key);

    Database& mDatabase;
    QString mAddress; ///< of the database that is shown
    TableListModel* mModel;
    QLineEdit* mFilter;
    QToolButton* mRefresh;
    QListView* mList;
    QLabel* mEmpty;
    QStackedWidget* mPages;
    QLabel* mCount;
    ErrorLine* mError;
};

} // namespace zandor::designer
