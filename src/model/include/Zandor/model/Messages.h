#pragma once

#include <Zandor/model/Message.h>

namespace zandor::model {

/// The codes of model/messages.def.
enum class MessageCode : std::uint16_t {
#define ZANDOR_MESSAGE(code, english) code,
#include <Zandor/model/messages.def>
#undef ZANDOR_MESSAGE
};

/// All of model/messages.def, in the order of the codes.
inline constexpr MessageText messageTexts[] = {
#define ZANDOR_MESSAGE(code, english) {#code, english},
#include <Zandor/model/messages.def>
#undef ZANDOR_MESSAGE
};

/// The row of a code.
constexpr MessageText textOf(MessageCode code) {
    return messageTexts[static_cast<std::size_t>(code)];
}

} // namespace zandor::model
