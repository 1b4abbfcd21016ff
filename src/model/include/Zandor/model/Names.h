#pragma once

#include <Zandor/model/export.h>
#include <Zandor/platform/String.h>

namespace zandor::model {

/// Whether two names are one to a database: the letters A to Z count without regard to case, all
/// other characters as they stand.
ZANDOR_MODEL_EXPORT bool sameName(platform::StringView left, platform::StringView right);

/// The name in the form that all names alike share: equal for two names exactly when sameName.
ZANDOR_MODEL_EXPORT platform::String foldedName(platform::StringView name);

/// A text without line breaks: names may have some, messages must not.
ZANDOR_MODEL_EXPORT platform::String oneLine(platform::String text);

} // namespace zandor::model
