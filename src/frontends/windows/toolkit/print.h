#pragma once

#include "frontends/windows/toolkit/system.h"

namespace zandor::platform::windows {

/// Draws a window and all that stands in it as they are, whether they are on the screen or not;
/// its upper left corner is the device's origin.
void print(HWND window, HDC dc);

} // namespace zandor::platform::windows
