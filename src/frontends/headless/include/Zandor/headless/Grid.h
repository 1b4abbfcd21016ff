#pragma once

#include <Zandor/headless/Element.h>
#include <Zandor/headless/export.h>
#include <Zandor/platform/MSFlexGrid.h>

namespace zandor::platform::headless {

inline constexpr float gridRowHeight = 240;
inline constexpr float gridColWidth = 960;

/// A grid of one fixed row and one fixed column.
class ZANDOR_HEADLESS_EXPORT Grid final : public Placed<MSFlexGridLib::MSFlexGrid> {
public:
    Grid(Toolkit& toolkit, const Design& design, Element* container, std::int32_t rows,
         std::int32_t cols, MSFlexGridLib::GridEvents events);

    void Visible(bool value) override;
    void Font(const platform::Font& value) override;
    void SetFocus() override;
    std::int32_t Rows() const override;
    std::int32_t Cols() const override;
    std::int32_t TopRow() const override;
    std::int32_t LeftCol() const override;
    std::int32_t Row() const override;
    void Row(std::int32_t value) override;
    std::int32_t Col() const override;
    void Col(std::int32_t value) override;
    String Text() const override;
    void Text(const String& value) override;
    void CellAlignment(std::int16_t value) override;
    float CellLeft() const override;
    float CellTop() const override;
    float CellWidth() const override;
    float CellHeight() const override;
    void EnsureVisible() override;
    String TextMatrix(std::int32_t row, std::int32_t col) const override;
    void TextMatrix(std::int32_t row, std::int32_t col, const String& value) override;
    void CellNote(std::int32_t row, std::int32_t col, const String& value) override;
    float ColPos(std::int32_t col) const override;
    float RowPos(std::int32_t row) const override;
    float ColWidth(std::int32_t col) const override;
    void ColWidth(std::int32_t col, float value) override;
    void ColPosition(std::int32_t col, std::int32_t position) override;
    std::int32_t ColData(std::int32_t col) const override;
    void ColData(std::int32_t col, std::int32_t value) override;

    /// A cell as it is shown; error 381 outside the grid.
    struct Cell {
        String text;
        std::int16_t alignment = MSFlexGridLib::alignLeftCenter;
        String note;
    };
    const Cell& cell(std::int32_t row, std::int32_t col) const;
    Bounds cellBounds(std::int32_t row, std::int32_t col) const;
    Bounds currentCell() const { return cellBounds(mRow, mCol); }
    /// As the user leaves a column's border with the mouse.
    void resizeColumn(std::int32_t col, float width) { column(col).width = width; }
    /// Whether the cell has not been scrolled out of view to the top or the left.
    bool inView(std::int32_t row, std::int32_t col) const;
    /// As the user scrolls: the fixed cells stay, and the last cell is the furthest.
    void scrollTo(std::int32_t topRow, std::int32_t leftCol);

    const MSFlexGridLib::GridEvents events;

private:
    struct Column {
        float width = gridColWidth;
        std::int32_t data = 0;
        std::vector<Cell> cells;
    };

    bool isRow(std::int32_t row) const { return row >= 0 && row < mRows; }
    bool isCol(std::int32_t col) const { return col >= 0 && col < cols(); }
    std::int32_t cols() const { return static_cast<std::int32_t>(mColumns.size()); }
    const Column& column(std::int32_t col) const;
    Column& column(std::int32_t col);
    Cell& cellAt(std::int32_t row, std::int32_t col);
    float leftOf(std::int32_t col) const;
    float topOf(std::int32_t row) const;

    std::int32_t mRows;
    std::vector<Column> mColumns;
    std::int32_t mRow = 1;
    std::int32_t mCol = 1;
    std::int32_t mTopRow = 1;
    std::int32_t mLeftCol = 1;
};

} // namespace zandor::platform::headless
