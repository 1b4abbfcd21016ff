#pragma once

#include <Zandor/model/Message.h>

namespace zandor::sql_reader {

/// The codes of sql_reader/messages.def.
enum class MessageCode : std::uint16_t {
#define ZANDOR_MESSAGE(code, english) code,
#include <Zandor/sql_reader/messages.def>
#undef ZANDOR_MESSAGE
};

/// All of sql_reader/messages.def, in the order of the codes.
inline constexpr model::MessageText messageTexts[] = {
#define ZANDOR_MESSAGE(code, english) {#code, english},
#include <Zandor/sql_reader/messages.def>
#undef ZANDOR_MESSAGE
};

/// The row of a code.
constexpr model::MessageText textOf(MessageCode code) {
    return messageTexts[static_cast<std::size_t>(code)];
}

} // namespace zandor::sql_reader
