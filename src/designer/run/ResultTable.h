#pragma once

#include "designer/run/ResultModel.h"

#include <QTableView>

#include <functional>

namespace zandor::designer {

/// The rows of a result, to be looked at and copied.
class ResultTable final : public QTableView {
    Q_OBJECT

public:
    explicit ResultTable(QWidget* parent = nullptr);

    ResultModel& rows() { return *mModel; }
    /// Makes the columns as wide as the rows that are there need, within reason.
    void fitColumns();
    /// Makes those wider that their rows no longer fit in, within reason.
    void widenColumns();
    /// The arrow in the header; -1 for none. Sorts nothing.
    void showSorting(int column, Qt::SortOrder direction = Qt::AscendingOrder);
    QAction* copyAction() { return mCopy; }
    /// An entry of the context menu.
    QAction* addCommand(const QString& text, const char* name, const std::function<void()>& what);
    /// What is said in the middle while there are no rows; empty for nothing.
    void setEmptyText(const QString& text);
    const QString& emptyText() const { return mEmptyText; }

signals:
    /// More cells are selected than can be copied.
    void tooMuchToCopy();

protected:
    void keyPressEvent(QKeyEvent* event) override;
    void paintEvent(QPaintEvent* event) override;

private:
    void numberRows();
    void copy();

    ResultModel* mModel;
    QAction* mCopy;
    QString mEmptyText;
};

} // namespace zandor::designer
