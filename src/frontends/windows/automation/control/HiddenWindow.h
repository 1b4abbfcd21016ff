#pragma once

#include "frontends/windows/automation/com/Module.h"

#include <new>

namespace zandor::automation {

/// What a control stands in while no form shows it.
class HiddenWindow {
public:
    HiddenWindow()
        : mHandle(CreateWindowExW(0, L"STATIC", L"", WS_POPUP, 0, 0, 0, 0, nullptr, nullptr,
                                  module::instance(), nullptr)) {
        if (!mHandle) throw std::bad_alloc();
    }
    HiddenWindow(const HiddenWindow&) = delete;
    HiddenWindow& operator=(const HiddenWindow&) = delete;
    ~HiddenWindow() { DestroyWindow(mHandle); }

    HWND handle() const { return mHandle; }

private:
    HWND mHandle;
};

} // namespace zandor::automation
