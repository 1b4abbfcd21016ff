#include "frontends/windows/toolkit/EntryList.h"

#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Images.h"
#include "frontends/windows/toolkit/TableWindow.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>
#include <utility>

#include <oleacc.h>

namespace zandor::platform::windows {

namespace {

constexpr std::int16_t left = 1;

POINT onScreen(HWND window, POINT at) {
    ClientToScreen(window, &at);
    return at;
}

} // namespace

EntryList::EntryList(std::shared_ptr<Surroundings> around, HWND parent)
    : Window(std::move(around)) {
    createNative(L"LISTBOX", parent,
                 WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS | WS_VSCROLL | LBS_EXTENDEDSEL |
                     LBS_OWNERDRAWFIXED | LBS_HASSTRINGS | LBS_NOINTEGRALHEIGHT);
}

int EntryList::count() const { return hwnd() ? static_cast<int>(ask(LB_GETCOUNT)) : 0; }

void EntryList::add(const String& text) {
    ask(LB_ADDSTRING, 0, reinterpret_cast<LPARAM>(wide(text)));
}

void EntryList::clear() {
    ask(LB_RESETCONTENT);
    mTop = mAnchor = 0;
    mPressed = mClickPending = mDoubleClicked = -1;
}

String EntryList::textOf(int row) const {
    const LRESULT length = ask(LB_GETTEXTLEN, static_cast<WPARAM>(row));
    if (length < 0) return {};
    String text(static_cast<std::size_t>(length) + 1, u'\0');
    ask(LB_GETTEXT, static_cast<WPARAM>(row), reinterpret_cast<LPARAM>(text.data()));
    text.pop_back();
    return text;
}

int EntryList::top() const { return hwnd() ? static_cast<int>(ask(LB_GETTOPINDEX)) : 0; }

void EntryList::scrollTo(int row) {
    ask(LB_SETTOPINDEX, static_cast<WPARAM>(row));
    checkTop();
}

int EntryList::rowsInView() const { return std::max(1, heightOf(area()) / mRowHeight); }

void EntryList::reveal(int row) {
    if (row < top())
        scrollTo(row);
    else if (row >= top() + rowsInView())
        scrollTo(row - rowsInView() + 1);
}

int EntryList::rowAt(POINT at) const {
    const RECT inside = area();
    if (!PtInRect(&inside, at)) return -1;
    const int row = top() + at.y / mRowHeight;
    return row < count() ? row : -1;
}

RECT EntryList::placeOf(int row) const {
    const RECT inside = area();
    const int above = (row - top()) * mRowHeight;
    return {inside.left, above, inside.right, above + mRowHeight};
}

bool EntryList::isSelected(int row) const {
    return hwnd() && ask(LB_GETSEL, static_cast<WPARAM>(row)) > 0;
}

void EntryList::select(int row, bool value) {
    if (isSelected(row) == value) return;
    // The other message for it scrolls to the entry; this one has 16 bits for its number.
    if (row <= 0xFFFF) {
        ask(LB_SELITEMRANGE, value, MAKELPARAM(row, row));
    } else {
        const int before = top();
        ask(LB_SETSEL, value, row);
        ask(LB_SETTOPINDEX, static_cast<WPARAM>(before));
    }
}

std::vector<int> EntryList::selected() const {
    if (!hwnd()) return {};
    std::vector<int> rows(static_cast<std::size_t>(std::max<LRESULT>(0, ask(LB_GETSELCOUNT))));
    if (!rows.empty()) ask(LB_GETSELITEMS, rows.size(), reinterpret_cast<LPARAM>(rows.data()));
    return rows;
}

void EntryList::repaintRow(int row) const {
    const RECT place = placeOf(row);
    if (hwnd()) InvalidateRect(hwnd(), &place, FALSE);
}

void EntryList::fontChanged() {
    mRowHeight =
        std::min(255, surroundings().fonts.heightOf(fontHandle()) + surroundings().scale.pixels(2));
    ask(LB_SETITEMHEIGHT, 0, mRowHeight);
    checkTop();
}

void EntryList::gotFocus() {
    if (mListener) mListener->listGotFocus();
}

void EntryList::checkTop() {
    if (!isAlive()) return;
    const int now = top();
    if (std::exchange(mTop, now) != now && mListener) mListener->listScrolled();
}

LRESULT EntryList::handle(const Message& message) {
    const LRESULT result = dealWith(message);
    // However it came to be scrolled.
    if (message.id != WM_PAINT && message.id != WM_ERASEBKGND) checkTop();
    return result;
}

LRESULT EntryList::dealWith(const Message& message) {
    if (isPress(message.id)) return press(message), 0;
    if (isRelease(message.id)) return release(message), 0;
    switch (message.id) {
    case WM_MOUSEMOVE: move(message); return 0;
    case WM_CAPTURECHANGED:
        // A box that comes up for a press takes the mouse away, and the press counts all the same.
        return 0;
    case WM_TIMER:
        if (message.w != Drags::timer) break;
        surroundings().drags.tick();
        return 0;
    case WM_CONTEXTMENU:
        // The mouse opens the menu on release; the menu key has no release of its own.
        if (message.l == -1) openMenu();
        return 0;
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
        if (isTables(message) || keyPressed(message)) return 0;
        return Window::handle(message);
    case WM_CHAR: {
        if (message.w == VK_SPACE || message.w == VK_RETURN || message.w == VK_TAB) return 0;
        const auto before = selected();
        passOn(message);
        tellOfKeys(before);
        return 0;
    }
    case WM_SETFOCUS:
    case WM_KILLFOCUS:
        // Its title shows it.
        if (const Window* const table = of(GetParent(hwnd()))) table->repaint();
        break;
    case WM_MOUSEWHEEL: return passOn(message);
    case WM_ERASEBKGND: {
        RECT below = area();
        below.top = std::max<LONG>(below.top, (count() - top()) * mRowHeight);
        if (below.top < below.bottom)
            fill(reinterpret_cast<HDC>(message.w), below, systemColour(COLOR_WINDOW));
        return 1;
    }
    default: break;
    }
    return Window::handle(message);
}

std::optional<LRESULT> EntryList::told(const Message& message) {
    if (message.id == WM_CTLCOLORLISTBOX)
        return reinterpret_cast<LRESULT>(GetSysColorBrush(COLOR_WINDOW));
    if (message.id != WM_DRAWITEM) return {};
    draw(*reinterpret_cast<const DRAWITEMSTRUCT*>(message.l));
    return TRUE;
}

void EntryList::draw(const DRAWITEMSTRUCT& item) const {
    const int row = static_cast<int>(item.itemID);
    if (row < 0 || row >= count() || IsRectEmpty(&item.rcItem)) return;
    const Buffer buffer(item.hDC, item.rcItem);
    const bool selected = isSelected(row);
    const COLORREF ground = systemColour(selected ? COLOR_HIGHLIGHT : COLOR_WINDOW);
    const COLORREF text = systemColour(selected ? COLOR_HIGHLIGHTTEXT : COLOR_WINDOWTEXT);
    fill(buffer.dc(), item.rcItem, ground);
    const EntryLook look = lookOf(row);
    const int side = mRowHeight - surroundings().scale.pixels(4);
    const int gutter = mRowHeight + surroundings().scale.pixels(2);
    const int down = item.rcItem.top + (mRowHeight - side) / 2;
    const int edge = surroundings().scale.pixels(3);
    RECT place = within(item.rcItem, gutter, 0, edge, 0);
    if (look.picture) {
        const int across = item.rcItem.left + edge;
        paintPicture(buffer.dc(), *look.picture, {across, down, across + side, down + side},
                     selected ? text : mixed(ground, text, 0.75), ground);
    }
    if (look.comesOut) {
        place.right = item.rcItem.right - gutter;
        paintOutputMark(buffer.dc(),
                        {place.right + edge, down, place.right + edge + side, down + side}, text);
    }
    write(buffer.dc(), textOf(row), place, fontHandle(), text);
    if (GetFocus() == hwnd() && row == caret()) {
        SetTextColor(buffer.dc(), RGB(0, 0, 0));
        SetBkColor(buffer.dc(), RGB(255, 255, 255));
        DrawFocusRect(buffer.dc(), &item.rcItem);
    }
}

void EntryList::setCaret(int row) {
    ask(LB_SETCARETINDEX, static_cast<WPARAM>(row), FALSE);
    checkTop();
}

/// The entries between two rows, and no others.
void EntryList::selectOnly(int from, int to) {
    if (from > to) std::swap(from, to);
    for (const int row : selected())
        if (row < from || row > to) select(row, false);
    for (int row = std::max(0, from); row <= to; ++row) select(row, true);
}

void EntryList::selectAlone(int row) {
    const auto before = selected();
    selectOnly(row, row);
    mAnchor = std::max(0, row);
    if (selected() != before && mListener) mListener->selectionChanged();
}

void EntryList::selectFor(const Message& message, int row) {
    const bool isLeft = buttonOf(message.id) == left;
    const std::int16_t shift = isLeft ? shiftState(message.w) : std::int16_t{0};
    mClickPending = mDoubleClicked = -1;
    if (row < 0) {
        if (isLeft && shift == 0) selectAlone(-1);
        return;
    }
    const bool ranges = shift & 1;
    const bool toggles = shift & 2;
    if (ranges)
        selectOnly(std::min(mAnchor, count() - 1), row);
    else if (toggles)
        select(row, !isSelected(row));
    else if (!isSelected(row))
        selectOnly(row, row);
    else if (isLeft)
        mClickPending = row;
    if (!ranges) mAnchor = row;
    setCaret(row);
}

void EntryList::press(const Message& message) {
    surroundings().hints.leave(*this);
    if (auto* const table = dynamic_cast<TableWindow*>(of(GetParent(hwnd())))) table->raise();
    if (GetFocus() != hwnd()) SetFocus(hwnd());
    if (!isAlive()) return;
    const POINT at = message.at();
    const int row = rowAt(at);
    mPressedAt = at;
    SetCapture(hwnd());
    selectFor(message, row);
    mPressed = row;
    if (message.id == WM_LBUTTONDBLCLK) mDoubleClicked = row;
    // Whoever was told of an emptied selection may have ended all this.
    if (row >= 0 && isAlive() && mListener)
        mListener->entryPressed(row, buttonOf(message.id), shiftState(message.w));
}

void EntryList::move(const Message& message) {
    Drags& drags = surroundings().drags;
    const POINT at = message.at();
    const std::int16_t buttons = buttonsOf(message.w);
    if (buttons == 0) {
        mPressed = mClickPending = mDoubleClicked = -1;
        return hint(at);
    }
    // The system tells of a move where there was none, too.
    const bool same = at.x == mPressedAt.x && at.y == mPressedAt.y;
    if (!mListener || mPressed < 0 || same) return;
    mDoubleClicked = -1; // a drag that follows a click closely
    if (GetCapture() != hwnd()) SetCapture(hwnd());
    mListener->entryMoved(mPressed, buttons, shiftState(message.w));
    if (drags.runRequested(*this)) mPressed = mClickPending = -1;
}

void EntryList::release(const Message& message) {
    const POINT at = message.at();
    const bool isLeft = buttonOf(message.id) == left;
    const int row = rowAt(at);
    const bool again = isLeft && row >= 0 && mClickPending == row;
    const bool doubleClicked = isLeft && row >= 0 && mDoubleClicked == row;
    mPressed = mClickPending = mDoubleClicked = -1;
    if (GetCapture() == hwnd() && buttonsOf(message.w) == 0) ReleaseCapture();
    if (again) selectAlone(row);
    if (row < 0) return;
    if (isAlive() && mListener)
        mListener->entryReleased(row, buttonOf(message.id), shiftState(message.w));
    if (isAlive() && mListener && doubleClicked) mListener->entryDoubleClicked(row);
}

bool EntryList::isTables(const Message& message) {
    auto* const table = dynamic_cast<TableWindow*>(of(GetParent(hwnd())));
    return table && table->moveOrResize(message.w, shiftState());
}

bool EntryList::keyPressed(const Message& message) {
    if (message.id == WM_SYSKEYDOWN || !mListener) return false;
    const bool control = shiftState() & 2;
    const int row = caret();
    switch (message.w) {
    case VK_DELETE:
        if (shiftState() != 0) return false;
        mListener->deleteKey(row);
        return true;
    case VK_RETURN:
        if (row >= 0) open(row);
        return true;
    case VK_SPACE: {
        if (row < 0) return true;
        const auto before = selected();
        select(row, !control || !isSelected(row));
        mAnchor = row;
        tellOfKeys(before);
        return true;
    }
    default: return walk(message.w);
    }
}

bool EntryList::walk(WPARAM key) {
    const int last = count() - 1;
    const int now = caret();
    int to = 0;
    switch (key) {
    case VK_UP: to = now - 1; break;
    case VK_DOWN: to = now + 1; break;
    case VK_PRIOR: to = now - rowsInView() + 1; break;
    case VK_NEXT: to = now + rowsInView() - 1; break;
    case VK_HOME: to = 0; break;
    case VK_END: to = last; break;
    default: return false;
    }
    if (last < 0) return true;
    to = std::clamp(to, 0, last);
    const std::int16_t shift = shiftState();
    const auto before = selected();
    // The first key in a list without a selection begins where it is.
    if (before.empty() && (key == VK_UP || key == VK_DOWN) && shift == 0) to = now;
    if (shift & 1)
        selectOnly(std::min(mAnchor, last), to);
    else if (!(shift & 2))
        selectOnly(mAnchor = to, to);
    setCaret(to);
    repaint();
    tellOfKeys(before);
    return true;
}

void EntryList::take(int row, LONG how) {
    const auto before = selected();
    if (how & SELFLAG_TAKEFOCUS) SetFocus(hwnd());
    if (!isAlive()) return;
    if (how & SELFLAG_TAKESELECTION) selectOnly(row, row);
    if (how & SELFLAG_EXTENDSELECTION) selectOnly(mAnchor, row);
    if (how & SELFLAG_ADDSELECTION) select(row, true);
    if (how & SELFLAG_REMOVESELECTION) select(row, false);
    if (!(how & SELFLAG_EXTENDSELECTION)) mAnchor = row;
    setCaret(row);
    repaint();
    tellOfKeys(before);
}

/// To the control, selecting is what a press of the mouse has done.
void EntryList::tellOfKeys(const std::vector<int>& before) {
    const int row = caret();
    if (!mListener || row < 0 || selected() == before) return;
    const std::int16_t shift = shiftState();
    mListener->entryPressed(row, left, shift);
    if (isAlive() && mListener) mListener->entryReleased(row, left, shift);
}

void EntryList::openMenu() {
    if (!mListener) return;
    const int row = caret();
    if (row >= 0) reveal(row);
    if (!isAlive() || !mListener) return;
    const POINT at = middleOf(row >= 0 ? placeOf(row) : area());
    mListener->menuKey(row, onScreen(hwnd(), at));
}

/// What is cut off in the list is whole in its tooltip.
void EntryList::hint(POINT at) const {
    const int row = rowAt(at);
    if (row < 0) return surroundings().hints.leave(*this);
    const RECT place = placeOf(row);
    const String text = textOf(row);
    const bool cut = surroundings().fonts.widthOf(fontHandle(), text) >
                     widthOf(place) - mRowHeight - surroundings().scale.pixels(5);
    surroundings().hints.over(*this, place, cut ? text : String());
}

} // namespace zandor::platform::windows
