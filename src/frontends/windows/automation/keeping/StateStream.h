#pragma once

#include "frontends/windows/automation/com/system.h"
#include "frontends/windows/automation/keeping/State.h"

#include <cstdint>
#include <vector>

namespace zandor::automation {

// A state as bytes: "ZDNK", the version, the length of what follows and its check sum; then of each
// kept member its dispatch id, its type and its value. All numbers have their low byte first, so
// that both word sizes read what either has written.

std::vector<std::uint8_t> bytesOf(const State& state);

/// Reads what bytesOf has made and leaves the stream behind it. A RuntimeError with the code of the
/// system: STG_E_INVALIDHEADER for what was none, STG_E_OLDDLL for one of a later version,
/// STG_E_DOCFILECORRUPT for one that is cut or broken.
State readState(IStream& stream);

} // namespace zandor::automation
