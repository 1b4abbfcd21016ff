#include "frontends/windows/toolkit/TableWindow.h"

#include "frontends/windows/toolkit/Canvas.h"
#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

namespace {

// Logical pixels.
constexpr int border = 4;       ///< resizes the box; its outermost pixel is the frame line
constexpr int keyStep = 10;     ///< 150 twips
constexpr int cornerReach = 14; ///< how far a corner reaches along its edges

const wchar_t* cursorFor(unsigned edges) {
    const bool sideways = edges & (leftEdge | rightEdge);
    const bool upright = edges & (topEdge | bottomEdge);
    const bool falling = edges == (leftEdge | topEdge) || edges == (rightEdge | bottomEdge);
    const auto* const shape = sideways && upright ? (falling ? IDC_SIZENWSE : IDC_SIZENESW)
                              : sideways          ? IDC_SIZEWE
                              : upright           ? IDC_SIZENS
                                                  : IDC_ARROW;
    return reinterpret_cast<const wchar_t*>(shape);
}

POINT cursorOnScreen(HWND window, POINT at) {
    ClientToScreen(window, &at);
    return at;
}

} // namespace

TableWindow::TableWindow(std::shared_ptr<Surroundings> around, HWND canvas, int slot)
    : Window(around), mSlot(slot) {
    create(canvas, WS_CHILD | WS_CLIPCHILDREN | WS_CLIPSIBLINGS);
    mList = std::make_shared<EntryList>(std::move(around), hwnd());
    fontChanged();
}

TableWindow::~TableWindow() { mList->end(); }

void TableWindow::forget() {
    mListener = nullptr;
    mGesture = Gesture::none;
    mList->end();
}

void TableWindow::setListener(TableListener* listener) {
    mListener = listener;
    mList->setListener(listener);
}

void TableWindow::setTitle(const String& title) {
    mTitle = title;
    SetWindowTextW(hwnd(), wide(title)); // spoken
    SetWindowTextW(mList->hwnd(), wide(title));
    repaint();
}

void TableWindow::setLocked(bool locked) {
    mLocked = locked;
    repaint();
    if (!locked) return;
    const bool taken = mGesture == Gesture::moveOrResize && stopGesture();
    if (GetCapture() == hwnd()) ReleaseCapture();
    if (taken && mListener) mListener->gestureTakenBack();
}

void TableWindow::setCurrent(bool current) {
    if (std::exchange(mCurrent, current) != current) repaint();
}

void TableWindow::fontChanged() {
    if (!mList) return;
    const int before = std::exchange(mTitleHeight, surroundings().fonts.heightOf(fontHandle()) +
                                                       surroundings().scale.pixels(10));
    mList->setFont(hasOwnFont() ? std::optional(font()) : std::nullopt);
    arrange();
    // Joins end at entries.
    if (before != 0 && before != mTitleHeight && mListener) mListener->listScrolled();
}

SIZE TableWindow::smallest() const {
    return {mTitleHeight * 3,
            mTitleHeight + mList->rowHeight() + surroundings().scale.pixels(border)};
}

RECT TableWindow::titleBar() const { return {0, 0, area().right, mTitleHeight}; }

RECT TableWindow::crossPlace() const {
    const int inset = surroundings().scale.pixels(4);
    const int side = mTitleHeight - 2 * inset;
    const int right = area().right - surroundings().scale.pixels(border);
    return {right - side, inset, right, inset + side};
}

RECT TableWindow::listPlace() const {
    const int edge = surroundings().scale.pixels(border);
    RECT place = within(area(), edge, mTitleHeight, edge, edge);
    place.right = std::max(place.left, place.right);
    place.bottom = std::max(place.top, place.bottom);
    return place;
}

void TableWindow::arrange() {
    if (mList) mList->place(listPlace());
}

TableWindow::Colours TableWindow::colours() const {
    const COLORREF window = systemColour(COLOR_BTNFACE);
    const COLORREF text = systemColour(COLOR_BTNTEXT);
    const COLORREF highlight = systemColour(COLOR_HIGHLIGHT);
    if (GetFocus() == mList->hwnd())
        return {highlight, systemColour(COLOR_HIGHLIGHTTEXT), highlight};
    if (mCurrent) return {mixed(window, highlight, 0.3), text, mixed(window, highlight, 0.7)};
    return {mixed(window, text, 0.08), text, mixed(window, text, 0.35)};
}

void TableWindow::paint(const Message& message) {
    const Painting painting(hwnd(), message);
    if (IsRectEmpty(&painting.place())) return;
    const Buffer buffer(painting.dc(), painting.place());
    const Colours looks = colours();
    const Scale& scale = surroundings().scale;
    fill(buffer.dc(), area(), systemColour(COLOR_WINDOW));
    fill(buffer.dc(), titleBar(), looks.back);
    RECT place = titleBar();
    place.left += scale.pixels(border + 4);
    place.right = mLocked ? place.right - scale.pixels(border) : crossPlace().left;
    write(buffer.dc(), mTitle, place, surroundings().fonts.of(font(), Fonts::Face::title),
          looks.text);
    frame(buffer.dc(), area(), looks.frame);
    if (mLocked) return;
    const RECT cross = crossPlace();
    if (mCrossHot)
        fill(buffer.dc(), cross,
             mixed(looks.back, looks.text, mGesture == Gesture::cross ? 0.35 : 0.2));
    const int arm = widthOf(cross) * 22 / 100;
    const POINT middle = middleOf(cross);
    const int width = scale.pixels(1);
    line(buffer.dc(), {middle.x - arm, middle.y - arm}, {middle.x + arm + 1, middle.y + arm + 1},
         looks.text, width);
    line(buffer.dc(), {middle.x - arm, middle.y + arm}, {middle.x + arm + 1, middle.y - arm - 1},
         looks.text, width);
}

unsigned TableWindow::edgesAt(POINT at) const {
    const RECT box = area();
    const int edge = surroundings().scale.pixels(border);
    const int corner = surroundings().scale.pixels(cornerReach);
    unsigned edges = noEdge;
    if (at.x < edge) edges |= leftEdge;
    if (at.x >= box.right - edge) edges |= rightEdge;
    if (at.y < edge) edges |= topEdge;
    if (at.y >= box.bottom - edge) edges |= bottomEdge;
    // Near a corner an edge takes its neighbour along.
    if (edges & (topEdge | bottomEdge)) {
        if (at.x < corner) edges |= leftEdge;
        if (at.x >= box.right - corner) edges |= rightEdge;
    } else if (edges) {
        if (at.y < corner) edges |= topEdge;
        if (at.y >= box.bottom - corner) edges |= bottomEdge;
    }
    return edges;
}

LRESULT TableWindow::handle(const Message& message) {
    if (isPress(message.id)) return press(message), 0;
    if (isRelease(message.id)) return release(message), 0;
    switch (message.id) {
    case WM_SIZE:
        arrange();
        repaint();
        return 0;
    case WM_ERASEBKGND: return 1;
    case WM_PRINTCLIENT:
    case WM_PAINT: paint(message); return 0;
    case WM_SETFOCUS: SetFocus(mList->hwnd()); return 0;
    case WM_SETCURSOR:
        if (LOWORD(message.l) == HTCLIENT && reinterpret_cast<HWND>(message.w) == hwnd() &&
            showCursor())
            return TRUE;
        break;
    case WM_MOUSEMOVE: move(message); return 0;
    case WM_MOUSELEAVE: setCross(false); return 0;
    case WM_MOUSEWHEEL: // the canvas below does not scroll
    case WM_CONTEXTMENU: return 0;
    default: break;
    }
    return Window::handle(message);
}

bool TableWindow::showCursor() const {
    POINT at{};
    GetCursorPos(&at);
    ScreenToClient(hwnd(), &at);
    const RECT cross = crossPlace();
    if (mLocked || PtInRect(&cross, at)) return false;
    SetCursor(LoadCursorW(nullptr, cursorFor(edgesAt(at))));
    return true;
}

void TableWindow::setCross(bool hot) {
    if (std::exchange(mCrossHot, hot) != hot) repaint();
    if (!hot) return;
    TRACKMOUSEEVENT track{sizeof track, TME_LEAVE, hwnd(), 0};
    TrackMouseEvent(&track);
}

void TableWindow::press(const Message& message) {
    const RECT cross = crossPlace();
    const bool isLeft = buttonOf(message.id) == leftButton;
    if (isLeft && !mLocked && PtInRect(&cross, message.at())) {
        mGesture = Gesture::cross;
        SetCapture(hwnd());
        repaint();
        return;
    }
    raise();
    if (!isLeft) return;
    if (!mLocked) {
        mPressedAt = cursorOnScreen(hwnd(), message.at());
        SetCapture(hwnd());
        beginGesture(edgesAt(message.at()));
    }
    SetFocus(mList->hwnd());
}

void TableWindow::move(const Message& message) {
    const RECT cross = crossPlace();
    if (mGesture != Gesture::moveOrResize) {
        setCross(!mLocked && PtInRect(&cross, message.at()));
        return;
    }
    // The release may have gone to a message box that came up in between.
    if (!(message.w & MK_LBUTTON)) return endGesture();
    if (GetCapture() != hwnd()) SetCapture(hwnd());
    const POINT now = cursorOnScreen(hwnd(), message.at());
    const POINT way{now.x - mPressedAt.x, now.y - mPressedAt.y};
    if (!mMoved && way.x == 0 && way.y == 0) return;
    mMoved = true;
    if (mListener) mListener->gestureMoved(mEdges, way);
}

void TableWindow::release(const Message& message) {
    const std::int16_t button = buttonOf(message.id);
    const POINT at = message.at();
    const RECT cross = crossPlace();
    const RECT title = titleBar();
    if (button == leftButton && mGesture == Gesture::cross) {
        mGesture = Gesture::none;
        ReleaseCapture();
        repaint();
        if (PtInRect(&cross, at)) pressCross();
        return;
    }
    if (button == leftButton) endGesture();
    if (button == rightButton && PtInRect(&title, at) && mListener) mListener->titleClicked();
}

void TableWindow::beginGesture(unsigned edges) {
    mEdges = edges;
    mGesture = Gesture::moveOrResize;
    mMoved = false;
    if (mListener) mListener->gestureBegan();
}

bool TableWindow::stopGesture() {
    const bool going = std::exchange(mGesture, Gesture::none) == Gesture::moveOrResize;
    return std::exchange(mMoved, false) && going;
}

void TableWindow::endGesture() {
    const bool moved = stopGesture();
    if (GetCapture() == hwnd()) ReleaseCapture();
    if (moved && mListener) mListener->gestureEnded(mEdges);
}

bool TableWindow::moveOrResize(WPARAM key, std::int16_t shift) {
    constexpr std::int16_t withShift = 1, control = 2, alt = 4;
    POINT way{};
    switch (key) {
    case VK_LEFT: way = {-1, 0}; break;
    case VK_RIGHT: way = {1, 0}; break;
    case VK_UP: way = {0, -1}; break;
    case VK_DOWN: way = {0, 1}; break;
    default: return false;
    }
    const bool resize = shift == (alt | withShift) || shift == (control | withShift);
    if (!mListener || mLocked || !(resize || shift == alt)) return false;
    const unsigned edges = !resize ? noEdge : way.x != 0 ? rightEdge : bottomEdge;
    const auto held = shared_from_this();
    const int step = surroundings().scale.pixels(keyStep);
    beginGesture(edges);
    mMoved = true;
    mListener->gestureMoved(edges, {way.x * step, way.y * step});
    if (isAlive()) endGesture();
    if (isAlive()) surroundings().reveal(placeInParent());
    return true;
}

bool TableWindow::draggedOver(POINT at, DragState state) {
    return mListener && mListener->draggedOver(at, state);
}

void TableWindow::dropped(POINT at) {
    if (mListener) mListener->dropped(at);
}

bool TableWindow::scrollUnderDrag(POINT at) {
    // The list first: below its edge the canvas would run away.
    const RECT list = listPlace();
    const int edge = std::min<int>(surroundings().scale.pixels(20), heightOf(list) / 4);
    const int before = mList->top();
    if (PtInRect(&list, at)) {
        if (at.y < list.top + edge && before > 0) mList->scrollTo(before - 1);
        if (at.y >= list.bottom - edge) mList->scrollTo(before + 1);
    }
    if (mList->top() != before) return true;
    if (!surroundings().canvas) return false;
    MapWindowPoints(hwnd(), surroundings().canvas->hwnd(), &at, 1);
    return surroundings().canvas->scrollUnderDrag(at);
}

} // namespace zandor::platform::windows
