#pragma once

#include "platform/String.h"

#include <memory>
#include <variant>

namespace platform {

/// A value of any type that crosses the automation boundary. Empty is std::monostate; an object
/// is held by counted reference.
using Variant =
    std::variant<std::monostate, bool, std::int16_t, std::int32_t, String, std::shared_ptr<void>>;

} // namespace platform
