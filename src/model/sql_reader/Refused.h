#pragma once

#include <Zandor/sql_reader/Messages.h>

#include <cstddef>

namespace zandor::sql_reader {

/// Thrown by whatever part of reading cannot go on.
struct Refused {
    model::Message message;
    std::size_t place = 0; ///< in bytes of what the parser reads
};

template <MessageCode code, class... Arguments>
[[noreturn]] void refuse(std::size_t place, Arguments&&... arguments) {
    throw Refused{model::say<code>(std::forward<Arguments>(arguments)...), place};
}

/// For what a drawing has no place for.
template <MessageCode what>
[[noreturn]] void refusePart(std::size_t place) {
    refuse<MessageCode::noPlaceFor>(place, model::say<what>());
}

} // namespace zandor::sql_reader
