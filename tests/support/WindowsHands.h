#pragma once

#include "frontends/windows/toolkit/system.h"

#include <functional>

/// Input as the system would deliver it: into the queue, from which it is dispatched as in a host's
/// message loop.
namespace hands {

/// The class of a host's windows.
inline const wchar_t* hostClass(WNDPROC procedure) {
    static const wchar_t name[] = L"ZandorStage";
    static const ATOM once = [procedure] {
        WNDCLASSW host{};
        host.lpfnWndProc = procedure;
        host.hInstance = GetModuleHandleW(nullptr);
        host.hbrBackground = GetSysColorBrush(COLOR_BTNFACE);
        host.lpszClassName = name;
        return RegisterClassW(&host);
    }();
    (void)once;
    return name;
}

/// Of the keys that a message of the mouse tells of: it comes from these hands. The system sends
/// some of its own, from wherever its pointer happens to be.
inline constexpr WPARAM ours = 0x8000;

/// Deals with all that is in the queue; `dialog` has its keys first.
inline void pump(HWND dialog = nullptr) {
    MSG message{};
    while (PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) {
        if (message.message >= WM_MOUSEFIRST && message.message <= WM_MOUSELAST) {
            if (!(message.wParam & ours)) continue;
            message.wParam &= ~ours;
        }
        if (dialog && IsWindow(dialog) && IsDialogMessageW(dialog, &message)) continue;
        TranslateMessage(&message);
        DispatchMessageW(&message);
    }
}

inline WPARAM keysOf(int buttons) {
    return (buttons & 1 ? MK_LBUTTON : 0u) | (buttons & 2 ? MK_RBUTTON : 0u) |
           (buttons & 4 ? MK_MBUTTON : 0u);
}

inline UINT pressOf(int button) {
    return button == 2 ? WM_RBUTTONDOWN : button == 4 ? WM_MBUTTONDOWN : WM_LBUTTONDOWN;
}

inline UINT releaseOf(int button) {
    return button == 2 ? WM_RBUTTONUP : button == 4 ? WM_MBUTTONUP : WM_LBUTTONUP;
}

inline void mouse(HWND window, UINT message, POINT at, WPARAM keys) {
    PostMessageW(window, message, keys | ours, MAKELPARAM(at.x, at.y));
}

inline POINT middleOf(HWND window) {
    RECT place{};
    GetClientRect(window, &place);
    return {place.right / 2, place.bottom / 2};
}

inline void click(HWND window, POINT at) {
    mouse(window, WM_LBUTTONDOWN, at, MK_LBUTTON);
    mouse(window, WM_LBUTTONUP, at, 0);
}

/// The innermost window that is seen at a place of another one.
inline HWND windowAt(HWND outer, POINT at) {
    HWND found = nullptr;
    for (HWND next = outer; next && next != found;) {
        found = next;
        POINT inside = at;
        MapWindowPoints(outer, found, &inside, 1);
        next = ChildWindowFromPointEx(found, inside, CWP_SKIPINVISIBLE);
    }
    return found;
}

/// One key with Shift (1), Control (2) and Alt (4) held.
inline void key(HWND window, int code, int shift, const std::function<void()>& dealWithIt) {
    BYTE before[256] = {};
    BYTE held[256] = {};
    GetKeyboardState(before);
    GetKeyboardState(held);
    const auto hold = [&](int key, bool down) { held[key] = down ? 0x80 : 0; };
    hold(VK_SHIFT, shift & 1);
    hold(VK_CONTROL, shift & 2);
    hold(VK_MENU, shift & 4);
    hold(code, true);
    SetKeyboardState(held);
    const bool system = (shift & 4) && !(shift & 2);
    const LPARAM context = system ? 1 << 29 : 0;
    PostMessageW(window, system ? WM_SYSKEYDOWN : WM_KEYDOWN, static_cast<WPARAM>(code),
                 context | 1);
    dealWithIt();
    SetKeyboardState(before);
    if (IsWindow(window))
        PostMessageW(window, system ? WM_SYSKEYUP : WM_KEYUP, static_cast<WPARAM>(code),
                     context | static_cast<LPARAM>(0xC0000001));
    dealWithIt();
}

} // namespace hands
