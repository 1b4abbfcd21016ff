#pragma once

#include "frontends/windows/toolkit/system.h"

#include <Zandor/platform/String.h>

#include <vector>

namespace zandor::platform::windows {

/// The message boxes of one control while they stand open.
class ModalBoxes {
public:
    /// The system's box; returns when it has been closed.
    void show(HWND owner, const String& prompt, std::int32_t style, const String& title);
    /// The control has ended: they end, too, the uppermost first.
    void dismiss() const;

private:
    friend class BoxWatch;

    std::vector<HWND> mOpen;
};

} // namespace zandor::platform::windows
