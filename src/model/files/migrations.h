#pragma once

#include "model/files/Json.h"

namespace zandor::files {

/// Brings the content of a file of an older version, from 1, to the current one.
void migrate(json::Members& file, int version);

} // namespace zandor::files
