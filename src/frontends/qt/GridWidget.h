#pragma once

#include "frontends/qt/FieldGestures.h"

#include <Zandor/platform/Words.h>

#include <QTableView>

#include <functional>
#include <memory>
#include <optional>

class QInputMethodEvent;
class QInputMethodQueryEvent;

namespace zandor::platform::qt {

class FieldTitles;
class GridCorner;
class GridHeader;
class GridModel;
class PaneHandle;

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
    /// An input method composes or gives a text for the current cell. False when that means
    /// nothing.
    virtual bool composed(QInputMethodEvent& event) = 0;
    /// Answers what an input method asks.
    virtual void asked(QInputMethodQueryEvent& query) = 0;
    /// What shows the text being composed, and has the keys meanwhile; nullptr without one.
    virtual QWidget* composer() const = 0;
    /// The focus has left the cells.
    virtual void left() = 0;
    /// A key asks for the current cell's editor. False when a press on the cell is to open it.
    virtual bool editKey() = 0;
    /// Whether fields can be chosen, so that they are cells to walk to as the others.
    virtual bool offersFields() const = 0;
    /// A click with the left button on a column's field that was no drag.
    virtual void fieldClicked(int col) = 0;
    virtual bool columnMovable(int col) = 0;
    virtual void columnMoved(int col, int position) = 0;
    /// A key moves the current column by some places. False when it means nothing.
    virtual bool moveKey(int step) = 0;
    /// The user has given a column another width.
    virtual void borderDragged(int col) = 0;
    virtual void borderDoubleClicked(int col) = 0;
    virtual bool dragAccepted(const QMimeData* data) = 0;
    virtual bool dropped(const QMimeData* data, QPointF at) = 0;
};

/// The grid of output columns: a table view whose headers are the fixed row and column. It is made
/// when the grid is first shown, or asked for a place, for many hosts have the canvas alone. It
/// follows the model's data, widths and current cell when the events at hand have been dealt with,
/// or at once by `bringUpToDate`.
class GridWidget : public QWidget {
public:
    GridWidget(int rows, int cols, QWidget* parent);

    void setListener(GridListener* listener);
    void setWords(const Words& words);
    GridModel& model() const { return *mModel; }
    QTableView& view() const;
    /// The window around may be in the middle of its own destruction: a view that is asked for from
    /// now on is none of its widgets.
    void end() { mEnding = true; }
    /// Stands above the cells while it is shown.
    PaneHandle& handle() const { return *mHandle; }
    void showHandle(bool shown);
    /// The cell being composed in has what was committed, or what it had.
    void breakOffComposing() {
        if (mListener) mListener->left();
    }

    /// The model has changed.
    void touch();
    /// The model's current cell has changed; rows and columns count the fixed ones.
    void setCurrentCell(int row, int col);
    int currentRow() const { return mRow; }
    int currentCol() const { return mCol; }
    /// What the first blank column says where fields can be chosen.
    const QString& offer() const { return mOffer; }
    /// That column; 0 where they cannot.
    int offeredColumn() const;
    /// Tables may have come or gone, on which it depends whether there is anything to offer.
    void offerAnew();

    void bringUpToDate() const;
    /// Scrolls as little as brings the current cell into view.
    void showCurrentCell();
    int firstRow() const;
    int firstCol() const;
    int columnWidth(int col) const;
    int rowHeight() const { return view(), mRowHeight; }
    /// The width that a text takes in a column, without the margins of every column.
    qreal textWidth(const QString& text) const;
    /// The rectangle of a cell in the grid's own coordinates, in logical pixels.
    QRect cellRect(int row, int col) const;
    void setLabelWidth(float twips);

    void setVisible(bool visible) override;
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

    void makeView();
    /// As it is not there, a view that looks otherwise than the grid takes it for.
    void makeViewIfNeeded();
    GridHeader& fields() const;
    GridHeader& titles() const;
    void arrange();
    void measure();
    /// Columns keep the share of their texts that they show.
    void fitColumnsToFont();
    void refresh();
    void fitLabels();
    bool mouse(QWidget* part, QMouseEvent* event);
    bool keyPressed(QKeyEvent& event);
    bool walkFields(const QKeyEvent& event);
    void walkTo(int row, int col);
    void openMenu();
    /// After bringing it into view.
    QPointF middleOfCurrentCell();
    bool toolTip(QWidget* part, const QHelpEvent& help);

    GridListener* mListener = nullptr;
    GridModel* mModel;
    QTableView* mView = nullptr;
    std::unique_ptr<QTableView> mViewAtTheEnd;
    bool mEnding = false;
    FieldTitles* mTitles = nullptr;
    std::optional<FieldGestures> mGestures;
    GridCorner* mCorner = nullptr;
    PaneHandle* mHandle;
    int mRow = 1;
    int mCol = 1;
    int mRowHeight = 0;
    QString mOffer;
    QString mName; ///< as it is spoken
    Sample mSample;
    int mResized = 0; ///< the column whose border the mouse drags
    int mOffered = 0; ///< as it was painted, as far as is known
    bool mStale = false;
    bool mRefreshing = false;
    bool mLabelWidthSet = false;
};

} // namespace zandor::platform::qt
