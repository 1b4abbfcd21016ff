#pragma once

#include "frontends/windows/toolkit/Window.h"

namespace zandor::platform::windows {

/// What the system asks a window for on behalf of a screen reader (WM_GETOBJECT): the object that
/// speaks for it; nothing where the system's own will do.
std::optional<LRESULT> answerReader(Window& window, const Message& message);

/// What has the focus in a window with the focus is another part of it now.
void tellReader(Window& window);

} // namespace zandor::platform::windows
