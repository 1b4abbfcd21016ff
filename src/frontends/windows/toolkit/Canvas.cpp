#include "frontends/windows/toolkit/Canvas.h"

#include "frontends/windows/toolkit/Accessible.h"
#include "frontends/windows/toolkit/CanvasItems.h"
#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/TableWindow.h"

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr UINT openLineMessage = WM_APP + 1;
constexpr int focusFrame = 2;

} // namespace

Canvas::Canvas(std::shared_ptr<Surroundings> around, HWND parent, FrameEvents events)
    : Window(std::move(around)), mEvents(std::move(events)) {
    create(parent, WS_CHILD | WS_VISIBLE | WS_CLIPCHILDREN | WS_CLIPSIBLINGS);
    surroundings().canvas = this;
}

Canvas::~Canvas() {
    if (surroundings().canvas == this) surroundings().canvas = nullptr;
}

void Canvas::forget() {
    mEvents = {};
    surroundings().canvas = nullptr;
}

void Canvas::add(CanvasItem& item) {
    const auto at =
        std::upper_bound(mItems.begin(), mItems.end(), item.layer(),
                         [](int layer, const CanvasItem* other) { return layer < other->layer(); });
    mItems.insert(at, &item);
}

void Canvas::remove(CanvasItem& item) {
    std::erase(mItems, &item);
    if (mCurrent != &item) return;
    // The keys go on with the next line, so that several can be deleted in a row.
    const auto rest = lines();
    const int gone = item.index();
    const auto next =
        std::ranges::find_if(rest, [gone](const auto* line) { return line->index() > gone; });
    mCurrent = nullptr;
    makeCurrent(next != rest.end() ? *next : rest.empty() ? nullptr : rest.back());
}

std::vector<TableWindow*> Canvas::tables() const {
    std::vector<TableWindow*> shown;
    for (HWND child = GetWindow(hwnd(), GW_CHILD); child; child = GetWindow(child, GW_HWNDNEXT))
        if (auto* const table = dynamic_cast<TableWindow*>(of(child)); table && table->isShown())
            shown.push_back(table);
    std::ranges::sort(shown, {}, [](const TableWindow* table) { return table->slot(); });
    return shown;
}

std::vector<CanvasLine*> Canvas::lines() const {
    std::vector<CanvasLine*> shown;
    for (CanvasItem* item : mItems)
        if (auto* const line = dynamic_cast<CanvasLine*>(item); line && line->visible())
            shown.push_back(line);
    std::ranges::sort(shown, {}, [](const CanvasLine* line) { return line->index(); });
    return shown;
}

const CanvasLine* Canvas::focusedLine() const {
    return mFocusShown && hasFocus() ? mCurrent : nullptr;
}

void Canvas::focusOn(CanvasLine* line) {
    const bool another = std::exchange(mCurrent, line) != line;
    const bool told = GetFocus() != hwnd(); // as it comes
    SetFocus(hwnd());
    if (another && !told) tellReader(*this);
    mFocusShown = true;
    repaint();
    if (line) surroundings().reveal(line->place());
}

void Canvas::makeCurrent(CanvasLine* line) {
    if (std::exchange(mCurrent, line) == line) return;
    repaint();
    tellReader(*this);
}

LRESULT Canvas::handle(const Message& message) {
    if (isPress(message.id)) return press(message), 0;
    if (isRelease(message.id)) return release(message), 0;
    switch (message.id) {
    case WM_ERASEBKGND: return 1;
    case WM_PRINTCLIENT:
    case WM_PAINT: paint(message); return 0;
    case WM_SETFOCUS: tellReader(*this); [[fallthrough]];
    case WM_KILLFOCUS: repaint(); return 0;
    case WM_MOUSEMOVE: hint(message.at()); return 0;
    case openLineMessage: openCurrentLine(); return 0;
    case WM_CONTEXTMENU:
        // The mouse opens the menu on release; the menu key has no release of its own.
        if (message.l == -1) openMenu();
        return 0;
    case WM_KEYDOWN:
        if (keyPressed(message)) return 0;
        break;
    default: break;
    }
    return Window::handle(message);
}

void Canvas::paint(const Message& message) {
    const Painting painting(hwnd(), message);
    const RECT& stale = painting.place();
    if (IsRectEmpty(&stale)) return;
    const Buffer buffer(painting.dc(), stale);
    fill(buffer.dc(), stale, surroundings().ground());
    std::vector<const CanvasItem*> shown;
    for (const CanvasItem* item : mItems) {
        if (!item->visible()) continue;
        const auto places = item->places();
        if (std::ranges::any_of(places, [&](const RECT& place) {
                RECT both{};
                return IntersectRect(&both, &place, &stale) != FALSE;
            }))
            shown.push_back(item);
    }
    const auto isAbove = [](const CanvasItem* item) {
        const auto* const line = dynamic_cast<const CanvasLine*>(item);
        return !line || line->borderWidth() > 1 || line->focused();
    };
    // A highlighted line stands above the others, and marks above all lines.
    for (const CanvasItem* item : shown)
        if (!isAbove(item)) item->paint(buffer.dc());
    for (const CanvasItem* item : shown)
        if (isAbove(item)) item->paint(buffer.dc());
    for (const CanvasItem* item : shown) item->paintAbove(buffer.dc());
    if (mFocusShown && hasFocus() && !mCurrent)
        frame(buffer.dc(), surroundings().seen(), systemColour(COLOR_HIGHLIGHT), focusFrame);
}

void Canvas::report(const MouseEvent& handler, const Message& message) const {
    const Scale& scale = surroundings().scale;
    const POINT at = message.at();
    // A copy: what it does may end the canvas.
    if (const MouseEvent told = handler)
        told(buttonOf(message.id), shiftState(message.w), scale.toTwips(at.x), scale.toTwips(at.y));
}

void Canvas::press(const Message& message) {
    surroundings().hints.leave(*this);
    if (GetFocus() != hwnd()) SetFocus(hwnd());
    SetCapture(hwnd());
    report(mEvents.MouseDown, message);
    if (!isAlive()) return;
    // The line that the control has highlighted is the one that keys then work on.
    const auto shown = lines();
    const auto hit =
        std::ranges::find_if(shown, [](const auto* line) { return line->borderWidth() > 1; });
    mFocusShown = false;
    makeCurrent(hit == shown.end() ? nullptr : *hit);
    // The second press of a double click is a press like any other, and with a comfort more than
    // that. The dialog must not come up while the press is being dealt with.
    if (message.id == WM_LBUTTONDBLCLK && mCurrent && surroundings().comforts.flags().ReadsJoins)
        PostMessageW(hwnd(), openLineMessage, 0, 0);
}

void Canvas::release(const Message& message) const {
    if (GetCapture() == hwnd() && buttonsOf(message.w) == 0) ReleaseCapture();
    report(mEvents.MouseUp, message);
}

bool Canvas::keyPressed(const Message& message) {
    if (!mCurrent) return false;
    if (message.w == VK_RETURN) return openCurrentLine(), true;
    if (message.w != VK_DELETE) return false;
    surroundings().menu.choose(menuentry::deleteJoin, [this] { clickWithRightButton(); });
    return true;
}

void Canvas::openCurrentLine() {
    if (mCurrent)
        surroundings().menu.choose(menuentry::showJoin, [this] { clickWithRightButton(); });
}

void Canvas::openMenu() {
    POINT at = middleOf(surroundings().seen());
    if (mCurrent) {
        const auto place = placeForKeys();
        at = {surroundings().scale.toPixels(place.X), surroundings().scale.toPixels(place.Y)};
    }
    ClientToScreen(hwnd(), &at);
    surroundings().menu.openAt(at, [this] { clickWithRightButton(); });
}

/// The middle of the current line, or where another line runs across it a place beside.
TalvikTabulet::Point Canvas::placeForKeys() const {
    constexpr float nowhere = -1E6F; // no line runs there
    if (!mCurrent) return {nowhere, nowhere};
    constexpr float clear = 60;
    const auto shown = lines();
    for (const float share : {0.5F, 0.25F, 0.75F, 0.375F, 0.625F}) {
        const auto at = mCurrent->at(share);
        if (std::ranges::none_of(shown, [&](const CanvasLine* other) {
                return other != mCurrent && other->distanceTo(at) < clear;
            }))
            return at;
    }
    return mCurrent->at(0.5F);
}

void Canvas::clickWithRightButton() {
    const auto at = placeForKeys();
    if (const MouseEvent down = mEvents.MouseDown) down(rightButton, 0, at.X, at.Y);
    if (const MouseEvent up = mEvents.MouseUp) up(rightButton, 0, at.X, at.Y);
}

void Canvas::hint(POINT at) const {
    constexpr float reach = 90; // twips
    const Scale& scale = surroundings().scale;
    const TalvikTabulet::Point place{scale.toTwips(at.x), scale.toTwips(at.y)};
    const CanvasLine* nearest = nullptr;
    float best = reach;
    for (const CanvasLine* line : lines())
        if (const float distance = line->distanceTo(place); distance < best) {
            best = distance;
            nearest = line;
        }
    if (nearest)
        surroundings().hints.over(*this, within(nearest->place(), -6, -6, -6, -6),
                                  nearest->notes().Sentence);
    else
        surroundings().hints.leave(*this);
}

// Nothing can be dropped between the tables; the drag only scrolls the canvas.
bool Canvas::draggedOver(POINT, DragState) { return false; }

bool Canvas::scrollUnderDrag(POINT at) {
    const RECT view = surroundings().seen();
    const int edge = surroundings().scale.pixels(20);
    const auto direction = [edge](int at, int low, int high) {
        // In a small view something remains between the two edges.
        const int reach = std::min(edge, (high - low) / 4);
        return at < low + reach ? -1 : at >= high - reach ? 1 : 0;
    };
    if (!PtInRect(&view, at)) return false;
    const POINT way{direction(at.x, view.left, view.right), direction(at.y, view.top, view.bottom)};
    if (way.x == 0 && way.y == 0) return false;
    surroundings().scrollByStep(way);
    return true;
}

} // namespace zandor::platform::windows
