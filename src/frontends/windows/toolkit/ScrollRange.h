#pragma once

#include "frontends/windows/toolkit/system.h"

#include <optional>

namespace zandor::platform::windows {

/// What one of the system's scroll bars shows. The system draws a bar whenever it is told of it,
/// if only of what it shows already; this tells it of changes.
class ScrollRange {
public:
    /// Positions from `least` to `most`, of which `page` are seen at once. Flags beside those of
    /// the range: 0 or SIF_DISABLENOSCROLL.
    struct Extent {
        int least, most, page, position;
        bool operator==(const Extent&) const = default;
    };
    void show(HWND window, int bar, const Extent& extent, UINT flags = 0);

private:
    std::optional<Extent> mShown;
};

} // namespace zandor::platform::windows
