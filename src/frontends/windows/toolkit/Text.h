#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/String.h>

namespace zandor::platform::windows {

// Both are UTF-16; the system has a type of its own for it.
static_assert(sizeof(wchar_t) == sizeof(char16_t));

/// As the system takes it; ends at the first zero.
inline const wchar_t* wide(const String& text) {
    return reinterpret_cast<const wchar_t*>(text.c_str());
}

inline String fromWide(const wchar_t* text, std::size_t length) {
    return {reinterpret_cast<const char16_t*>(text), length};
}

/// What a window bears: its caption, or what stands in it.
inline String textOf(HWND window) {
    String text(static_cast<std::size_t>(GetWindowTextLengthW(window)) + 1, u'\0');
    const int length = GetWindowTextW(window, reinterpret_cast<wchar_t*>(text.data()),
                                      static_cast<int>(text.size()));
    text.resize(static_cast<std::size_t>(length));
    return text;
}

} // namespace zandor::platform::windows
