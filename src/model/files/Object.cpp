#include "model/files/Object.h"

#include <algorithm>
#include <charconv>

namespace zandor::files {

namespace {

template <class Content>
Content as(json::Value value, const Pointer& place, const char* reason) {
    Content* content = std::get_if<Content>(&value.content);
    if (!content) refuse(place, reason);
    return std::move(*content);
}

} // namespace

Object::Object(json::Value value, Pointer place)
    : mMembers(as<json::Members>(std::move(value), place, "is not an object")),
      mPlace(std::move(place)) {}

platform::String Object::text(std::string_view name, std::optional<platform::String> missing) {
    auto value = take(name);
    if (!value && missing) return *missing;
    if (!value) refuse(mPlace / name, "is missing");
    return platform::fromUtf8(as<std::string>(std::move(*value), mPlace / name, "is not a text"));
}

platform::String Object::textOrNull(std::string_view name) {
    auto value = take(name);
    if (!value || std::holds_alternative<json::Null>(value->content)) return {};
    return platform::fromUtf8(
        as<std::string>(std::move(*value), mPlace / name, "is neither a text nor null"));
}

bool Object::flag(std::string_view name, bool missing) {
    auto value = take(name);
    return value ? as<bool>(std::move(*value), mPlace / name, "is not true or false") : missing;
}

std::int16_t Object::word(std::string_view name, Words words, std::int16_t missing) {
    auto value = take(name);
    if (!value) return missing;
    const Pointer place = mPlace / name;
    return codeOf(as<std::string>(std::move(*value), place, "is not a text"), words, place);
}

Object Object::object(std::string_view name) { return {required(name), mPlace / name}; }

Object Object::objectOrNone(std::string_view name) {
    auto value = take(name);
    return {value ? std::move(*value) : json::Value{json::Members{}}, mPlace / name};
}

json::Items Object::list(std::string_view name, std::size_t most) {
    auto items = as<json::Items>(required(name), mPlace / name, "is not a list");
    if (items.size() > most)
        refuse(mPlace / name, "has more than " + std::to_string(most) + " entries");
    return items;
}

json::Items Object::listOrNone(std::string_view name, std::size_t most) {
    const bool there = std::any_of(mMembers.begin(), mMembers.end(),
                                   [&](const json::Member& member) { return member.name == name; });
    return there ? list(name, most) : json::Items{};
}

std::optional<json::Value> Object::take(std::string_view name) {
    const auto at = std::find_if(mMembers.begin(), mMembers.end(),
                                 [&](const json::Member& member) { return member.name == name; });
    if (at == mMembers.end()) return {};
    json::Value value = std::move(at->value);
    mMembers.erase(at);
    return value;
}

json::Value Object::required(std::string_view name) {
    auto value = take(name);
    if (!value) refuse(mPlace / name, "is missing");
    return std::move(*value);
}

std::int64_t Object::whole(std::string_view name, std::optional<std::int64_t> missing,
                           std::int64_t least, std::int64_t greatest) {
    const auto value = take(name);
    if (!value && missing) return *missing;
    if (!value) refuse(mPlace / name, "is missing");
    const auto number = wholeNumber(*value, least, greatest);
    if (!number)
        refuse(mPlace / name, "is not a whole number from " + std::to_string(least) + " to " +
                                  std::to_string(greatest));
    return *number;
}

std::int16_t codeOf(const std::string& word, Words words, const Pointer& place) {
    const auto at = std::find(words.begin(), words.end(), word);
    if (at != words.end()) return static_cast<std::int16_t>(at - words.begin());
    std::string known;
    for (const std::string_view each : words)
        known += (known.empty() ? "\"" : ", \"") + std::string(each) + '"';
    refuse(place, "is \"" + shown(word) + "\" and none of " + known);
}

std::optional<std::int64_t> wholeNumber(const json::Value& value, std::int64_t least,
                                        std::int64_t greatest) {
    const auto* number = std::get_if<json::Number>(&value.content);
    if (!number) return {};
    std::int64_t result = 0;
    const char* end = number->text.data() + number->text.size();
    const auto [at, error] = std::from_chars(number->text.data(), end, result);
    if (error != std::errc() || at != end || result < least || result > greatest) return {};
    return result;
}

} // namespace zandor::files
