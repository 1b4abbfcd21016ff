#pragma once

#include <Zandor/platform/Intrinsic.h>
#include <Zandor/platform/export.h>

/// The grid of output columns. Rows and columns count from 0, sizes and positions are twips in
/// the grid's own coordinates.
namespace MSFlexGridLib {

namespace platform = zandor::platform;

using platform::String;

inline constexpr std::int16_t alignLeftCenter = 1;   ///< of a cell's text
inline constexpr std::int16_t alignCenterCenter = 4; ///< of a cell's text

/// A row outside the grid is error 30009, a column error 30010; TextMatrix answers either with
/// error 381. A refused call changes nothing.
class ZANDOR_CONTROL_EXPORT MSFlexGrid : public platform::Control {
public:
    virtual void Visible(bool value) = 0;               ///< whether it is shown
    virtual void Font(const platform::Font& value) = 0; ///< of all its cells
    virtual void SetFocus() = 0; ///< error 5 when the grid cannot take the focus now

    virtual std::int32_t Rows() const = 0;    ///< as it was made
    virtual std::int32_t Cols() const = 0;    ///< as it was made
    virtual std::int32_t TopRow() const = 0;  ///< the first below the titles that is in view
    virtual std::int32_t LeftCol() const = 0; ///< the first behind the titles that is in view

    /// The current cell.
    virtual std::int32_t Row() const = 0;
    virtual void Row(std::int32_t value) = 0;
    /// The current cell's column.
    virtual std::int32_t Col() const = 0;
    virtual void Col(std::int32_t value) = 0;
    /// Of the current cell.
    virtual String Text() const = 0;
    virtual void Text(const String& value) = 0;
    virtual void CellAlignment(std::int16_t value) = 0; ///< of the current cell
    virtual float CellLeft() const = 0;                 ///< of the current cell
    virtual float CellTop() const = 0;                  ///< of the current cell
    virtual float CellWidth() const = 0;                ///< of the current cell
    virtual float CellHeight() const = 0;               ///< of the current cell
    /// Scrolls as little as brings the current cell into view.
    virtual void EnsureVisible() = 0;

    /// The text of any cell.
    virtual String TextMatrix(std::int32_t row, std::int32_t col) const = 0;
    virtual void TextMatrix(std::int32_t row, std::int32_t col, const String& value) = 0;
    /// What there is to say about a cell, which is marked then; empty: nothing. It goes with the
    /// cell's column.
    virtual void CellNote(std::int32_t row, std::int32_t col, const String& value) = 0;
    /// Of its left edge; negative left of the view.
    virtual float ColPos(std::int32_t col) const = 0;
    /// Of its upper edge; negative above the view.
    virtual float RowPos(std::int32_t row) const = 0;
    /// Of a column.
    virtual float ColWidth(std::int32_t col) const = 0;
    virtual void ColWidth(std::int32_t col, float value) = 0;
    /// Moves a column with its texts, alignments, width and data to another position.
    virtual void ColPosition(std::int32_t col, std::int32_t position) = 0;
    /// A number that a column bears, 0 at first.
    virtual std::int32_t ColData(std::int32_t col) const = 0;
    virtual void ColData(std::int32_t col, std::int32_t value) = 0;
};

/// What a grid tells.
struct GridEvents {
    platform::MouseEvent MouseDown; ///< anywhere in the grid
    platform::MouseEvent MouseUp;   ///< anywhere in the grid
    /// A drag of a table list ends here.
    std::function<void(platform::Control* Source, float X, float Y)> DragDrop;
    platform::PlainEvent Scroll; ///< the view has moved
};

} // namespace MSFlexGridLib
