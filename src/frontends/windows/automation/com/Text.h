#pragma once

#include "frontends/windows/automation/com/system.h"

#include <Zandor/platform/String.h>

#include <new>

namespace zandor::automation {

// Both are UTF-16; the system has a type of its own for it.
static_assert(sizeof(wchar_t) == sizeof(char16_t));

inline const wchar_t* wide(const platform::String& text) {
    return reinterpret_cast<const wchar_t*>(text.c_str());
}

/// Zeros included; a text that is not there is an empty one.
inline platform::String textOf(BSTR text) {
    return text ? platform::String(reinterpret_cast<const char16_t*>(text), SysStringLen(text))
                : platform::String();
}

/// A text for who asked, who frees it. std::bad_alloc where there is no room.
inline BSTR newText(platform::StringView text) {
    const BSTR made = SysAllocStringLen(reinterpret_cast<const OLECHAR*>(text.data()),
                                        static_cast<UINT>(text.size()));
    if (!made) throw std::bad_alloc();
    return made;
}

/// A text of the system's kind that is freed with it.
class Text {
public:
    Text() = default;
    explicit Text(platform::StringView text) : mText(newText(text)) {}
    Text(const Text&) = delete;
    Text& operator=(const Text&) = delete;
    ~Text() { SysFreeString(mText); }

    BSTR get() const { return mText; }
    BSTR* slot() { return &mText; }
    platform::String string() const { return textOf(mText); }

private:
    BSTR mText = nullptr;
};

} // namespace zandor::automation
