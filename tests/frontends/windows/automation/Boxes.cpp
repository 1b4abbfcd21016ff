#include "Boxes.h"

#include "frontends/windows/automation/com/Text.h"

#include <utility>

namespace {

thread_local std::vector<std::string> seen;
thread_local std::function<void(HWND)> instead;

constexpr wchar_t known[] = L"ZandorTestSeen";

void close(HWND box) {
    wchar_t kind[16] = {};
    GetClassNameW(box, kind, 16);
    // A box that comes to the front again has been answered already.
    if (kind != std::wstring(L"#32770") || GetPropW(box, known)) return;
    SetPropW(box, known, box);
    wchar_t title[200] = {};
    GetWindowTextW(box, title, 200);
    seen.push_back(zandor::platform::toUtf8(reinterpret_cast<const char16_t*>(title)));
    if (instead)
        std::exchange(instead, {})(box);
    else
        PostMessageW(box, WM_COMMAND, IDOK, 0);
}

LRESULT CALLBACK activated(int code, WPARAM w, LPARAM l) {
    if (code == HCBT_ACTIVATE) close(reinterpret_cast<HWND>(w));
    return CallNextHookEx(nullptr, code, w, l);
}

} // namespace

Boxes::Boxes() : mHook(SetWindowsHookExW(WH_CBT, &activated, nullptr, GetCurrentThreadId())) {}

Boxes::~Boxes() { UnhookWindowsHookEx(mHook); }

void Boxes::meetNext(std::function<void(HWND)> user) { instead = std::move(user); }

std::vector<std::string> Boxes::taken() { return std::exchange(seen, {}); }
