#include "frontends/windows/toolkit/Navigation.h"

#include "frontends/windows/toolkit/CanvasItems.h"
#include "frontends/windows/toolkit/ControlWindow.h"
#include "frontends/windows/toolkit/Frames.h"
#include "frontends/windows/toolkit/Grid.h"
#include "frontends/windows/toolkit/TableWindow.h"
#include "frontends/windows/toolkit/partsIn.h"

#include <algorithm>

namespace zandor::platform::windows {

namespace {

bool holds(HWND outer, HWND inner) {
    return outer && inner && (outer == inner || IsChild(outer, inner));
}

} // namespace

HWND Navigation::focused() const {
    const HWND focus = GetFocus();
    return mSurroundings.holds(focus) ? focus : nullptr;
}

std::vector<Navigation::Stop> Navigation::stops() const {
    std::vector<Stop> all;
    if (Canvas* const canvas = mSurroundings.canvas; canvas && canvas->isShown()) {
        for (TableWindow* table : canvas->tables()) all.push_back({table->shared_from_this()});
        const auto lines = canvas->lines();
        for (CanvasLine* line : lines) all.push_back({canvas->shared_from_this(), line});
        if (lines.empty()) all.push_back({canvas->shared_from_this()});
    }
    if (mSurroundings.grid && mSurroundings.grid->isShown())
        all.push_back({mSurroundings.grid->shared_from_this()});
    if (Window* const home = mSurroundings.home; home && home->isShown() && home->isEnabled())
        all.push_back({home->shared_from_this()});
    return all;
}

bool Navigation::goOn(bool next) {
    if (const RowWindow* const editor = editorAround(focused())) return goOnInEditor(*editor, next);
    const auto all = stops();
    const Canvas* const canvas = mSurroundings.canvas;
    HWND at = focused();
    if (const auto from = mSentOnFrom.lock(); from && at && at == mSentOnTo) at = from->hwnd();
    const auto here = std::ranges::find_if(all, [&](const Stop& stop) {
        if (stop.window.get() == canvas)
            return at == stop.window->hwnd() && stop.line == canvas->currentLine();
        return holds(stop.window->hwnd(), at);
    });
    // Where the focus is at no stop, as on the canvas beside its lines, the next is the first.
    std::ptrdiff_t to = here == all.end() ? (next ? 0 : -1) : here - all.begin() + (next ? 1 : -1);
    if (here == all.end() && canvas && at == canvas->hwnd()) {
        const auto first = std::ranges::find_if(
            all, [canvas](const Stop& stop) { return stop.window.get() == canvas; });
        to = first - all.begin() + (next ? 0 : -1);
    }
    if (to < 0 || to >= static_cast<std::ptrdiff_t>(all.size())) return leave(next);
    go(all[static_cast<std::size_t>(to)]);
    return true;
}

void Navigation::enter(bool next) {
    const auto all = stops();
    if (!all.empty()) go(next ? all.front() : all.back());
}

void Navigation::go(const Stop& stop) {
    mSentOnFrom.reset();
    mSentOnTo = nullptr;
    if (stop.window.get() == mSurroundings.canvas) return mSurroundings.canvas->focusOn(stop.line);
    HWND wanted = stop.window->hwnd();
    if (auto* const table = dynamic_cast<TableWindow*>(stop.window.get())) {
        table->raise();
        mSurroundings.reveal(table->placeInParent());
        wanted = table->list().hwnd();
    }
    SetFocus(wanted);
    if (!stop.window->isAlive() || holds(stop.window->hwnd(), focused())) return;
    mSentOnFrom = stop.window;
    mSentOnTo = focused();
}

/// An open editor is a world of its own: Enter and Escape lead out of it.
bool Navigation::goOnInEditor(const RowWindow& editor, bool next) const {
    std::vector<HWND> parts;
    for (const auto& part : partsIn(editor.hwnd()))
        if (part->isEnabled() && IsWindowVisible(part->hwnd()) &&
            !dynamic_cast<const RowWindow*>(part.get()))
            parts.push_back(part->hwnd());
    // The system has what was made last first.
    std::ranges::reverse(parts);
    const auto here = std::ranges::find(parts, focused());
    if (here == parts.end()) return false;
    const std::size_t at = static_cast<std::size_t>(here - parts.begin());
    SetFocus(parts[(at + (next ? 1 : parts.size() - 1)) % parts.size()]);
    return true;
}

bool Navigation::leave(bool next) {
    auto* const surface = dynamic_cast<ControlWindow*>(mSurroundings.surface);
    if (!surface) return false;
    const auto leave = surface->onLeave;
    if (leave && leave(next)) return true;
    const HWND root = GetAncestor(surface->hwnd(), GA_ROOT);
    const HWND to = leave ? nullptr : GetNextDlgTabItem(root, surface->hwnd(), !next);
    if (to && !mSurroundings.holds(to)) return SetFocus(to), true;
    // The control is alone in its window.
    enter(next);
    return true;
}

bool Navigation::changePane() {
    Canvas* const canvas = mSurroundings.canvas;
    GridWindow* const grid = mSurroundings.grid;
    const HWND at = focused();
    if (!canvas || !grid || !grid->isShown()) return false;
    if (!holds(grid->hwnd(), at) && !editorAround(at)) {
        mLastTable.reset();
        for (TableWindow* table : canvas->tables())
            if (holds(table->hwnd(), at)) mLastTable = table->weak_from_this();
        go({grid->shared_from_this()});
        return true;
    }
    const auto last = mLastTable.lock();
    if (canvas->currentLine() && !last) {
        go({canvas->shared_from_this(), canvas->currentLine()});
        return true;
    }
    const auto tables = canvas->tables();
    auto to = std::ranges::find_if(tables, [&](const auto* table) { return table == last.get(); });
    if (to == tables.end())
        to = std::ranges::find_if(tables, [](const auto* table) { return table->isCurrent(); });
    if (to == tables.end()) to = tables.begin();
    go(tables.empty() ? Stop{canvas->shared_from_this()} : Stop{(*to)->shared_from_this()});
    return true;
}

bool Navigation::keyPressed(const Window& part, const Message& message) {
    if (!mSurroundings.holds(part.hwnd()) || message.id != WM_KEYDOWN) return false;
    const std::int16_t shift = shiftState();
    if (message.w == VK_TAB && (shift & ~1) == 0) return goOn(shift == 0);
    if (message.w == VK_F6 && shift == 0) return changePane();
    const bool onCanvas = &part == mSurroundings.canvas || &part == mSurroundings.surface;
    return onCanvas && scroll(message.w, shift);
}

bool Navigation::scroll(WPARAM key, std::int16_t shift) const {
    constexpr std::int16_t control = 2;
    const RECT seen = mSurroundings.seen();
    const int page = seen.bottom - seen.top;
    if (shift != 0 && shift != control) return false;
    if (key == VK_HOME)
        return mSurroundings.scrollBy({-seen.left, shift == control ? -seen.top : 0}), true;
    if (shift != 0) return false;
    switch (key) {
    case VK_LEFT: mSurroundings.scrollByStep({-1, 0}); return true;
    case VK_RIGHT: mSurroundings.scrollByStep({1, 0}); return true;
    case VK_UP: mSurroundings.scrollByStep({0, -1}); return true;
    case VK_DOWN: mSurroundings.scrollByStep({0, 1}); return true;
    case VK_PRIOR: mSurroundings.scrollBy({0, -page}); return true;
    case VK_NEXT: mSurroundings.scrollBy({0, page}); return true;
    default: return false;
    }
}

} // namespace zandor::platform::windows
