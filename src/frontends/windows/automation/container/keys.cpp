#include "frontends/windows/automation/container/keys.h"

namespace zandor::automation {

namespace {

bool isDown(int key) { return GetKeyState(key) < 0; }

bool isEditor(HWND window) {
    wchar_t kind[16] = {};
    GetClassNameW(window, kind, 16);
    return lstrcmpiW(kind, L"EDIT") == 0 || lstrcmpiW(kind, L"COMBOBOX") == 0;
}

bool isWalking(WPARAM key) {
    switch (key) {
    case VK_LEFT:
    case VK_RIGHT:
    case VK_UP:
    case VK_DOWN:
    case VK_HOME:
    case VK_END:
    case VK_PRIOR:
    case VK_NEXT:
    case VK_SPACE:
    case VK_RETURN:
    case VK_DELETE:
    case VK_INSERT:
    case VK_BACK: return true;
    default: return false;
    }
}

bool isPressForControl(WPARAM key, HWND focus) {
    const bool control = isDown(VK_CONTROL);
    if (key == VK_TAB) return !control;
    // A drag or an open editor ends by it; else it is a form's way to be left.
    if (key == VK_ESCAPE) return isEditor(focus) || GetCapture() != nullptr;
    if (isWalking(key)) return true;
    if (key >= VK_F1 && key <= VK_F24)
        return key == VK_F2 || key == VK_F6 || (key == VK_F4 && isEditor(focus));
    if (!control) return true; // it is typed
    return isEditor(focus) && (key == 'A' || key == 'C' || key == 'V' || key == 'X' || key == 'Z');
}

} // namespace

bool isForControl(const MSG& message, HWND control) {
    if (!message.hwnd || (message.hwnd != control && !IsChild(control, message.hwnd))) return false;
    switch (message.message) {
    case WM_KEYDOWN: return isPressForControl(message.wParam, message.hwnd);
    case WM_CHAR: return true;
    // The current column goes to the left and to the right, and lists drop down.
    case WM_SYSKEYDOWN:
        return message.wParam >= VK_LEFT && message.wParam <= VK_DOWN && !isDown(VK_CONTROL);
    default: return false;
    }
}

bool isPressed(const MSG& message) {
    return message.message == WM_KEYDOWN || message.message == WM_SYSKEYDOWN ||
           message.message == WM_SYSCHAR;
}

} // namespace zandor::automation
