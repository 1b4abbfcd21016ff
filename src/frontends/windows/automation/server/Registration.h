#pragma once

#include "frontends/windows/automation/com/system.h"

namespace zandor::automation::registration {

// What the system knows of the library below Software\Classes of `root`, which is
// HKEY_LOCAL_MACHINE for everybody or HKEY_CURRENT_USER. Both may be done any number of times.

/// Writes it. Where something cannot be written the code says why, and nothing stays.
HRESULT write(HKEY root);
/// Takes away what write has written, and the keys that nothing else stands in.
HRESULT erase(HKEY root);

} // namespace zandor::automation::registration
