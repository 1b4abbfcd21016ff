#pragma once

#include "frontends/windows/automation/com/system.h"

namespace zandor::automation {

/// Whether a message is a key that means something in the control, and so is not to be taken by its
/// container first: what is typed and what walks, Enter and Delete, Escape where there is something
/// to leave, and the editing keys while an editor is open.
bool isForControl(const MSG& message, HWND control);
/// Whether a message is a key that goes down, or a letter with Alt.
bool isPressed(const MSG& message);

} // namespace zandor::automation
