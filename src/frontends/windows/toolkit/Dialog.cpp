#include "frontends/windows/toolkit/Dialog.h"

#include "frontends/windows/toolkit/Buttons.h"
#include "frontends/windows/toolkit/Drawing.h"
#include "frontends/windows/toolkit/Inputs.h"
#include "frontends/windows/toolkit/Modal.h"
#include "frontends/windows/toolkit/Text.h"

#include <algorithm>
#include <new>
#include <utility>

namespace zandor::platform::windows {

namespace {

constexpr int firstButton = 100;     ///< numbers of the buttons, apart from the system's own
constexpr int narrowestDialog = 380; ///< of what is inside the dialog, logical pixels
constexpr int margin = 11;
constexpr int rowGap = 7;

/// A dialog without anything in it, as the system reads it.
struct EmptyTemplate {
    alignas(4) DLGTEMPLATE dialog{};
    WORD menu = 0, windowClass = 0, title = 0;
};

INT_PTR CALLBACK leaveAll(HWND, UINT, WPARAM, LPARAM) { return FALSE; }

} // namespace

FormWindow::FormWindow(std::shared_ptr<Surroundings> around, HWND owner, const String& caption,
                       DialogEvents events)
    : Window(std::move(around)), mEvents(std::move(events)) {
    EmptyTemplate empty;
    empty.dialog.style = WS_POPUP | WS_CAPTION | WS_SYSMENU | DS_MODALFRAME;
    const HWND made =
        CreateDialogIndirectParamW(GetModuleHandleW(nullptr), &empty.dialog, owner, &leaveAll, 0);
    if (!made) throw std::bad_alloc();
    adopt(made);
    SetWindowTextW(made, wide(caption));
}

void FormWindow::forget() {
    mEvents = {};
    mSentence = nullptr;
    hide();
}

void FormWindow::add(Window& child) {
    child.beLaidOut();
    if (dynamic_cast<ButtonWindow*>(&child)) {
        // Enter presses the default one by its number.
        SetWindowLongPtrW(child.hwnd(), GWLP_ID,
                          firstButton + static_cast<LONG_PTR>(mButtons.size()));
        SetWindowLongPtrW(child.hwnd(), GWL_STYLE,
                          GetWindowLongPtrW(child.hwnd(), GWL_STYLE) | WS_TABSTOP);
        mButtons.push_back(child.weak_from_this());
    } else if (dynamic_cast<LabelWindow*>(&child)) {
        mLabels.push_back(child.weak_from_this());
    } else {
        mFields.push_back(child.weak_from_this());
        if (auto* const list = dynamic_cast<ChoiceWindow*>(&child))
            list->setListener([this] { say(); });
    }
    // The way of Tab is that of their making.
    SetWindowPos(child.hwnd(), HWND_BOTTOM, 0, 0, 0, 0, SWP_NOMOVE | SWP_NOSIZE | SWP_NOACTIVATE);
}

Window* FormWindow::child(StringView name) const {
    for (const auto* list : {&mLabels, &mFields, &mButtons})
        for (const auto& one : *list)
            if (const auto held = one.lock(); held && held->name() == name) return held.get();
    return nullptr;
}

void FormWindow::layOut() {
    const Scale& scale = surroundings().scale;
    const int around = scale.pixels(margin);
    const int between = scale.pixels(rowGap);
    int labelWidth = 0;
    int fieldWidth = 0;
    int buttonsWidth = 0;
    for (const auto& one : mLabels)
        if (const auto held = one.lock()) labelWidth = std::max<int>(labelWidth, held->wanted().cx);
    for (const auto& one : mFields)
        if (const auto held = one.lock()) fieldWidth = std::max<int>(fieldWidth, held->wanted().cx);
    for (const auto& one : mButtons)
        if (const auto held = one.lock())
            buttonsWidth += std::max<int>(held->wanted().cx, scale.pixels(75)) + between;
    const int width =
        std::max({scale.pixels(narrowestDialog), labelWidth + between + fieldWidth, buttonsWidth});
    fieldWidth = width - labelWidth - between;
    int top = around;
    for (std::size_t row = 0; row < std::max(mLabels.size(), mFields.size()); ++row) {
        const auto label = row < mLabels.size() ? mLabels[row].lock() : nullptr;
        const auto field = row < mFields.size() ? mFields[row].lock() : nullptr;
        const SIZE text = label ? label->wanted() : SIZE{};
        const SIZE input = field ? field->wanted() : SIZE{};
        const int height = std::max<int>(text.cy, input.cy);
        if (label) {
            const int down = top + (height - text.cy) / 2;
            label->place({around, down, around + labelWidth, down + text.cy});
        }
        const int left = around + labelWidth + between;
        if (field) field->place({left, top, left + fieldWidth, top + input.cy});
        top += height + between;
    }
    if (mSentence) {
        if (!mSentencePlace)
            mSentencePlace =
                CreateWindowExW(0, L"STATIC", L"", WS_CHILD | WS_VISIBLE | SS_LEFT | SS_NOPREFIX, 0,
                                0, 0, 0, hwnd(), nullptr, nullptr, nullptr);
        SendMessageW(mSentencePlace, WM_SETFONT, reinterpret_cast<WPARAM>(fontHandle()), FALSE);
        const int height = 2 * surroundings().fonts.heightOf(fontHandle());
        SetWindowPos(mSentencePlace, nullptr, around, top, width, height, SWP_NOZORDER);
        top += height + between;
    }
    int left = around + width - buttonsWidth + between;
    int lowest = top;
    for (const auto& one : mButtons)
        if (const auto held = one.lock()) {
            const SIZE size = held->wanted();
            const int wide = std::max<int>(size.cx, scale.pixels(75));
            held->place({left, top + between, left + wide, top + between + size.cy});
            lowest = std::max<int>(lowest, top + between + size.cy);
            left += wide + between;
        }
    RECT whole{0, 0, width + 2 * around, lowest + around};
    AdjustWindowRectEx(&whole, static_cast<DWORD>(GetWindowLongW(hwnd(), GWL_STYLE)), FALSE,
                       static_cast<DWORD>(GetWindowLongW(hwnd(), GWL_EXSTYLE)));
    RECT host{};
    const HWND owner = GetWindow(hwnd(), GW_OWNER);
    GetWindowRect(owner ? owner : GetDesktopWindow(), &host);
    const POINT middle = middleOf(host);
    const int x = std::max(0L, middle.x - widthOf(whole) / 2);
    const int y = std::max(0L, middle.y - heightOf(whole) / 2);
    place({x, y, x + widthOf(whole), y + heightOf(whole)});
}

void FormWindow::say() {
    if (mSentence && mSentencePlace && isAlive())
        SetWindowTextW(mSentencePlace, wide(mSentence(*this)));
}

/// What can be changed, or else the button that Enter presses.
void FormWindow::focusFirst() const {
    for (const auto& one : mFields) {
        const auto held = one.lock();
        const auto* const list = dynamic_cast<const ChoiceWindow*>(held.get());
        if (list && list->isEnabled()) return void(SetFocus(list->hwnd()));
    }
    for (const auto& one : mButtons) {
        const auto held = one.lock();
        const auto* const button = dynamic_cast<const ButtonWindow*>(held.get());
        if (button && button->isDefault()) return void(SetFocus(button->hwnd()));
    }
}

void FormWindow::enableOthers(bool value) const {
    if (const HWND owner = GetWindow(hwnd(), GW_OWNER)) EnableWindow(owner, value);
}

void FormWindow::showModal() {
    const auto held = shared_from_this();
    const Modal modal(surroundings());
    if (!isAlive()) return;
    layOut();
    for (const auto& one : mButtons) {
        const auto held = one.lock();
        const auto* const button = dynamic_cast<const ButtonWindow*>(held.get());
        if (button && button->isDefault())
            SendMessageW(hwnd(), DM_SETDEFID, static_cast<WPARAM>(GetDlgCtrlID(button->hwnd())), 0);
    }
    mRunning = true;
    enableOthers(false);
    ShowWindow(hwnd(), SW_SHOW);
    say();
    focusFirst();
    MSG message{};
    while (mRunning && hwnd() && GetMessageW(&message, nullptr, 0, 0) > 0)
        if (!IsDialogMessageW(hwnd(), &message)) {
            TranslateMessage(&message);
            DispatchMessageW(&message);
        }
    // Whoever runs the outer loop has to hear of it.
    if (message.message == WM_QUIT) PostQuitMessage(static_cast<int>(message.wParam));
    hide();
    surroundings().focus.restore();
}

void FormWindow::hide() {
    if (!std::exchange(mRunning, false) || !hwnd()) return;
    // First, or the system would make another program's window the active one.
    enableOthers(true);
    ShowWindow(hwnd(), SW_HIDE);
    PostMessageW(hwnd(), WM_NULL, 0, 0); // has the loop look
}

LRESULT FormWindow::handle(const Message& message) {
    const bool cancelled = message.id == WM_COMMAND && LOWORD(message.w) == IDCANCEL;
    if (cancelled || message.id == WM_CLOSE) {
        // A copy: what it does may end the dialog.
        if (const PlainEvent close = mEvents.Close) close();
        hide();
        return 0;
    }
    return Window::handle(message);
}

void Dialog::Caption(const String& value) { SetWindowTextW(mWindow->hwnd(), wide(value)); }

void Dialog::ShowModal() { mWindow->showModal(); }

} // namespace zandor::platform::windows
