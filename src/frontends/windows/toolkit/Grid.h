#pragma once

#include "frontends/windows/toolkit/GridWindow.h"

namespace zandor::platform::windows {

/// The grid of the control over its window.
class Grid final : public Constituent<MSFlexGridLib::MSFlexGrid, GridWindow> {
public:
    using Constituent::Constituent;

    void Visible(bool value) override { mWindow->show(value); }
    void Font(const platform::Font& value) override { setFont(value); }
    void SetFocus() override;
    std::int32_t Rows() const override { return cells().rows(); }
    std::int32_t Cols() const override { return cells().cols(); }
    std::int32_t TopRow() const override { return mWindow->topRow(); }
    std::int32_t LeftCol() const override { return mWindow->leftCol(); }
    std::int32_t Row() const override { return mWindow->currentRow(); }
    void Row(std::int32_t value) override;
    std::int32_t Col() const override { return mWindow->currentCol(); }
    void Col(std::int32_t value) override;
    String Text() const override { return TextMatrix(Row(), Col()); }
    void Text(const String& value) override { TextMatrix(Row(), Col(), value); }
    void CellAlignment(std::int16_t value) override;
    float CellLeft() const override { return current().Left; }
    float CellTop() const override { return current().Top; }
    float CellWidth() const override { return current().Width; }
    float CellHeight() const override { return current().Height; }
    void EnsureVisible() override { mWindow->showCurrent(); }
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

private:
    GridCells& cells() { return mWindow->cells(); }
    const GridCells& cells() const { return mWindow->cells(); }
    Bounds current() const;
    void mustBeRow(std::int32_t row) const;
    void mustBeCol(std::int32_t col) const;
    void mustBeCell(std::int32_t row, std::int32_t col) const;
};

} // namespace zandor::platform::windows
