#pragma once

#include <Zandor/files/Error.h>

namespace zandor::files {

/// Thrown within the reading and writing of a file, and made an error there: what is wrong and
/// where, and what to do about it.
struct Refusal {
    model::Message fault; ///< one sentence without its full stop
    model::Message advice = model::say<MessageCode::mendIt>(); ///< the same

    Error error() const { return model::say<MessageCode::faultAndAdvice>(fault, advice); }
};

/// The place of a value as a JSON pointer, so short and plain that it fits a line.
class Pointer {
public:
    Pointer() = default;
    Pointer operator/(std::string_view name) const;
    Pointer operator/(std::size_t position) const { return *this / std::to_string(position); }
    /// The pointer, without its middle where it is long; "The file" for the whole.
    model::MessageArgument shown() const;

private:
    std::string mText;
};

/// Text of a file as part of a message: cut when long, without anything that would break the line.
std::string shown(std::string_view text);

/// Throws a refusal about the value at a place, which is the first argument of the message.
template <MessageCode code, class... Arguments>
[[noreturn]] void refuse(const Pointer& place, const Arguments&... arguments) {
    throw Refusal{model::say<code>(place.shown(), arguments...)};
}

/// The path within a message of one line.
std::string nameOf(const Path& path);

} // namespace zandor::files
