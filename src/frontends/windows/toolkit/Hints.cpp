#include "frontends/windows/toolkit/Hints.h"

#include "frontends/windows/toolkit/Text.h"
#include "frontends/windows/toolkit/Window.h"

namespace zandor::platform::windows {

namespace {

constexpr int widest = 400; // pixels; what is longer has several lines

TTTOOLINFOW toolIn(HWND window) {
    TTTOOLINFOW tool{};
    // What systems of every age know.
    tool.cbSize = TTTOOLINFOW_V1_SIZE;
    tool.hwnd = window;
    tool.uFlags = TTF_SUBCLASS;
    return tool;
}

} // namespace

Hints::~Hints() {
    if (mTip) DestroyWindow(mTip);
}

void Hints::over(const Window& window, const RECT& place, const String& text) {
    if (mOver == window.hwnd() && mText == text && EqualRect(&mPlace, &place)) return;
    if (mOver) {
        TTTOOLINFOW before = toolIn(mOver);
        SendMessageW(mTip, TTM_DELTOOLW, 0, reinterpret_cast<LPARAM>(&before));
        mOver = nullptr;
    }
    mText = text;
    if (text.empty()) return;
    if (!mTip) {
        const HWND root = GetAncestor(window.hwnd(), GA_ROOT);
        mTip = CreateWindowExW(WS_EX_TOPMOST, TOOLTIPS_CLASSW, nullptr,
                               WS_POPUP | TTS_NOPREFIX | TTS_ALWAYSTIP, 0, 0, 0, 0, root, nullptr,
                               nullptr, nullptr);
        SendMessageW(mTip, TTM_SETMAXTIPWIDTH, 0, widest);
    }
    mOver = window.hwnd();
    mPlace = place;
    TTTOOLINFOW tool = toolIn(mOver);
    tool.rect = place;
    tool.lpszText = const_cast<wchar_t*>(wide(mText));
    SendMessageW(mTip, TTM_ADDTOOLW, 0, reinterpret_cast<LPARAM>(&tool));
}

void Hints::leave(const Window& window) {
    if (mOver && mOver == window.hwnd()) over(window, {}, {});
}

} // namespace zandor::platform::windows
