#include "frontends/windows/toolkit/Inputs.h"

#include "frontends/windows/toolkit/Frames.h"
#include "frontends/windows/toolkit/Text.h"

#include <Zandor/platform/RuntimeError.h>

#include <algorithm>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr UINT dropMessage = WM_APP + 1;
constexpr int mostDropped = 12;

} // namespace

LRESULT Input::handle(const Message& message) {
    // In a dialog, Enter, Escape and Tab are the dialog's.
    if (isInDialog()) return Window::handle(message);
    if (message.id == WM_KEYDOWN || message.id == WM_SYSKEYDOWN)
        if (keyPressed(message)) return 0;
    // What those keys would type.
    if (message.id == WM_CHAR &&
        (message.w == VK_RETURN || message.w == VK_ESCAPE || message.w == VK_TAB))
        return 0;
    return isAlive() ? Window::handle(message) : 0;
}

bool Input::keyPressed(const Message& message) {
    const WPARAM key = message.w;
    if (keyInList(key)) return true;
    const std::int16_t shift = shiftState();
    const auto [atStart, atEnd] = caret();
    if (surroundings().comforts.editorKey(static_cast<std::int16_t>(key), shift, atStart, atEnd))
        return true;
    report(key, shift);
    if (!isAlive()) return true;
    if (key == VK_RETURN)
        if (auto* const row = dynamic_cast<RowWindow*>(of(GetParent(hwnd())))) row->pressDefault();
    return key == VK_RETURN || key == VK_ESCAPE;
}

void Input::report(WPARAM key, std::int16_t shift) {
    // A copy: what it does may end the input.
    if (const KeyEvent down = mKeyDown) down(static_cast<std::int16_t>(key), shift);
}

ChoiceWindow::ChoiceWindow(std::shared_ptr<Surroundings> around, HWND parent,
                           const std::vector<String>& items, KeyEvent KeyDown)
    : Input(std::move(around), std::move(KeyDown)) {
    createNative(L"COMBOBOX", parent,
                 WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS | WS_VSCROLL | WS_TABSTOP |
                     CBS_DROPDOWNLIST | CBS_HASSTRINGS);
    for (const String& item : items) add(item);
}

void ChoiceWindow::forget() {
    Input::forget();
    mChanged = nullptr;
}

int ChoiceWindow::count() const {
    return static_cast<int>(SendMessageW(hwnd(), CB_GETCOUNT, 0, 0));
}

int ChoiceWindow::chosen() const {
    return hwnd() ? static_cast<int>(SendMessageW(hwnd(), CB_GETCURSEL, 0, 0)) : -1;
}

void ChoiceWindow::choose(int index) {
    SendMessageW(hwnd(), CB_SETCURSEL, static_cast<WPARAM>(index), 0);
}

void ChoiceWindow::clear() {
    SendMessageW(hwnd(), CB_RESETCONTENT, 0, 0);
    mWidest = 0;
}

void ChoiceWindow::add(const String& item) {
    SendMessageW(hwnd(), CB_ADDSTRING, 0, reinterpret_cast<LPARAM>(wide(item)));
    mWidest = std::max(mWidest, surroundings().fonts.widthOf(fontHandle(), item));
    if (auto* const row = dynamic_cast<RowWindow*>(of(GetParent(hwnd())))) row->arrange();
}

/// To the system, the height that a box is given is that of the list that drops down from it, too.
void ChoiceWindow::fitList() const {
    RECT place{};
    GetWindowRect(hwnd(), &place);
    const int row = static_cast<int>(SendMessageW(hwnd(), CB_GETITEMHEIGHT, 0, 0));
    const int list = 2 + row * std::clamp(count(), 1, mostDropped);
    SetWindowPos(hwnd(), nullptr, 0, 0, place.right - place.left, place.bottom - place.top + list,
                 SWP_NOMOVE | SWP_NOZORDER | SWP_NOACTIVATE);
}

String ChoiceWindow::item(int index) const {
    const auto at = static_cast<WPARAM>(index);
    const LRESULT length = SendMessageW(hwnd(), CB_GETLBTEXTLEN, at, 0);
    if (length < 0) return {};
    String text(static_cast<std::size_t>(length) + 1, u'\0');
    SendMessageW(hwnd(), CB_GETLBTEXT, at, reinterpret_cast<LPARAM>(text.data()));
    text.pop_back();
    return text;
}

bool ChoiceWindow::isDropped() const {
    return hwnd() && SendMessageW(hwnd(), CB_GETDROPPEDSTATE, 0, 0) != 0;
}

void ChoiceWindow::dropDown() {
    mDrops = true;
    dropIfWanted();
}

void ChoiceWindow::dropIfWanted() {
    if (mDrops && hwnd()) PostMessageW(hwnd(), dropMessage, 0, 0);
}

void ChoiceWindow::drop() {
    if (!mDrops) return;
    // The release of the press that has opened the box would choose from the list; the grid says
    // when that has come.
    if (GetCapture()) return;
    mDrops = false;
    if (!IsWindowVisible(hwnd()) || GetFocus() != hwnd()) return;
    SendMessageW(hwnd(), CB_SHOWDROPDOWN, TRUE, 0);
    mDroppedItself = true;
}

LRESULT ChoiceWindow::handle(const Message& message) {
    switch (message.id) {
    case dropMessage: drop(); return 0;
    case WM_SHOWWINDOW:
        if (message.w) break;
        mDrops = mDroppedItself = false;
        SendMessageW(hwnd(), CB_SHOWDROPDOWN, FALSE, 0);
        break;
    case WM_KEYDOWN:
    case WM_SYSKEYDOWN:
    case WM_CHAR:
    case WM_MOUSEWHEEL: {
        const bool before = std::exchange(mWalking, true);
        const LRESULT result = Input::handle(message);
        mWalking = before;
        return result;
    }
    default: break;
    }
    return Input::handle(message);
}

/// The keys that close a list together with its box.
bool ChoiceWindow::keyInList(WPARAM key) {
    if (!isDropped()) return false;
    const bool itself = std::exchange(mDroppedItself, false);
    if (!itself || (key != VK_RETURN && key != VK_ESCAPE && key != VK_TAB)) {
        mDroppedItself = itself;
        return false;
    }
    const int chosen = this->chosen();
    SendMessageW(hwnd(), CB_SHOWDROPDOWN, FALSE, 0);
    if (key == VK_ESCAPE) return false;
    // The system may take the choice back where the list is closed by others.
    choose(chosen);
    if (key == VK_RETURN) surroundings().comforts.choiceMade();
    return key == VK_RETURN;
}

std::optional<LRESULT> ChoiceWindow::told(const Message& message) {
    if (message.id != WM_COMMAND) return {};
    const UINT code = HIWORD(message.w);
    if (code == CBN_DROPDOWN) fitList();
    if (code == CBN_CLOSEUP) mDroppedItself = false;
    if (code == CBN_SELCHANGE)
        if (const PlainEvent changed = mChanged) changed();
    if (code == CBN_SELENDOK && !mWalking && isAlive() && surroundings().holds(hwnd()))
        surroundings().comforts.choiceMade();
    return 0;
}

SIZE ChoiceWindow::wanted() const {
    const Scale& scale = surroundings().scale;
    RECT place{};
    GetWindowRect(hwnd(), &place);
    return {mWidest + systemMetric(SM_CXVSCROLL, scale) + scale.pixels(16),
            place.bottom - place.top};
}

std::int16_t ComboBox::ListIndex() const { return static_cast<std::int16_t>(mWindow->chosen()); }

void ComboBox::ListIndex(std::int16_t value) {
    if (value < -1 || value >= mWindow->count()) throw errors::invalidPropertyValue();
    mWindow->choose(value);
}

String ComboBox::Text() const {
    const int chosen = mWindow->chosen();
    return chosen < 0 ? String() : mWindow->item(chosen);
}

TextWindow::TextWindow(std::shared_ptr<Surroundings> around, HWND parent, bool readOnly,
                       KeyEvent KeyDown)
    : Input(std::move(around), std::move(KeyDown)), mReadOnly(readOnly) {
    createNative(L"EDIT", parent,
                 WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS | WS_TABSTOP | ES_AUTOHSCROLL |
                     (readOnly ? ES_READONLY : 0),
                 WS_EX_CLIENTEDGE);
    // A text ends where the user ends it.
    SendMessageW(hwnd(), EM_SETLIMITTEXT, 0x7FFFFFFE, 0);
}

SIZE TextWindow::wanted() const {
    const Scale& scale = surroundings().scale;
    const int height = surroundings().fonts.heightOf(fontHandle()) + scale.pixels(8);
    if (!mReadOnly) return {scale.pixels(180), height};
    constexpr int longest = 300; // logical pixels; what is longer scrolls
    const int text = surroundings().fonts.widthOf(fontHandle(), textOf(hwnd())) + scale.pixels(12);
    return {std::min(text, scale.pixels(longest)), height};
}

std::pair<bool, bool> TextWindow::caret() const {
    DWORD from = 0;
    DWORD to = 0;
    SendMessageW(hwnd(), EM_GETSEL, reinterpret_cast<WPARAM>(&from), reinterpret_cast<LPARAM>(&to));
    if (from != to) return {false, false};
    return {from == 0, static_cast<int>(to) == GetWindowTextLengthW(hwnd())};
}

String TextBox::Text() const { return mWindow->hwnd() ? textOf(mWindow->hwnd()) : String(); }

void TextBox::Text(const String& value) { SetWindowTextW(mWindow->hwnd(), wide(value)); }

void TextBox::SetFocus() {
    surroundings().focus.take(mWindow.get());
    SendMessageW(mWindow->hwnd(), EM_SETSEL, 0, -1);
}

LabelWindow::LabelWindow(std::shared_ptr<Surroundings> around, HWND parent, const String& caption)
    : Window(std::move(around)) {
    createNative(L"STATIC", parent, WS_CHILD | WS_VISIBLE | WS_CLIPSIBLINGS | SS_LEFT, 0, caption);
}

void LabelWindow::setCaption(const String& caption) { SetWindowTextW(hwnd(), wide(caption)); }

SIZE LabelWindow::wanted() const {
    return {surroundings().fonts.widthOf(fontHandle(), textOf(hwnd())),
            surroundings().fonts.heightOf(fontHandle())};
}

} // namespace zandor::platform::windows
