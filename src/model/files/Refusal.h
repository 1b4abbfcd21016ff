#pragma once

#include <string>
#include <string_view>

namespace zandor::files {

/// Thrown within the reading and writing of a file, and made an error there: what is wrong and
/// where, and what to do about it.
struct Refusal {
    std::string fault;  ///< one sentence without its full stop
    std::string advice; ///< the same
};

inline constexpr const char* mendIt = "Mend the file there, or restore it from a copy";

/// The place of a value as a JSON pointer, so short and plain that it fits a line.
class Pointer {
public:
    Pointer() = default;
    Pointer operator/(std::string_view name) const;
    Pointer operator/(std::size_t position) const { return *this / std::to_string(position); }
    /// The pointer, without its middle where it is long; "The file" for the whole.
    std::string text() const;

private:
    std::string mText;
};

/// Text of a file as part of a message: cut when long, without anything that would break the line.
std::string shown(std::string_view text);

/// Throws a refusal about the value at a place: `reason` ends the sentence that the place begins.
[[noreturn]] void refuse(const Pointer& place, const std::string& reason,
                         const std::string& advice = mendIt);

} // namespace zandor::files
