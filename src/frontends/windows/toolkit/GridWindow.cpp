#include "frontends/windows/toolkit/GridWindow.h"

#include "frontends/windows/toolkit/Accessible.h"
#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Inputs.h"

#include <Zandor/comforts/Spoken.h>

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr float designWidth = 1500; ///< twips
constexpr int textMargin = 8;       // logical pixels, as the others
constexpr int cellMargin = 4;
constexpr int leastLabels = 70;

} // namespace

GridWindow::GridWindow(std::shared_ptr<Surroundings> around, HWND parent, std::int32_t rows,
                       std::int32_t cols, MSFlexGridLib::GridEvents events)
    : Window(std::move(around)), mCells(rows, cols, designWidth), mEvents(std::move(events)) {
    create(parent, WS_CHILD | WS_CLIPSIBLINGS | WS_HSCROLL | WS_VSCROLL);
    surroundings().grid = this;
    surroundings().focus.setFallback(this);
    fontChanged();
}

GridWindow::~GridWindow() {
    if (surroundings().grid == this) surroundings().grid = nullptr;
}

void GridWindow::forget() {
    mEvents = {};
    surroundings().grid = nullptr;
}

void GridWindow::fontChanged() {
    mRowHeight = surroundings().fonts.heightOf(fontHandle()) + surroundings().scale.pixels(8);
    mLabelStale = true;
    showRanges();
}

void GridWindow::widthsChanged() {
    showRanges();
    repaint();
}

void GridWindow::setLabelWidth(float twips) {
    mLabelWidthSet = true;
    mCells.column(0).width = twips;
    widthsChanged();
}

float GridWindow::widthInTwips(std::int32_t col) const {
    return col == 0 ? labelWidth() : mCells.column(col).width;
}

int GridWindow::columnWidth(std::int32_t col) const {
    return surroundings().scale.toPixels(widthInTwips(col));
}

bool GridWindow::offersFields() const { return surroundings().comforts.flags().OffersFields; }

float GridWindow::labelWidth() const {
    if (mLabelWidthSet) return mCells.column(0).width;
    const Scale& scale = surroundings().scale;
    if (std::exchange(mLabelStale, false)) {
        int widest = 0;
        for (std::int32_t row = 0; row < mCells.rows(); ++row)
            widest = std::max(widest,
                              surroundings().fonts.widthOf(fontHandle(), mCells.cell(row, 0).text));
        mLabels = std::max(widest + scale.pixels(2 * textMargin + 4), scale.pixels(leastLabels));
    }
    return scale.toTwips(mLabels);
}

RECT GridWindow::cellPlace(std::int32_t row, std::int32_t col) const {
    int left = 0;
    if (col > 0) {
        left = columnWidth(0);
        for (std::int32_t i = mLeftCol; i < col; ++i) left += columnWidth(i);
        for (std::int32_t i = col; i < mLeftCol; ++i) left -= columnWidth(i);
    }
    const int top = row == 0 ? 0 : mRowHeight * (1 + row - mTopRow);
    return {left, top, left + columnWidth(col), top + mRowHeight};
}

std::pair<std::int32_t, std::int32_t> GridWindow::cellAt(POINT at) const {
    std::int32_t row = at.y < mRowHeight ? 0 : mTopRow + at.y / mRowHeight - 1;
    if (row >= mCells.rows() || at.y < 0) row = -1;
    std::int32_t col = 0;
    int right = columnWidth(0);
    if (at.x >= right) {
        for (col = mLeftCol; col < mCells.cols(); ++col)
            if (at.x < (right += columnWidth(col))) break;
        if (col >= mCells.cols()) col = -1;
    }
    return {row, at.x < 0 ? -1 : col};
}

int GridWindow::rowsInView() const { return std::max(1, heightOf(area()) / mRowHeight - 1); }

std::int32_t GridWindow::lastTop() const {
    return std::clamp<std::int32_t>(mCells.rows() - rowsInView(), 1, mCells.rows() - 1);
}

std::int32_t GridWindow::lastLeft() const {
    int room = widthOf(area()) - columnWidth(0);
    std::int32_t col = mCells.cols();
    while (col > 1 && (room -= columnWidth(col - 1)) >= 0) --col;
    return std::clamp<std::int32_t>(col, 1, mCells.cols() - 1);
}

void GridWindow::showRanges() {
    if (!isAlive() || mRowHeight == 0) return;
    mDown.show(hwnd(), SB_VERT, {1, lastTop(), 1, mTopRow});
    mAcross.show(hwnd(), SB_HORZ, {1, lastLeft(), 1, mLeftCol});
}

void GridWindow::scrollTo(std::int32_t topRow, std::int32_t leftCol) {
    const std::int32_t top = std::clamp(topRow, 1, std::max(lastTop(), mTopRow));
    const std::int32_t left = std::clamp(leftCol, 1, std::max(lastLeft(), mLeftCol));
    if (top == mTopRow && left == mLeftCol) return;
    mTopRow = top;
    mLeftCol = left;
    widthsChanged();
    // A copy: what it does may end the grid.
    if (const PlainEvent scrolled = mEvents.Scroll) scrolled();
}

void GridWindow::scrolledByBar(const Message& message) {
    const bool across = message.id == WM_HSCROLL;
    SCROLLINFO info{};
    info.cbSize = sizeof info;
    info.fMask = SIF_TRACKPOS | SIF_RANGE;
    GetScrollInfo(hwnd(), across ? SB_HORZ : SB_VERT, &info);
    std::int32_t to = across ? mLeftCol : mTopRow;
    switch (LOWORD(message.w)) {
    case SB_LINEUP: --to; break;
    case SB_LINEDOWN: ++to; break;
    case SB_PAGEUP: to -= across ? 3 : rowsInView(); break;
    case SB_PAGEDOWN: to += across ? 3 : rowsInView(); break;
    case SB_THUMBTRACK: to = info.nTrackPos; break;
    case SB_THUMBPOSITION: to = HIWORD(message.w); break;
    case SB_TOP: to = 1; break;
    case SB_BOTTOM: to = info.nMax; break;
    default: return;
    }
    across ? scrollTo(mTopRow, to) : scrollTo(to, mLeftCol);
}

void GridWindow::setCurrent(std::int32_t row, std::int32_t col) {
    const bool same = row == mRow && col == mCol;
    mRow = row;
    mCol = col;
    repaint();
    if (!same) tellReader(*this);
}

void GridWindow::showCurrent() {
    std::int32_t top = mRow == 0 ? mTopRow : std::min(mTopRow, mRow);
    std::int32_t left = mCol == 0 ? mLeftCol : std::min(mLeftCol, mCol);
    if (mRow >= top + rowsInView()) top = mRow - rowsInView() + 1;
    int right = columnWidth(0);
    for (std::int32_t col = left; col <= mCol; ++col) right += columnWidth(col);
    while (left < mCol && right > widthOf(area())) right -= columnWidth(left++);
    scrollTo(top, left);
}

std::int32_t GridWindow::offeredColumn() const {
    if (!offersFields()) return 0;
    const std::int32_t blank = mCells.firstBlank();
    return blank && surroundings().comforts.hasFieldsToOffer() ? blank : 0;
}

void GridWindow::showGap(std::int32_t column) {
    if (std::exchange(mGap, column) != column) repaint();
}

void GridWindow::resizeColumn(std::int32_t col, int pixels) {
    mCells.column(col).width = surroundings().scale.toTwips(pixels);
    widthsChanged();
}

void GridWindow::paint(const Message& message) {
    const Painting painting(hwnd(), message);
    const RECT& stale = painting.place();
    if (IsRectEmpty(&stale)) return;
    const Buffer buffer(painting.dc(), stale);
    fill(buffer.dc(), stale, systemColour(COLOR_BTNFACE));
    const RECT inside = area();
    const auto paintRow = [&](std::int32_t row) {
        paintCell(buffer.dc(), row, 0);
        for (std::int32_t col = mLeftCol; col < mCells.cols(); ++col) {
            const RECT place = cellPlace(row, col);
            if (place.left >= inside.right) break;
            paintCell(buffer.dc(), row, col);
        }
    };
    paintRow(0);
    for (std::int32_t row = mTopRow; row < mCells.rows(); ++row) {
        if (mRowHeight * (1 + row - mTopRow) >= inside.bottom) break;
        paintRow(row);
    }
    if (mGap > 0) {
        const RECT place = mGap < mCells.cols() ? cellPlace(0, mGap) : RECT{};
        const int at = mGap < mCells.cols() ? place.left : cellPlace(0, mGap - 1).right;
        fill(buffer.dc(), {at - 2, 0, at + 2, mRowHeight}, systemColour(COLOR_HIGHLIGHT));
    }
}

/// A sort order that has no room for its word is an arrow.
String GridWindow::shownText(std::int32_t row, const String& text, int room) const {
    constexpr std::int32_t sortRow = 2;
    const Words& words = surroundings().words;
    const bool ascending = text == words.Ascending;
    if (row != sortRow || (!ascending && text != words.Descending)) return text;
    if (surroundings().fonts.widthOf(fontHandle(), text) <= room) return text;
    return ascending ? u"\u25B2" : u"\u25BC";
}

/// A text that is a little too wide takes of its margins: on another monitor letters are not as
/// wide to the pixel as on the one where the column was made to fit them.
int GridWindow::marginIn(const RECT& place, const String& text) const {
    const Scale& scale = surroundings().scale;
    const int spare = widthOf(place) - surroundings().fonts.widthOf(fontHandle(), text);
    return std::clamp(spare / 2, scale.pixels(1), scale.pixels(cellMargin));
}

void GridWindow::paintCell(HDC dc, std::int32_t row, std::int32_t col) const {
    const RECT place = cellPlace(row, col);
    RECT seen{};
    RECT clip{};
    GetClipBox(dc, &clip);
    if (!IntersectRect(&seen, &place, &clip)) return;
    const bool fixed = row == 0 || col == 0;
    const GridCells::Cell& cell = mCells.cell(row, col);
    const COLORREF ground = systemColour(fixed ? COLOR_BTNFACE : COLOR_WINDOW);
    const COLORREF text = systemColour(fixed ? COLOR_BTNTEXT : COLOR_WINDOWTEXT);
    fill(dc, place, ground);
    const COLORREF rule = mixed(ground, text, fixed ? 0.3 : 0.18);
    fill(dc, {place.right - 1, place.top, place.right, place.bottom}, rule);
    fill(dc, {place.left, place.bottom - 1, place.right, place.bottom}, rule);
    const int margin = marginIn(place, cell.text);
    const RECT inside = within(place, margin, 0, margin, 1);
    // 0 to 2 are on the left, 3 to 5 in the middle, 6 to 8 on the right; 9 goes by the text.
    const int third = cell.alignment / 3;
    const UINT format = third == 1 ? DT_CENTER : third == 2 ? DT_RIGHT : DT_LEFT;
    const bool offers = row == 0 && col > 0 && cell.text.empty() && col == offeredColumn();
    if (offers)
        write(dc, surroundings().words.AddField, inside, fontHandle(), mixed(ground, text, 0.65),
              DT_CENTER);
    else if (!cell.text.empty())
        write(dc, shownText(row, cell.text, widthOf(inside)), inside, fontHandle(), text,
              row == 0 && col > 0 ? DT_CENTER : format);
    if (!cell.note.empty()) {
        const int width = std::clamp(surroundings().fonts.widthOf(fontHandle(), cell.text), 16,
                                     std::max(16, widthOf(inside)));
        for (int x = inside.left; x < inside.left + width; x += 4) {
            line(dc, {x, inside.bottom - 2}, {x + 2, inside.bottom - 4}, RGB(200, 30, 30), 1);
            line(dc, {x + 2, inside.bottom - 4}, {x + 4, inside.bottom - 2}, RGB(200, 30, 30), 1);
        }
    }
    if (row != mRow || col != mCol || col == 0) return;
    const COLORREF highlight = systemColour(COLOR_HIGHLIGHT);
    if (GetFocus() == hwnd())
        frame(dc, place, highlight, 2);
    else
        frame(dc, place, mixed(ground, highlight, 0.6));
}

LRESULT GridWindow::handle(const Message& message) {
    if (isPress(message.id)) return press(message), 0;
    if (isRelease(message.id)) return release(message), 0;
    switch (message.id) {
    case WM_ERASEBKGND: return 1;
    case WM_PRINTCLIENT:
    case WM_PAINT: paint(message); return 0;
    case WM_SIZE: showRanges(); return 0;
    case WM_SHOWWINDOW: showRanges(); break;
    case WM_HSCROLL:
    case WM_VSCROLL: scrolledByBar(message); return 0;
    case WM_MOUSEWHEEL: {
        const int way = GET_WHEEL_DELTA_WPARAM(message.w) > 0 ? -1 : 1;
        if (GET_KEYSTATE_WPARAM(message.w) & MK_SHIFT)
            scrollTo(mTopRow, mLeftCol + way);
        else
            scrollTo(mTopRow + way, mLeftCol);
        return 0;
    }
    case WM_SETFOCUS: tellReader(*this); [[fallthrough]];
    case WM_KILLFOCUS: repaint(); return 0;
    case WM_SETCURSOR: {
        POINT at{};
        GetCursorPos(&at);
        ScreenToClient(hwnd(), &at);
        if (LOWORD(message.l) != HTCLIENT || !mGestures.borderAt(at)) break;
        SetCursor(LoadCursorW(nullptr, reinterpret_cast<const wchar_t*>(IDC_SIZEWE)));
        return TRUE;
    }
    case WM_MOUSEMOVE:
        mGestures.moved(message);
        if (isAlive() && buttonsOf(message.w) == 0) hint(message.at());
        return 0;
    case WM_CAPTURECHANGED:
        if (reinterpret_cast<HWND>(message.l) == hwnd()) return 0;
        mGestures.cancel();
        // A press may have opened an editor with a list.
        if (auto* const list = dynamic_cast<ChoiceWindow*>(of(GetFocus()))) list->dropIfWanted();
        return 0;
    case WM_CONTEXTMENU:
        // The mouse opens the menu on release; the menu key has no release of its own.
        if (message.l == -1) openMenu();
        return 0;
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
        if (keyPressed(message)) return 0;
        break;
    case WM_CHAR:
        if (typed(static_cast<char16_t>(message.w))) return 0;
        break;
    default: break;
    }
    return Window::handle(message);
}

void GridWindow::tell(const platform::MouseEvent& event, std::int16_t button, std::int16_t shift,
                      POINT at) const {
    const Scale& scale = surroundings().scale;
    // A copy: what it does may end the grid.
    if (const platform::MouseEvent told = event)
        told(button, shift, scale.toTwips(at.x), scale.toTwips(at.y));
}

void GridWindow::press(const Message& message) {
    surroundings().hints.leave(*this);
    const POINT at = message.at();
    const std::int16_t button = buttonOf(message.id);
    if (GetFocus() != hwnd()) SetFocus(hwnd());
    if (!isAlive()) return;
    SetCapture(hwnd());
    const auto [row, col] = cellAt(at);
    if (button == leftButton && row > 0 && col > 0) setCurrent(row, col);
    const std::int32_t border =
        message.id == WM_LBUTTONDBLCLK ? mGestures.borderAt(at) : std::int32_t{0};
    mGestures.pressed(message);
    const Scale& scale = surroundings().scale;
    if (!surroundings().comforts.gridPressed(button, scale.toTwips(at.x), scale.toTwips(at.y)) &&
        isAlive())
        tell(mEvents.MouseDown, button, shiftState(message.w), at);
    if (!isAlive() || border == 0) return;
    mGestures.cancel();
    surroundings().comforts.borderDoubleClicked(border);
}

void GridWindow::release(const Message& message) {
    // Before what it does takes the mouse away from here.
    FieldGestures gestures = mGestures;
    if (GetCapture() == hwnd() && buttonsOf(message.w) == 0) ReleaseCapture();
    tell(mEvents.MouseUp, buttonOf(message.id), shiftState(message.w), message.at());
    if (isAlive()) gestures.released(message);
}

bool GridWindow::keyPressed(const Message& message) {
    auto& comforts = surroundings().comforts;
    const std::int16_t shift = shiftState();
    constexpr std::int16_t alt = 4;
    if (shift == alt && (message.w == VK_LEFT || message.w == VK_RIGHT))
        return comforts.currentColumnMoved(message.w == VK_LEFT ? -1 : 1);
    if (message.id == WM_SYSKEYDOWN) return false;
    switch (message.w) {
    case VK_DELETE:
        if (shift != 0) return false;
        middleOfCurrent();
        surroundings().menu.choose(menuentry::deleteColumn, [this] { clickWithRightButton(); });
        return true;
    case VK_ESCAPE: return mGestures.cancel();
    case VK_F2:
    case VK_RETURN: openEditor(); return true;
    default: return walk(message.w);
    }
}

void GridWindow::walkTo(std::int32_t row, std::int32_t col) {
    setCurrent(std::clamp(row, std::int32_t{0}, mCells.rows() - 1),
               std::clamp(col, std::int32_t{1}, mCells.cols() - 1));
    showCurrent();
}

bool GridWindow::walk(WPARAM key) {
    const bool control = shiftState() & 2;
    const std::int32_t first = mRow == 0 || (mRow == 1 && offersFields()) ? 0 : 1;
    const std::int32_t last = mCells.rows() - 1;
    switch (key) {
    case VK_UP: walkTo(std::max(mRow - 1, first), mCol); return true;
    case VK_DOWN: walkTo(mRow + 1, mCol); return true;
    case VK_LEFT: walkTo(mRow, mCol - 1); return true;
    case VK_RIGHT: walkTo(mRow, mCol + 1); return true;
    case VK_PRIOR:
        walkTo(std::max(mRow - rowsInView(), std::min<std::int32_t>(mRow, 1)), mCol);
        return true;
    case VK_NEXT: walkTo(std::min(mRow + rowsInView(), last), mCol); return true;
    case VK_HOME: walkTo(control ? 1 : mRow, 1); return true;
    case VK_END: walkTo(control ? last : mRow, mCells.cols() - 1); return true;
    default: return false;
    }
}

bool GridWindow::typed(char16_t unit) {
    constexpr char16_t firstPrintable = 0x20;
    if (unit < firstPrintable || unit == 0x7F) return false;
    mTyped += unit;
    // The first half of a letter waits for the second.
    if (unit >= 0xD800 && unit < 0xDC00) return true;
    const auto around = shared_from_this();
    const bool used = surroundings().comforts.cellTyped(std::exchange(mTyped, {}));
    // A list that has opened looks for an item that begins so.
    wchar_t kind[16] = {};
    const HWND focus = GetFocus();
    if (used && focus && focus != hwnd() && GetClassNameW(focus, kind, 16) &&
        lstrcmpiW(kind, L"COMBOBOX") == 0)
        PostMessageW(focus, WM_CHAR, unit, 0);
    return used;
}

String GridWindow::titleOfCurrent() const {
    return comforts::titleOfCell(
        surroundings().words,
        [this](std::int32_t row, std::int32_t col) { return mCells.cell(row, col).text; }, mRow,
        mCol);
}

void GridWindow::openEditor() {
    if (surroundings().comforts.cellOpened() || !isAlive()) return;
    const POINT at = middleOfCurrent();
    const Scale& scale = surroundings().scale;
    if (!surroundings().comforts.gridPressed(leftButton, scale.toTwips(at.x),
                                             scale.toTwips(at.y)) &&
        isAlive())
        tell(mEvents.MouseDown, leftButton, 0, at);
    if (isAlive()) tell(mEvents.MouseUp, leftButton, 0, at);
}

POINT GridWindow::middleOfCurrent() {
    showCurrent();
    return middleOf(cellPlace(mRow, mCol));
}

void GridWindow::clickWithRightButton() {
    const POINT at = middleOf(cellPlace(mRow, mCol));
    tell(mEvents.MouseDown, rightButton, 0, at);
    if (isAlive()) tell(mEvents.MouseUp, rightButton, 0, at);
}

void GridWindow::openMenu() {
    POINT at = middleOfCurrent();
    ClientToScreen(hwnd(), &at);
    surroundings().menu.openAt(at, [this] { clickWithRightButton(); });
}

void GridWindow::hint(POINT at) const {
    const auto [row, col] = cellAt(at);
    if (row < 0 || col < 0) return surroundings().hints.leave(*this);
    const GridCells::Cell& cell = mCells.cell(row, col);
    const RECT place = cellPlace(row, col);
    const bool cut = surroundings().fonts.widthOf(fontHandle(), cell.text) >
                     widthOf(place) - 2 * marginIn(place, cell.text);
    surroundings().hints.over(*this, place,
                              !cell.note.empty() ? cell.note
                              : cut              ? cell.text
                                                 : String());
}

bool GridWindow::draggedOver(POINT, DragState) { return true; }

void GridWindow::dropped(POINT at) {
    const Scale& scale = surroundings().scale;
    if (const auto dropped = mEvents.DragDrop)
        dropped(surroundings().drags.source(), scale.toTwips(at.x), scale.toTwips(at.y));
}

bool GridWindow::scrollUnderDrag(POINT at) {
    const int edge = surroundings().scale.pixels(20);
    const std::int32_t before = mLeftCol;
    if (at.x >= area().right - edge) scrollTo(mTopRow, mLeftCol + 1);
    if (isAlive() && at.x >= columnWidth(0) && at.x < columnWidth(0) + edge)
        scrollTo(mTopRow, mLeftCol - 1);
    return mLeftCol != before;
}

} // namespace zandor::platform::windows
