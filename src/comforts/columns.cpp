#include "comforts/Door.h"

#include <Zandor/comforts/Comforts.h>
#include <Zandor/platform/Numbers.h>

#include <algorithm>

// The order and the widths of the grid's columns.

namespace zandor::comforts {

namespace {

constexpr float narrowest = 1200; // twips; below it "Descending" would be cut
constexpr float widest = 4500;
constexpr float besideText = 300; // the margins of a cell
// A border that somebody drags stays within reach.
constexpr float narrowestByHand = 300;
constexpr auto widestByHand = static_cast<float>(TalvikZandorLib::SizedDefinition::greatestWidth);

} // namespace

bool Comforts::columnMovable(std::int32_t column) {
    if (!mFlags.MovesColumns || column < 1) return false;
    return act(u"columnMovable", [&](Door& door) {
        return !door.isReadOnly() && door.keepsOrder() && door.definitionOf(column);
    });
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
        const float kept = std::clamp(width, narrowestByHand, widestByHand);
        if (door.isUsed(column)) resize(door, column, platform::toLong(kept));
        return true;
    });
}

bool Comforts::borderDoubleClicked(std::int32_t column) {
    if (!mFlags.FitsColumns) return false;
    return act(u"borderDoubleClicked", [&](Door& door) {
        if (door.isUsed(column))
            resize(door, column, 0);
        else
            door.setWidth(column, fitting(door, column));
        return true;
    });
}

/// Gives a column a width, 0 for that of what it holds, and has it kept.
void Comforts::resize(Door& door, std::int32_t column, std::int32_t width) {
    const std::int32_t number = door.grid().ColData(column);
    // As it was, should the model refuse.
    fit(door, column);
    const auto model = door.model();
    const auto changed =
        door.isReadOnly() ? decltype(door.definitionOf(column))() : door.storeWidth(column, width);
    TalvikDBxZandor::require(door.model() == model);
    keep(number, width);
    if (const std::int32_t now = door.columnWith(number, column); now > 0) fit(door, now);
    if (changed) door.tellModified(changed);
}

void Comforts::keep(std::int32_t keyNumber, std::int32_t width) {
    if (width > 0)
        mWidths[keyNumber] = std::min(static_cast<float>(width), widestByHand);
    else
        mWidths.erase(keyNumber);
}

/// Where definitions keep the widths of their columns, theirs are those that hold.
void Comforts::readWidths(Door& door) {
    for (std::int32_t column = door.lastColumn(); column > 0; --column) {
        const std::int32_t number = door.grid().ColData(column);
        const auto width = door.storedWidth(column);
        TalvikDBxZandor::require(door.grid().ColData(column) == number);
        if (width) keep(number, *width);
    }
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

} // namespace zandor::comforts
