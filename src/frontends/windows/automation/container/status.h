#pragma once

#include "frontends/windows/automation/com/system.h"

namespace zandor::automation {

/// What kind of object the control is to its containers, as it is registered and as it says itself.
inline constexpr DWORD miscStatus = OLEMISC_RECOMPOSEONRESIZE | OLEMISC_INSIDEOUT |
                                    OLEMISC_ACTIVATEWHENVISIBLE | OLEMISC_CANTLINKINSIDE |
                                    OLEMISC_SETCLIENTSITEFIRST;

} // namespace zandor::automation
