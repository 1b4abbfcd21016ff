#pragma once

#include "frontends/windows/toolkit/Window.h"

#include <vector>

namespace zandor::platform::windows {

/// The windows of ours in another one, however deep, in the system's order. What is done with one
/// may end others: each is held.
std::vector<std::shared_ptr<Window>> partsIn(HWND outer);

} // namespace zandor::platform::windows
