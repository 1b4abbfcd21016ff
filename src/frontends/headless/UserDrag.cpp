#include <Zandor/headless/User.h>

#include <utility>

namespace zandor::platform::headless {

namespace {

constexpr std::int16_t ctrl = 2;

// The states of a drag over a target.
constexpr std::int16_t enter = 0;
constexpr std::int16_t leave = 1;
constexpr std::int16_t over = 2;

TalvikTabulet::Point placeOf(const Tabulet& table, std::int32_t entry) {
    if (entry == 0) return table.emptyPlace();
    return {table.placement().Width / 2, table.rowMiddle(entry)};
}

/// True when that changes anything.
bool selectOnly(const Tabulet& table, std::int32_t chosen) {
    bool changed = false;
    for (std::size_t i = 1; i <= table.entries().size(); ++i) {
        const auto position = static_cast<std::int32_t>(i);
        ColumnItem& entry = table.entry(position);
        changed = changed || entry.selected() != (position == chosen);
        entry.select(position == chosen);
    }
    return changed;
}

void tellOfSelection(const Tabulet& table) {
    if (table.events.SelectionChanged) table.events.SelectionChanged(table.index);
}

} // namespace

Tabulet& User::reachEntry(const std::string& name, std::int32_t entry) const {
    auto& table = reach<Tabulet>(name);
    if (entry == 0) {
        table.emptyPlace();
        return table;
    }
    table.entry(entry);
    if (!table.inView(entry))
        throw std::logic_error("the entry of " + name + " is scrolled out of view");
    return table;
}

void User::pressEntry(const std::string& name, std::int32_t entry, std::int16_t button,
                      std::int16_t shift) {
    if (auto& table = reachEntry(name, entry); table.usable()) table.takeFocus();
    auto& table = reachEntry(name, entry);
    mDragTarget.clear();
    mPress = {name, entry, entry != 0 && table.entry(entry).selected()};
    if (entry == 0) {
        if (button == leftButton && !(shift & ctrl) && selectOnly(table, 0)) tellOfSelection(table);
        return;
    }
    if (shift & ctrl)
        table.entry(entry).select(!mPress.selected);
    else if (!mPress.selected)
        selectOnly(table, entry);
    const auto told = table.entries()[std::size_t(entry) - 1];
    if (table.events.ColumnMouseDown)
        table.events.ColumnMouseDown(table.index, told, button, shift);
}

void User::moveOverEntry(const std::string& name, std::int32_t entry, std::int16_t button,
                         std::int16_t shift) {
    auto& table = reachEntry(name, entry);
    const std::int32_t told = mPress.table == name ? mPress.entry : entry;
    if (told < 1 || std::size_t(told) > table.entries().size()) return;
    const auto item = table.entries()[std::size_t(told) - 1];
    if (table.events.ColumnMouseMove)
        table.events.ColumnMouseMove(table.index, item, button, shift);
}

void User::releaseEntry(const std::string& name, std::int32_t entry, std::int16_t button,
                        std::int16_t shift) {
    auto* table = &reachEntry(name, entry);
    const Press press = std::exchange(mPress, {});
    if (mToolkit.dragged()) {
        const TalvikTabulet::Point at = placeOf(*table, entry);
        dropOn(name, at.X, at.Y);
        return;
    }
    if (entry == 0) return;
    const bool again = press.selected && press.table == name && press.entry == entry;
    if (button == leftButton && again && !(shift & ctrl) && selectOnly(*table, entry)) {
        tellOfSelection(*table);
        // Whoever was told may have taken the table away.
        if (!mToolkit.exists(name)) return;
        table = &mToolkit.find<Tabulet>(name);
        if (std::size_t(entry) > table->entries().size()) return;
    }
    const auto told = table->entries()[std::size_t(entry) - 1];
    if (table->events.ColumnMouseUp) table->events.ColumnMouseUp(table->index, told, button, shift);
}

void User::doubleClickEntry(const std::string& name, std::int32_t entry) {
    pressEntry(name, entry, leftButton);
    releaseEntry(name, entry, leftButton);
    pressEntry(name, entry, leftButton);
    releaseEntry(name, entry, leftButton);
    if (mToolkit.exists(name))
        mToolkit.comforts.entryDoubleClicked(reachEntry(name, entry).index, entry);
}

void User::leaveDragTarget() {
    const std::string left = std::exchange(mDragTarget, {});
    if (left.empty() || !mToolkit.exists(left)) return;
    auto& table = mToolkit.find<Tabulet>(left);
    if (table.events.DragOver)
        table.events.DragOver(table.index, mToolkit.dragged(), mDragPoint.X, mDragPoint.Y, leave);
    mToolkit.comforts.dragGone();
}

void User::dragOver(const std::string& name, float X, float Y) {
    auto& table = reach<Tabulet>(name);
    if (!mToolkit.dragged()) return;
    const bool entering = mDragTarget != name;
    if (entering) leaveDragTarget();
    mDragTarget = name;
    mDragPoint = {X, Y};
    if (entering) mToolkit.comforts.dragCame(table.index);
    if (table.events.DragOver)
        table.events.DragOver(table.index, mToolkit.dragged(), X, Y, entering ? enter : over);
}

void User::dropOn(const std::string& target, float X, float Y) {
    auto& element = reach<Element>(target);
    if (!mToolkit.dragged()) return;
    const bool onTable = dynamic_cast<Tabulet*>(&element) != nullptr;
    if (onTable)
        dragOver(target, X, Y);
    else
        leaveDragTarget();
    mDragTarget.clear();
    Tabulet* const source = mToolkit.dragged();
    mToolkit.endDragOf(source);
    if (!source) return;
    if (onTable) {
        auto& table = reach<Tabulet>(target);
        const auto entry = table.ColumnAt(X, Y);
        const bool taken = entry && entry->Text() != u"*" && &table != source;
        if (table.events.DragDrop) table.events.DragDrop(table.index, source, X, Y);
        taken ? mToolkit.comforts.dragTaken() : mToolkit.comforts.dragGone();
    } else if (auto* grid = dynamic_cast<Grid*>(&reach<Element>(target));
               grid && grid->events.DragDrop) {
        grid->events.DragDrop(source, X, Y);
    }
}

void User::dropNowhere() {
    if (!mToolkit.dragged()) return;
    leaveDragTarget();
    mToolkit.endDragOf(mToolkit.dragged());
}

bool User::beginDragFrom(const std::string& table, std::int32_t entry) {
    pressEntry(table, entry, leftButton);
    moveOverEntry(table, entry, leftButton);
    if (!mToolkit.dragged()) {
        releaseEntry(table, entry, leftButton);
        return false;
    }
    const TalvikTabulet::Point start = placeOf(mToolkit.find<Tabulet>(table), entry);
    dragOver(table, start.X, start.Y);
    return true;
}

void User::dragAcross(const std::string& from, std::int32_t entry, const std::string& across,
                      std::int32_t passed, const std::string& grid, std::int32_t row,
                      std::int32_t col) {
    if (!beginDragFrom(from, entry)) return;
    const TalvikTabulet::Point on = placeOf(reachEntry(across, passed), passed);
    dragOver(across, on.X, on.Y);
    beforeRelease();
    const Bounds at = reachCell(grid, row, col);
    dropOn(grid, at.Left + at.Width / 2, at.Top + at.Height / 2);
}

void User::dragToEntry(const std::string& from, std::int32_t entry, const std::string& to,
                       std::int32_t target) {
    const auto& table = target == 0 ? reach<Tabulet>(to) : reachEntry(to, target);
    placeOf(table, target);
    if (!beginDragFrom(from, entry)) return;
    const TalvikTabulet::Point at = placeOf(mToolkit.find<Tabulet>(to), target);
    dragOver(to, at.X, at.Y);
    beforeRelease();
    dropOn(to, at.X, at.Y);
}

void User::dragToCell(const std::string& from, std::int32_t entry, const std::string& grid,
                      std::int32_t row, std::int32_t col) {
    reachCell(grid, row, col);
    if (!beginDragFrom(from, entry)) return;
    beforeRelease();
    const Bounds at = reachCell(grid, row, col);
    dropOn(grid, at.Left + at.Width / 2, at.Top + at.Height / 2);
}

} // namespace zandor::platform::headless
