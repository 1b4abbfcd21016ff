#pragma once

#include "frontends/windows/automation/com/system.h"

#include <map>
#include <string>

/// A function as a type library has it: "get LNGJoinForm(out BSTR*)", by its id.
using Functions = std::multimap<DISPID, std::string>;

/// What a type library has to declare, as the control's own tables have it.
Functions functionsOfTheTable();
Functions eventsOfTheTable();
