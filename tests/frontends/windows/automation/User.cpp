#include "User.h"

#include "writeBitmap.h"

#include <gtest/gtest.h>

#include <cstdlib>
#include <thread>

namespace {

constexpr UINT question = WM_APP + 11;

void send(INPUT input) { SendInput(1, &input, sizeof input); }

void sendKey(WORD code, WORD unit, DWORD flags) {
    INPUT input{};
    input.type = INPUT_KEYBOARD;
    input.ki.wVk = code;
    input.ki.wScan = unit;
    input.ki.dwFlags = flags;
    send(input);
}

/// What the mouse does, and where: what else the screen has to say may move it meanwhile.
void sendMouse(POINT at, DWORD flags = 0) {
    const auto share = [](LONG place, int whole) {
        return (place * 65536 + 32768) / GetSystemMetrics(whole);
    };
    INPUT input{};
    input.type = INPUT_MOUSE;
    input.mi.dx = share(at.x, SM_CXSCREEN);
    input.mi.dy = share(at.y, SM_CYSCREEN);
    input.mi.dwFlags = MOUSEEVENTF_MOVE | MOUSEEVENTF_ABSOLUTE | flags;
    send(input);
}

DWORD sideOf(int key) {
    switch (key) {
    case VK_LEFT:
    case VK_RIGHT:
    case VK_UP:
    case VK_DOWN: return KEYEVENTF_EXTENDEDKEY;
    default: return 0;
    }
}

HWND openMenu() {
    const HWND menu = FindWindowW(L"#32768", nullptr);
    return menu && IsWindowVisible(menu) ? menu : nullptr;
}

} // namespace

User::User(HWND form)
    : mForm(form), mEar(CreateWindowExW(0, L"STATIC", L"", 0, 0, 0, 0, 0, HWND_MESSAGE, nullptr,
                                        nullptr, nullptr)) {
    SetWindowLongPtrW(mEar, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
    SetWindowLongPtrW(mEar, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&hear));
    // Told when there is nothing else to do, also by the loop of a menu, a dialog or a drag.
    SetTimer(mEar, 1, USER_TIMER_MINIMUM, nullptr);
    SetForegroundWindow(form);
}

User::~User() { DestroyWindow(mEar); }

LRESULT CALLBACK User::hear(HWND window, UINT message, WPARAM w, LPARAM l) {
    if (message == WM_TIMER) {
        auto* const user = reinterpret_cast<User*>(GetWindowLongPtrW(window, GWLP_USERDATA));
        ++user->mIdle;
        return 0;
    }
    if (message != question) return DefWindowProcW(window, message, w, l);
    (*reinterpret_cast<const std::function<void()>*>(l))();
    return 0;
}

void User::live(const std::function<void()>& life) {
    std::atomic<bool> over = false;
    std::thread user([&] {
        life();
        over = true;
    });
    while (!over) {
        MSG message{};
        while (PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) {
            TranslateMessage(&message);
            DispatchMessageW(&message);
        }
        MsgWaitForMultipleObjects(0, nullptr, FALSE, 5, QS_ALLINPUT);
    }
    user.join();
}

void User::moveTo(POINT at) {
    mAt = at;
    sendMouse(at);
}

void User::press(bool right) const {
    sendMouse(mAt, right ? MOUSEEVENTF_RIGHTDOWN : MOUSEEVENTF_LEFTDOWN);
}

void User::letGo(bool right) const {
    sendMouse(mAt, right ? MOUSEEVENTF_RIGHTUP : MOUSEEVENTF_LEFTUP);
}

void User::click(POINT at, bool right) {
    moveTo(at);
    press(right);
    letGo(right);
}

void User::drag(POINT from, POINT to, const std::function<void()>& before) {
    moveTo(from);
    press();
    settle();
    constexpr int steps = 8;
    for (int step = 1; step <= steps; ++step) {
        moveTo({from.x + (to.x - from.x) * step / steps, from.y + (to.y - from.y) * step / steps});
        settle();
    }
    if (before) before();
    letGo();
    settle();
}

void User::hold(int key) const { sendKey(static_cast<WORD>(key), 0, sideOf(key)); }

void User::letGoOf(int key) const {
    sendKey(static_cast<WORD>(key), 0, sideOf(key) | KEYEVENTF_KEYUP);
}

void User::key(int key) const {
    hold(key);
    letGoOf(key);
}

void User::type(std::u16string_view text) const {
    for (const char16_t unit : text) {
        sendKey(0, unit, KEYEVENTF_UNICODE);
        sendKey(0, unit, KEYEVENTF_UNICODE | KEYEVENTF_KEYUP);
    }
}

void User::settle() const {
    // The first may have begun before what was done.
    const int seen = mIdle;
    await("the form is idle", [&] { return mIdle >= seen + 2; });
}

bool User::await(const std::string& what, const std::function<bool()>& isSo) const {
    const ULONGLONG end = GetTickCount64() + 20000;
    while (!isSo()) {
        if (GetTickCount64() > end) {
            ADD_FAILURE() << "in vain: " << what;
            return false;
        }
        Sleep(2);
    }
    return true;
}

void User::ask(const std::function<void()>& asked) const {
    SendMessageW(mEar, question, 0, reinterpret_cast<LPARAM>(&asked));
}

void User::choose(const wchar_t* entry, const std::function<void()>& before) {
    if (!await("a menu", [] { return openMenu() != nullptr; })) return;
    constexpr UINT getMenu = 0x01E1; // MN_GETHMENU
    const HWND window = openMenu();
    const auto menu = reinterpret_cast<HMENU>(SendMessageW(window, getMenu, 0, 0));
    for (int i = 0; i < GetMenuItemCount(menu); ++i) {
        wchar_t text[80] = {};
        GetMenuStringW(menu, static_cast<UINT>(i), text, 80, MF_BYPOSITION);
        if (text != std::wstring(entry)) continue;
        RECT place{};
        GetMenuItemRect(window, menu, static_cast<UINT>(i), &place);
        const POINT at{(place.left + place.right) / 2, (place.top + place.bottom) / 2};
        LONG beside = 0;
        await("the entry is marked", [&] {
            // The menu may not have been listening yet.
            moveTo({at.x + (beside ^= 1), at.y});
            Sleep(10);
            return (GetMenuState(menu, static_cast<UINT>(i), MF_BYPOSITION) & MF_HILITE) != 0;
        });
        if (before) before();
        press();
        letGo();
        await("the menu is closed", [] { return openMenu() == nullptr; });
        return;
    }
    ADD_FAILURE() << "the menu has no such entry";
    key(VK_ESCAPE);
}

void User::picture(const std::string& name) const {
    if (!std::getenv("ZANDOR_PICTURES")) return;
    RECT place{};
    GetWindowRect(mForm, &place);
    const HDC screen = GetDC(nullptr);
    writeBitmap(screen, place, name);
    ReleaseDC(nullptr, screen);
}
