#pragma once

#include "model/files/Json.h"
#include "model/files/Refusal.h"

#include <Zandor/platform/String.h>

#include <cstdint>
#include <limits>
#include <optional>
#include <span>

namespace zandor::files {

/// A word of the file for each value of a code that counts from 0.
using Words = std::span<const std::string_view>;

/// An object of the file, read member by member. What was not asked for is what this version does
/// not know. A member that is missing takes the value given for that case; without one the object
/// is refused, as it is for a value of another kind than asked for.
class Object {
public:
    Object(json::Value value, Pointer place);

    platform::String text(std::string_view name, std::optional<platform::String> missing = {});
    /// A text that is a list of texts, one behind the other.
    platform::String pieces(std::string_view name);
    /// A text, and null for an empty one.
    platform::String textOrNull(std::string_view name);
    bool flag(std::string_view name, bool missing);
    template <class Integer>
    Integer integer(std::string_view name, std::optional<Integer> missing = {}) {
        return static_cast<Integer>(whole(name, missing, std::numeric_limits<Integer>::min(),
                                          std::numeric_limits<Integer>::max()));
    }
    std::int16_t word(std::string_view name, Words words, std::optional<std::int16_t> missing = {});
    Object object(std::string_view name);
    /// No member, for an object that has none of that name.
    Object objectOrNone(std::string_view name);
    /// Whether there is a member of a name that was not asked for yet.
    bool has(std::string_view name) const;
    json::Items list(std::string_view name, std::size_t most);
    json::Items listOrNone(std::string_view name, std::size_t most);

    /// The members that were not asked for, in their order.
    json::Members unknown() && { return std::move(mMembers); }
    Pointer place() const { return mPlace; }

private:
    /// Takes a member out; nothing when there is none of the name.
    std::optional<json::Value> take(std::string_view name);
    json::Value required(std::string_view name);
    std::int64_t whole(std::string_view name, std::optional<std::int64_t> missing,
                       std::int64_t least, std::int64_t greatest);

    json::Members mMembers;
    Pointer mPlace;
};

/// The position of a word; refuses any other text.
std::int16_t codeOf(const std::string& word, Words words, const Pointer& place);

/// A number as a whole one within bounds, or nothing.
std::optional<std::int64_t> wholeNumber(const json::Value& value, std::int64_t least,
                                        std::int64_t greatest);

} // namespace zandor::files
