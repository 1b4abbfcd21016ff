#include "frontends/windows/toolkit/PickList.h"

#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr int mostRows = 12;
constexpr int fewestRows = 4;
constexpr int narrowestList = 220; // logical pixels
constexpr int widestList = 420;
constexpr int listBorder = 2;

String folded(String text) {
    CharLowerBuffW(reinterpret_cast<wchar_t*>(text.data()), static_cast<DWORD>(text.size()));
    return text;
}

std::vector<String> wordsOf(const String& text) {
    std::vector<String> words;
    String word;
    for (const char16_t letter : text + u' ')
        if (letter != u' ')
            word += letter;
        else if (!word.empty())
            words.push_back(std::exchange(word, {}));
    return words;
}

} // namespace

/// The box: its keys walk the list, too.
class PickBox final : public Window {
public:
    PickBox(std::shared_ptr<Surroundings> around, PickWindow& pick)
        : Window(std::move(around)), mPick(pick) {
        createNative(L"EDIT", pick.hwnd(), WS_CHILD | WS_VISIBLE | ES_AUTOHSCROLL);
    }
    bool hasUseFor(WPARAM key, std::int16_t shift) const override {
        return hasUseAsEditor(key, shift) || Window::hasUseFor(key, shift);
    }

    std::optional<LRESULT> told(const Message& message) override {
        if (message.id != WM_COMMAND || HIWORD(message.w) != EN_CHANGE) return {};
        mPick.textChanged();
        return 0;
    }

protected:
    LRESULT handle(const Message& message) override {
        if (message.id == WM_KEYDOWN && mPick.keyPressed(message.w)) return 0;
        if (message.id == WM_CHAR &&
            (message.w == VK_RETURN || message.w == VK_ESCAPE || message.w == VK_TAB))
            return 0;
        if (message.id == WM_KILLFOCUS) {
            const LRESULT result = passOn(message);
            const HWND to = reinterpret_cast<HWND>(message.w);
            if (isAlive() && to && GetAncestor(to, GA_ROOT) == GetAncestor(hwnd(), GA_ROOT))
                mPick.boxLeft();
            return result;
        }
        return Window::handle(message);
    }

private:
    PickWindow& mPick; // outlives it
};

/// The list: the keys stay with the box.
class PickItems final : public Window {
public:
    PickItems(std::shared_ptr<Surroundings> around, PickWindow& pick)
        : Window(std::move(around)), mPick(pick) {
        createNative(L"LISTBOX", pick.hwnd(),
                     WS_CHILD | WS_VISIBLE | WS_VSCROLL | LBS_NOINTEGRALHEIGHT | LBS_HASSTRINGS);
    }

protected:
    LRESULT handle(const Message& message) override {
        switch (message.id) {
        case WM_LBUTTONDOWN:
        case WM_LBUTTONDBLCLK: return 0;
        case WM_MOUSEACTIVATE: return MA_NOACTIVATE;
        case WM_LBUTTONUP: {
            const LRESULT at = SendMessageW(hwnd(), LB_ITEMFROMPOINT, 0, message.l);
            if (HIWORD(at) == 0) mPick.pickAt(LOWORD(at));
            return 0;
        }
        default: return Window::handle(message);
        }
    }

private:
    PickWindow& mPick; // outlives it
};

PickWindow::PickWindow(std::shared_ptr<Surroundings> around, HWND parent, PickListEvents events)
    : Window(around), mEvents(std::move(events)) {
    create(parent, WS_CHILD | WS_CLIPCHILDREN | WS_CLIPSIBLINGS);
    mBox = std::make_shared<PickBox>(around, *this);
    mList = std::make_shared<PickItems>(std::move(around), *this);
    fontChanged();
}

void PickWindow::forget() {
    mEvents = {};
    mBox->end();
    mList->end();
}

Window& PickWindow::box() const { return *mBox; }

HWND PickWindow::list() const { return mList->hwnd(); }

void PickWindow::fontChanged() {
    if (!mBox || !mList) return;
    const std::optional<Font> own = hasOwnFont() ? std::optional(font()) : std::nullopt;
    mBox->setFont(own);
    mList->setFont(own);
    arrange();
}

int PickWindow::boxHeight() const {
    return surroundings().fonts.heightOf(fontHandle()) + surroundings().scale.pixels(6);
}

int PickWindow::rowHeight() const {
    return std::max<int>(1, static_cast<int>(SendMessageW(list(), LB_GETITEMHEIGHT, 0, 0)));
}

int PickWindow::current() const {
    return static_cast<int>(SendMessageW(list(), LB_GETCURSEL, 0, 0));
}

void PickWindow::setCurrent(int row) {
    SendMessageW(list(), LB_SETCURSEL, static_cast<WPARAM>(row), 0);
}

String PickWindow::typed() const { return textOf(mBox->hwnd()); }

std::vector<String> PickWindow::left() const {
    std::vector<String> items;
    for (const int position : mLeft) items.push_back(mItems[static_cast<std::size_t>(position)]);
    return items;
}

void PickWindow::open(const RECT& over, std::vector<String> items, const String& typed,
                      int position) {
    mItems = std::move(items);
    mFilling = true;
    SetWindowTextW(mBox->hwnd(), wide(typed));
    mFilling = false;
    SendMessageW(mBox->hwnd(), EM_SETSEL, typed.size(), static_cast<LPARAM>(typed.size()));
    filter();
    stand(over);
    show(true);
    raise();
    const auto at = std::ranges::find(mLeft, position);
    if (at == mLeft.end()) return chooseFirst();
    setCurrent(static_cast<int>(at - mLeft.begin()));
}

void PickWindow::close() { show(false); }

/// Below the upper edge of a place, as high as the items need and the surface has room for.
void PickWindow::stand(const RECT& over) {
    const Scale& scale = surroundings().scale;
    const int edge = scale.pixels(listBorder);
    const auto height = [&](int rows) { return boxHeight() + rows * rowHeight() + 2 * edge; };
    RECT surface{};
    GetClientRect(GetParent(hwnd()), &surface);
    const int room = surface.bottom - over.top;
    const int most = std::min<int>(mostRows, std::max<int>(1, static_cast<int>(mItems.size())));
    const int rows = std::clamp((room - height(0)) / rowHeight(), std::min(fewestRows, most), most);
    int wanted = 0;
    for (const String& item : mItems)
        wanted = std::max(wanted, surroundings().fonts.widthOf(fontHandle(), item));
    wanted += systemMetric(SM_CXVSCROLL, scale) + scale.pixels(12);
    const int width = std::max(
        widthOf(over), std::clamp(wanted, scale.pixels(narrowestList), scale.pixels(widestList)));
    const int left = std::clamp<int>(over.left, 0, std::max<int>(0, surface.right - width));
    const int top = std::clamp<int>(over.top, 0, std::max<int>(0, surface.bottom - height(rows)));
    place({left, top, left + width, top + height(rows)});
    arrange();
}

void PickWindow::arrange() {
    const int edge = surroundings().scale.pixels(listBorder);
    const RECT inner = within(area(), edge, edge, edge, edge);
    const int below = inner.top + boxHeight();
    mBox->place({inner.left, inner.top, inner.right, below});
    mList->place({inner.left, below, inner.right, std::max<LONG>(below, inner.bottom)});
}

/// The items that hold every word typed, in whatever order and case.
void PickWindow::filter() {
    std::vector<String> words = wordsOf(folded(typed()));
    mLeft.clear();
    SendMessageW(list(), WM_SETREDRAW, FALSE, 0);
    SendMessageW(list(), LB_RESETCONTENT, 0, 0);
    for (std::size_t i = 0; i < mItems.size(); ++i) {
        const String item = folded(mItems[i]);
        if (!std::ranges::all_of(
                words, [&](const String& word) { return item.find(word) != String::npos; }))
            continue;
        mLeft.push_back(static_cast<int>(i));
        SendMessageW(list(), LB_ADDSTRING, 0, reinterpret_cast<LPARAM>(wide(mItems[i])));
    }
    SendMessageW(list(), WM_SETREDRAW, TRUE, 0);
    InvalidateRect(list(), nullptr, TRUE);
}

/// The first one whose name begins so: what stands behind the table's.
void PickWindow::chooseFirst() {
    const auto words = wordsOf(folded(typed()));
    std::size_t first = 0;
    for (std::size_t row = 0; row < mLeft.size() && !words.empty(); ++row) {
        const String item = folded(mItems[static_cast<std::size_t>(mLeft[row])]);
        const std::size_t dot = item.find(u'.');
        if (dot == String::npos || !StringView(item).substr(dot + 1).starts_with(words.front()))
            continue;
        first = row;
        break;
    }
    setCurrent(mLeft.empty() ? -1 : static_cast<int>(first));
}

void PickWindow::textChanged() {
    if (mFilling) return;
    filter();
    chooseFirst();
}

bool PickWindow::keyPressed(WPARAM key) {
    const auto walk = [this](int by) {
        setCurrent(std::clamp<int>(current() + by, 0,
                                   std::max<int>(0, static_cast<int>(mLeft.size()) - 1)));
        return true;
    };
    const RECT inner = mList->area();
    const int page = std::max(1, heightOf(inner) / rowHeight());
    switch (key) {
    case VK_RETURN: return pickAt(current()), true;
    case VK_TAB:
        if (GetKeyState(VK_SHIFT) < 0) return surroundings().focus.release(*this), close(), true;
        return pickAt(current()), true;
    case VK_ESCAPE: return close(), true;
    case VK_UP: return walk(-1);
    case VK_DOWN: return walk(1);
    case VK_PRIOR: return walk(-page);
    case VK_NEXT: return walk(page);
    default: return false;
    }
}

void PickWindow::pickAt(int row) {
    if (row < 0 || static_cast<std::size_t>(row) >= mLeft.size()) return;
    const int position = mLeft[static_cast<std::size_t>(row)];
    // A copy: closing and what is told may end the list.
    const auto picked = mEvents.Picked;
    close();
    if (picked) picked(position);
}

void PickWindow::boxLeft() {
    if (isShown()) close();
}

LRESULT PickWindow::handle(const Message& message) {
    switch (message.id) {
    case WM_SIZE: arrange(); return 0;
    case WM_ERASEBKGND: return 1;
    case WM_PRINTCLIENT:
    case WM_PAINT: {
        const Painting painting(hwnd(), message);
        fill(painting.dc(), area(), systemColour(COLOR_WINDOW));
        frame(painting.dc(), area(), systemColour(COLOR_HIGHLIGHT));
        return 0;
    }
    default: return Window::handle(message);
    }
}

void PickListPart::Open(const Bounds& over, const std::vector<String>& items, const String& typed,
                        std::int32_t position) {
    mWindow->open(surroundings().scale.toPixels(over), items, typed, position);
    if (IsWindowVisible(mWindow->box().hwnd())) surroundings().focus.take(&mWindow->box());
}

} // namespace zandor::platform::windows
