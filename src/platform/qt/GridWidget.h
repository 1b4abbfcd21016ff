#pragma once

#include <QCoreApplication>
#include <QTableView>

#include <functional>

namespace platform::qt {

class GridCorner;
class GridHeader;
class GridModel;

class GridListener {
public:
    virtual ~GridListener() = default;
    /// `at` is in the grid's own coordinates, headers included.
    virtual void pressed(Qt::MouseButton button, Qt::KeyboardModifiers modifiers, QPointF at) = 0;
    virtual void released(Qt::MouseButton button, Qt::KeyboardModifiers modifiers, QPointF at) = 0;
    virtual void scrolled() = 0;
    /// A key asks for the menu of the cell around `at`; it is to open at a place of the screen.
    virtual void menuKey(QPointF at, QPoint screen) = 0;
    virtual void deleteKey(QPointF at) = 0;
    /// A key with a printable text, for the current cell. False when it means nothing there.
    virtual bool typed(QKeyEvent& event) = 0;
    virtual bool dragAccepted(const QMimeData* data) = 0;
    virtual bool dropped(const QMimeData* data, QPointF at) = 0;
};

/// The grid of output columns: a table view whose headers are the fixed row and column. The view
/// follows the model's data, widths and current cell when the events at hand have been dealt with,
/// or at once by `bringUpToDate`.
class GridWidget : public QWidget {
    Q_DECLARE_TR_FUNCTIONS(platform::qt::GridWidget)

public:
    GridWidget(int rows, int cols, QWidget* parent);

    void setListener(GridListener* listener) { mListener = listener; }
    GridModel& model() const { return *mModel; }
    QTableView& view() const { return *mView; }

    /// The model has changed.
    void touch();
    /// The model's current cell has changed; rows and columns count the fixed ones.
    void setCurrentCell(int row, int col);
    int currentRow() const { return mRow; }
    int currentCol() const { return mCol; }

    void bringUpToDate() const;
    /// Scrolls as little as brings the current cell into view.
    void showCurrentCell();
    int firstRow() const;
    int firstCol() const;
    int columnWidth(int col) const;
    int rowHeight() const { return mRowHeight; }
    /// The width that a text takes in a column, without the margins of every column.
    qreal textWidth(const QString& text) const;
    /// The rectangle of a cell in the grid's own coordinates, in logical pixels.
    QRect cellRect(int row, int col) const;
    void setLabelWidth(float twips);

    bool eventFilter(QObject* watched, QEvent* event) override;

protected:
    void resizeEvent(QResizeEvent* event) override;
    void changeEvent(QEvent* event) override;
    void dragEnterEvent(QDragEnterEvent* event) override;
    void dragMoveEvent(QDragMoveEvent* event) override;
    void dropEvent(QDropEvent* event) override;

private:
    /// How wide a sample is in the font that the columns were last fitted to.
    struct Sample {
        qreal text = 0;
        qreal around = 0; ///< what a style sheet adds
    };

    GridHeader& fields() const;
    GridHeader& titles() const;
    void measure();
    /// Columns keep the share of their texts that they show.
    void fitColumnsToFont();
    void refresh();
    void fitLabels();
    bool mouse(QWidget* part, QMouseEvent* event);
    bool keyPressed(QKeyEvent& event);
    void openMenu();
    /// After bringing it into view.
    QPointF middleOfCurrentCell();
    bool toolTip(QWidget* part, const QHelpEvent& help);

    GridListener* mListener = nullptr;
    GridModel* mModel;
    QTableView* mView;
    GridCorner* mCorner;
    int mRow = 1;
    int mCol = 1;
    int mRowHeight = 0;
    Sample mSample;
    bool mStale = false;
    bool mRefreshing = false;
    bool mLabelWidthSet = false;
};

} // namespace platform::qt
