#pragma once

#include "frontends/windows/toolkit/system.h"

#include <oleidl.h>
#include <wrl/client.h>

namespace zandor::platform::windows {

class Drags;

/// Carries a running drag by the system's own drag and drop. While it does the control's window is
/// a target for it, and for nothing else; what it carries is of no use to anybody else.
void carryByOle(Drags& drags);

// The two sides of it

/// What such a drag carries: nothing but whose it is.
Microsoft::WRL::ComPtr<IDataObject> carriedBy(const Drags& drags);
/// Takes what `carriedBy` of the same drags gives, and refuses everything else.
Microsoft::WRL::ComPtr<IDropTarget> targetFor(Drags& drags);

} // namespace zandor::platform::windows
