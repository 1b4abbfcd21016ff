#pragma once

#include "frontends/windows/toolkit/Constituent.h"
#include "frontends/windows/toolkit/FieldGestures.h"
#include "frontends/windows/toolkit/GridCells.h"
#include "frontends/windows/toolkit/ScrollRange.h"

namespace zandor::platform::windows {

/// The grid of output columns as a window: fixed titles, cells that scroll by whole rows and
/// columns, and a current cell.
class GridWindow final : public Window, public DropTarget {
public:
    GridWindow(std::shared_ptr<Surroundings> surroundings, HWND parent, std::int32_t rows,
               std::int32_t cols, MSFlexGridLib::GridEvents events);
    ~GridWindow() override;

    GridCells& cells() { return mCells; }
    const GridCells& cells() const { return mCells; }
    /// What the cells hold has changed.
    void touch() {
        mLabelStale = true;
        repaint();
    }
    /// Columns have moved or changed their width.
    void widthsChanged();

    std::int32_t currentRow() const { return mRow; }
    std::int32_t currentCol() const { return mCol; }
    void setCurrent(std::int32_t row, std::int32_t col);
    /// Scrolls as little as brings the current cell into view.
    void showCurrent();
    /// As keys do.
    void walkTo(std::int32_t row, std::int32_t col);
    /// For the keyboard, what a click on the current cell is for the mouse.
    void openEditor();
    /// The current cell as it is spoken, without its text.
    String titleOfCurrent() const;
    std::int32_t topRow() const { return mTopRow; }
    std::int32_t leftCol() const { return mLeftCol; }
    /// As far as there is anything to see.
    void scrollTo(std::int32_t topRow, std::int32_t leftCol);

    int rowHeight() const { return mRowHeight; }
    int columnWidth(std::int32_t col) const;
    /// As it was set, in twips; of the labels as they need.
    float widthInTwips(std::int32_t col) const;
    /// In pixels, of the grid with its titles.
    RECT cellPlace(std::int32_t row, std::int32_t col) const;
    /// Both 0: the corner; -1: beside all cells.
    std::pair<std::int32_t, std::int32_t> cellAt(POINT at) const;
    /// The label column as wide as its texts, until a width is set.
    void setLabelWidth(float twips);
    /// The column that offers a field to choose; 0: none.
    std::int32_t offeredColumn() const;
    /// The gap between columns that a dragged one would go to, 0: none.
    void showGap(std::int32_t column);
    /// The user has given a column another width.
    void resizeColumn(std::int32_t col, int pixels);

    bool draggedOver(POINT at, DragState state) override;
    void dropped(POINT at) override;
    bool scrollUnderDrag(POINT at) override;

protected:
    LRESULT handle(const Message& message) override;
    void forget() override;
    void fontChanged() override;

private:
    void paint(const Message& message);
    void paintCell(HDC dc, std::int32_t row, std::int32_t col) const;
    int marginIn(const RECT& place, const String& text) const;
    String shownText(std::int32_t row, const String& text, int room) const;
    void showRanges();
    void scrolledByBar(const Message& message);
    void press(const Message& message);
    void release(const Message& message);
    void tell(const platform::MouseEvent& event, std::int16_t button, std::int16_t shift,
              POINT at) const;
    bool keyPressed(const Message& message);
    bool walk(WPARAM key);
    bool typed(char16_t unit);
    void clickWithRightButton();
    POINT middleOfCurrent();
    void openMenu();
    void hint(POINT at) const;
    std::int32_t lastLeft() const;
    std::int32_t lastTop() const;
    int rowsInView() const;
    float labelWidth() const;
    /// Whether fields can be chosen, so that they are cells to walk to as the others.
    bool offersFields() const;

    GridCells mCells;
    MSFlexGridLib::GridEvents mEvents;
    FieldGestures mGestures{*this};
    std::int32_t mRow = 1;
    std::int32_t mCol = 1;
    std::int32_t mTopRow = 1;
    std::int32_t mLeftCol = 1;
    ScrollRange mAcross, mDown;
    std::int32_t mGap = 0;
    int mRowHeight = 0;
    bool mLabelWidthSet = false;
    mutable bool mLabelStale = true; ///< its texts have changed since it was measured
    mutable int mLabels = 0;         ///< as wide as its texts, in pixels
    String mTyped;                   ///< the first half of a letter in two
};

} // namespace zandor::platform::windows
