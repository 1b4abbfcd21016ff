#pragma once

#include <Zandor/platform/String.h>

#include <array>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// The compare operators by their codes.
inline constexpr std::array<platform::StringView, 6> operatorSymbols = {u"=", u"<>", u"<",
                                                                        u">", u"<=", u">="};

} // namespace TalvikDBxZandor
