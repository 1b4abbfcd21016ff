#include "InterfacePage.h"

#include <map>

namespace docs {

namespace {

const std::map<std::string_view, std::string_view> descriptions = {
    // The join dialog
    {"LNGJoinForm", "Caption of the join dialog."},
    {"LNGJoinLeftTable", "Label of the left table in the join dialog."},
    {"LNGJoinLeftColumn", "Label of the left column."},
    {"LNGJoinRightTable", "Label of the right table."},
    {"LNGJoinRightColumn", "Label of the right column."},
    {"LNGJoinType", "Label of the join types."},
    {"LNGJoinTypeNormal", "Entry for join type 0."},
    {"LNGJoinTypeLeftOuter", "Entry for join type 1."},
    {"LNGJoinTypeRightOuter", "Entry for join type 2."},
    {"LNGJoinTypeBothOuter", "Entry for join type 3."},
    {"LNGJoinOk", "Button that takes the changes over."},
    {"LNGJoinCancel", "Button that drops them."},
    // The context menu
    {"LNGMnuShowJoinDef", "Menu entry that opens the join dialog."},
    {"LNGMnuDelJoin", "Menu entry that deletes a join."},
    {"LNGMnuCopyCol", "Menu entry that copies the selected columns."},
    {"LNGMnuCreateJoin",
     "Menu entry that joins the first copied column to the one selected in the active table."},
    {"LNGMnuDelTable", "Menu entry that takes a table out of the query."},
    {"LNGMnuPasteCol", "Menu entry that makes output columns of the copied columns."},
    {"LNGMnuDelCol", "Menu entry that deletes an output column."},
    {"LNGMnuShowJoinDefVis", "Whether the entry that opens the join dialog is shown."},
    {"LNGMnuDelJoinVis", "Whether the entry that deletes a join is shown."},
    {"LNGMnuCopyColVis", "Whether the entry that copies columns is shown."},
    {"LNGMnuCreateJoinVis", "Whether the entry that creates a join is shown."},
    {"LNGMnuDelTableVis", "Whether the entry that deletes a table is shown."},
    {"LNGMnuPasteColVis", "Whether the entry that pastes columns is shown."},
    {"LNGMnuDelColVis", "Whether the entry that deletes an output column is shown."},
    {"LNGMnuSep1Vis", "Whether the separator below the join entries is shown."},
    {"LNGMnuSep2Vis", "Whether the separator below the table entries is shown."},
    // The grid
    {"LNGSpreadField", "Title of grid row 0."},
    {"LNGSpreadSynonym", "Title of grid row 1."},
    {"LNGSpreadSort", "Title of grid row 2."},
    {"LNGSpreadVisible", "Title of grid row 3."},
    {"LNGSpreadCriteria", "Title of grid row 4."},
    {"LNGSpreadOr", "Title of grid row 5."},
    // The canvas
    {"MXHorzFrameSize", "Width of the canvas in twips."},
    {"MXVertFrameSize", "Height of the canvas in twips."},
    {"DeletedTable", "Name of the table deleted last; read it when TableDeleted arrives."},
    // Property procedures
    {"DebugSwitch", "Nonzero shows a trace box at each milestone; set 0 for everyday use."},
    {"JoinModifyDisabled",
     "Nonzero lets the user change type and operator in the join dialog: the reverse of its name."},
    {"VisibleFrameLeft",
     "How far the canvas is scrolled to the left, in twips. A value past the end goes to the end."},
    {"VisibleFrameTop", "How far the canvas is scrolled up, in twips."},
    {"Zandor",
     "The query model, never nothing. In C++ its accessors are `P_GET_Zandor()` and "
     "`P_SET_Zandor(model)`. Setting it keeps grid columns of the model before; `ShowAnew()` "
     "(`showAnew()` of the widget) behind it takes them away, and is what to call after "
     "changing the model."},
    {"HorizMaxScrollPos", "End of the horizontal scroll range; the next layout overwrites it."},
    {"VertMaxScrollPos", "End of the vertical scroll range; the next layout overwrites it."},
    {"HorizontalScrollbarPos", "Horizontal scroll position; setting it scrolls the canvas."},
    {"VerticalScrollbarPos", "Vertical scroll position; setting it scrolls the canvas."},
    {"OnlyJoin",
     "True: the canvas alone. Setting False shows the grid with the row titles of the moment."},
    {"UseJoinTypeNormal", "Whether the join dialog offers join type 0."},
    {"UseJoinTypeLeft", "Whether it offers join type 1."},
    {"UseJoinTypeRight", "Whether it offers join type 2."},
    {"UseJoinTypeBoth", "Whether it offers join type 3."},
    {"UseJoinCompareOperatorEquals", "Whether it offers the operator `=`."},
    {"UseJoinCompareOperatorNotEquals", "Whether it offers `<>`."},
    {"UseJoinCompareOperatorLess", "Whether it offers `<`."},
    {"UseJoinCompareOperatorGreater", "Whether it offers `>`."},
    {"UseJoinCompareOperatorLessEquals", "Whether it offers `<=`."},
    {"UseJoinCompareOperatorGreaterEquals", "Whether it offers `>=`."},
    {"UseJoinCompareOperatorLE", "Another name of UseJoinCompareOperatorLessEquals."},
    {"UseJoinCompareOperatorGE", "Another name of UseJoinCompareOperatorGreaterEquals."},
    {"lastjoin", "Always nothing; the join concerned comes with the events."},
    {"activetable", "Always nothing."},
    {"ActiveColumn", "Always nothing."},
    // Methods
    {"Terminate", "Drops every table and replaces the model by an empty one."},
    {"SelectColumnNames",
     "Selects the columns of a name in every table of a name, and no others there."},
    {"SetCurrentTable", "Makes the first table of a name the current one."},
    // Events
    {"TableDeleted", "A table was taken out of the query; its name is in DeletedTable."},
    {"TableMoved", "The user moved a table."},
    {"Activate", "The user dropped columns or opened the context menu."},
    {"ColumnCreated", "An output column was added, once for each."},
    {"ColumnModified", "Sort order, visibility, synonym or a criterion of one was changed."},
    {"ColumnRemoved", "An output column was deleted from the context menu."},
    {"Error", "The host handed over nothing as its model."},
    {"JoinCreated", "The user joined two columns by dragging one onto the other."},
    {"JoinModified", "The user changed type or operator in the join dialog."},
    {"JoinRemoved", "The user deleted a join."},
};

} // namespace

std::string_view descriptionOf(std::string_view name) {
    const auto found = descriptions.find(name);
    return found == descriptions.end() ? std::string_view() : found->second;
}

std::size_t descriptionCount() { return descriptions.size(); }

} // namespace docs
