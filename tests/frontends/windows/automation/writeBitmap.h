#pragma once

#include "frontends/windows/automation/com/system.h"

#include <string>

/// Keeps a part of what a device shows as a file in the folder that ZANDOR_PICTURES names, to be
/// looked at; without one it does nothing.
void writeBitmap(HDC device, const RECT& place, const std::string& name);
