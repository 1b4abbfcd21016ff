#include "comforts/Door.h"

#include <Zandor/comforts/Comforts.h>

#include <algorithm>

// The fields that a column's first cell offers.

namespace zandor::comforts {

bool Comforts::gridPressed(std::int16_t button, float X, float Y) {
    if (!mFlags.OffersFields || button != platform::leftButton) return false;
    return act(u"gridPressed", [&](Door& door) {
        std::int32_t column = 0;
        std::int32_t row = 0;
        TalvikDBxZandor::basZandor::SpreadHitTest(mToolkit, column, row, door.grid(), X, Y);
        // What is filled is the control's.
        if (column == 0 || row == row::field || door.isUsed(column)) return false;
        door.closeEditors();
        if (door.isOpen()) door.goTo(row, column);
        return true;
    });
}

bool Comforts::hasFieldsToOffer() const {
    return mFlags.OffersFields && mDoor && mDoor->isOpen() && mDoor->hasTables();
}

bool Comforts::fieldClicked(std::int32_t column) {
    if (!mFlags.OffersFields) return false;
    return act(u"fieldClicked",
               [&](Door& door) { return column > 0 && offerFields(door, column, {}); });
}

bool Comforts::cellOpened() {
    if (!mFlags.OffersFields) return false;
    return act(u"cellOpened", [&](Door& door) {
        const std::int32_t column = door.grid().Col();
        if (column == 0) return false;
        if (door.grid().Row() == row::field) return offerFields(door, column, {});
        return !door.isUsed(column);
    });
}

/// Drops the list of all fields down over a column's first cell.
bool Comforts::offerFields(Door& door, std::int32_t column, const String& typed) {
    door.closeEditors();
    if (!door.isOpen() || door.isReadOnly()) return true;
    auto fields = door.fields();
    // A column that has a field and no definition cannot be given another.
    if (fields.empty() || (door.isUsed(column) && !door.definitionOf(column))) return true;
    door.goTo(row::field, column);
    door.showCurrentCell();

    std::vector<String> names;
    names.reserve(fields.size());
    for (const Field& field : fields) names.push_back(field.name);
    const auto& grid = door.grid();
    const auto at = std::find(names.begin(), names.end(), grid.TextMatrix(row::field, column));
    const auto position = at == names.end() ? -1 : static_cast<std::int32_t>(at - names.begin());
    mOffer = Offer{door.model(), column, grid.ColData(column), std::move(fields)};
    if (!mFields)
        mFields = mToolkit.makePickList({.Name = u"lstFields"},
                                        {.Picked = [this](auto at) { fieldPicked(at); }});
    mFields->Open({grid.Left() + grid.CellLeft(), grid.Top() + grid.CellTop(), grid.CellWidth(),
                   grid.CellHeight()},
                  names, typed, position);
    return true;
}

/// A blank column becomes one of that field, as a drop there would make it; behind the last column
/// no gap is left. A column that is filled gets the field in place of its own.
void Comforts::fieldPicked(std::int32_t position) {
    const auto offer = std::exchange(mOffer, std::nullopt);
    if (!offer || position < 0 || position >= static_cast<std::int32_t>(offer->fields.size()))
        return;
    act(u"fieldPicked", [&](Door& door) {
        const Field& field = offer->fields[static_cast<std::size_t>(position)];
        // Whatever happened while the list stood open.
        if (door.model() != offer->model || !door.has(field)) return true;
        std::int32_t column = 0;
        if (offer->keyNumber != 0) {
            column = door.columnWith(offer->keyNumber, offer->column);
            if (column == 0) return true;
            door.changeField(column, field);
        } else {
            column = std::min(offer->column, door.lastColumn() + 1);
            if (column >= door.grid().Cols()) return true;
            door.drop(field.table, field.entry, column);
        }
        if (!door.isOpen()) return true;
        door.goTo(row::field, column);
        door.showCurrentCell();
        if (door.isOpen()) door.focusGrid();
        return true;
    });
}

} // namespace zandor::comforts
