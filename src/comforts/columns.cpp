#include "comforts/Comforts.h"
#include "comforts/Door.h"

#include <algorithm>

// The order and the widths of the grid's columns.

namespace comforts {

namespace {

constexpr float narrowest = 1200; // twips; below it "Descending" would be cut
constexpr float widest = 4500;
constexpr float besideText = 300; // the margins of a cell

} // namespace

bool Comforts::columnMovable(std::int32_t column) {
    if (!mFlags.MovesColumns || column < 1) return false;
    return act(u"columnMovable",
               [&](Door& door) { return door.keepsOrder() && door.definitionOf(column); });
}

bool Comforts::columnMoved(std::int32_t column, std::int32_t position) {
    if (!columnMovable(column)) return false;
    return act(u"columnMoved", [&](Door& door) {
        door.closeEditors();
        return door.isOpen() ? door.moveColumn(column, position) : true;
    });
}

bool Comforts::currentColumnMoved(std::int32_t step) {
    if (!mFlags.MovesColumns) return false;
    return act(u"currentColumnMoved", [&](Door& door) {
        const std::int32_t column = door.grid().Col();
        const std::int32_t to = column + step;
        // At either end there is nowhere to go, and nothing else that the key should do.
        if (to >= 1 && to <= door.lastColumn()) columnMoved(column, to);
        if (door.isOpen()) door.showCurrentCell();
        return true;
    });
}

bool Comforts::borderDragged(std::int32_t column, float width) {
    if (!mFlags.FitsColumns) return false;
    return act(u"borderDragged", [&](Door& door) {
        if (door.isUsed(column)) mWidths[door.grid().ColData(column)] = width;
        return true;
    });
}

bool Comforts::borderDoubleClicked(std::int32_t column) {
    if (!mFlags.FitsColumns) return false;
    return act(u"borderDoubleClicked", [&](Door& door) {
        mWidths.erase(door.grid().ColData(column));
        door.setWidth(column, fitting(door, column));
        return true;
    });
}

/// As wide as its widest text, within limits.
float Comforts::fitting(Door& door, std::int32_t column) const {
    float width = 0;
    for (std::int32_t row = 0; row < door.grid().Rows(); ++row)
        if (const String text = door.grid().TextMatrix(row, column); !text.empty())
            width = std::max(width, mToolkit.TextWidth(text));
    return std::clamp(width + besideText, narrowest, widest);
}

/// A column as wide as somebody has made it, or else as what it holds needs.
void Comforts::fit(Door& door, std::int32_t column) {
    if (!mFlags.FitsColumns || !door.isUsed(column)) return;
    const auto kept = mWidths.find(door.grid().ColData(column));
    door.setWidth(column, kept == mWidths.end() ? fitting(door, column) : kept->second);
}

void Comforts::fitAll(Door& door) {
    if (!mFlags.FitsColumns) return;
    for (std::int32_t column = door.lastColumn(); column > 0; --column) fit(door, column);
}

} // namespace comforts
