#pragma once

#include <Zandor/model/export.h>
#include <Zandor/platform/String.h>

namespace zandor::model::sql {

/// Whether a word is reserved in any of the dialects. One list for all: a name in needless quotes
/// reads the same, one without the quotes it needs does not.
ZANDOR_MODEL_EXPORT bool isReserved(platform::StringView word);

} // namespace zandor::model::sql
