#pragma once

#include "platform/String.h"

#include <array>

namespace TalvikDBxZandor {

/// The compare operators by their codes.
inline constexpr std::array<platform::StringView, 6> operatorSymbols = {u"=", u"<>", u"<",
                                                                        u">", u"<=", u">="};

} // namespace TalvikDBxZandor
