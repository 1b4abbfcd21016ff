#pragma once

#include "model/files/Json.h"

namespace zandor::files::json {

/// The value that a text is. Throws a Refusal for a text that is none: with line and column where
/// the grammar is broken or the text is no UTF-8, with a pointer where it goes beyond the limits,
/// has a member twice or a NUL in a text.
Value read(std::string_view text);

} // namespace zandor::files::json
