#pragma once

#include "frontends/windows/automation/com/Module.h"

#include <Zandor/windows/Counted.h>

namespace zandor::automation {

/// An object behind one interface, which goes with its last reference and keeps the library loaded
/// until then.
template <class Interface>
class Counted : public platform::windows::Counted<Interface> {
    const Keeping mKeeping;
};

} // namespace zandor::automation
