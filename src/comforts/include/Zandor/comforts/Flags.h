#pragma once

namespace zandor::comforts {

/// Which comforts a host has switched on. All are off at first: the bare control does what its own
/// words say and no more.
struct Flags {
    bool AddsOnDoubleClick = false; ///< a double click on an entry makes it an output column

    /// What is typed or chosen in a cell's editor is kept however the editor is left, but for
    /// Escape; typing in a cell opens its editor, which stays over its cell when that moves; a list
    /// drops down with its editor, and a choice in it needs no "&Set".
    bool KeepsTyping = false;

    /// Entries whose columns come out in the rows are marked in their tables.
    bool MarksOutput = false;
    /// The first cell of a column offers all fields of all tables; a blank column's other cells
    /// open nothing.
    bool OffersFields = false;
    /// Columns are moved by dragging their field and by Alt and an arrow, where the model keeps an
    /// order.
    bool MovesColumns = false;
    /// Columns are as wide as what they hold, within limits, until somebody sets their width.
    bool FitsColumns = false;
    /// A line shows which table keeps all its rows and an operator other than "="; a sentence says
    /// it in full. A double click on a line opens its definition.
    bool ReadsJoins = false;

    /// A table's title opens the menu of its list; there the table can be renamed, by the host.
    bool HasTitleMenu = false;

    /// Canvas and grid are divided by a handle that the user moves.
    bool MovesPanes = false;

    /// A drag that goes on or ends without a join leaves the selection of the tables on its way as
    /// it was.
    bool KeepsSelectionUnderDrags = false;

    /// All of them on.
    static constexpr Flags all() {
        return {.AddsOnDoubleClick = true,
                .KeepsTyping = true,
                .MarksOutput = true,
                .OffersFields = true,
                .MovesColumns = true,
                .FitsColumns = true,
                .ReadsJoins = true,
                .HasTitleMenu = true,
                .MovesPanes = true,
                .KeepsSelectionUnderDrags = true};
    }

    friend bool operator==(const Flags&, const Flags&) = default;
};

} // namespace zandor::comforts
