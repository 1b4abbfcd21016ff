#pragma once

#include "frontends/windows/automation/com/Value.h"

#include <Zandor/Interface.h>

namespace zandor::automation {

/// A value of the control as a host has it. An object that is nothing is nothing of its kind.
Value toHost(const platform::Variant& value);

/// A host's value as the control has those of a type. Error 13 where it cannot be one, 6 where it
/// is beyond 16 bits.
platform::Variant fromHost(TalvikDBxZandor::automation::Type type, const VARIANT& value);

} // namespace zandor::automation
