#include "model/files/Object.h"

#include "model/files/limits.h"

#include <algorithm>
#include <charconv>

namespace zandor::files {

namespace {

/// Refuses with the message of the code what is something else.
template <class Content, MessageCode code>
Content as(json::Value value, const Pointer& place) {
    Content* content = std::get_if<Content>(&value.content);
    if (!content) refuse<code>(place);
    return std::move(*content);
}

} // namespace

Object::Object(json::Value value, Pointer place)
    : mMembers(as<json::Members, MessageCode::notAnObject>(std::move(value), place)),
      mPlace(std::move(place)) {}

platform::String Object::text(std::string_view name, std::optional<platform::String> missing) {
    auto value = take(name);
    if (!value && missing) return *missing;
    if (!value) refuse<MessageCode::isMissing>(mPlace / name);
    return platform::fromUtf8(
        as<std::string, MessageCode::notAText>(std::move(*value), mPlace / name));
}

platform::String Object::pieces(std::string_view name) {
    json::Items items = list(name, limits::values);
    platform::String text;
    for (std::size_t n = 0; n < items.size(); ++n)
        text += platform::fromUtf8(
            as<std::string, MessageCode::notAText>(std::move(items[n]), mPlace / name / n));
    return text;
}

platform::String Object::textOrNull(std::string_view name) {
    auto value = take(name);
    if (!value || std::holds_alternative<json::Null>(value->content)) return {};
    return platform::fromUtf8(
        as<std::string, MessageCode::notATextOrNull>(std::move(*value), mPlace / name));
}

bool Object::flag(std::string_view name, bool missing) {
    auto value = take(name);
    return value ? as<bool, MessageCode::notTrueOrFalse>(std::move(*value), mPlace / name)
                 : missing;
}

std::int16_t Object::word(std::string_view name, Words words, std::optional<std::int16_t> missing) {
    auto value = take(name);
    if (!value && missing) return *missing;
    if (!value) refuse<MessageCode::isMissing>(mPlace / name);
    const Pointer place = mPlace / name;
    return codeOf(as<std::string, MessageCode::notAText>(std::move(*value), place), words, place);
}

Object Object::object(std::string_view name) { return {required(name), mPlace / name}; }

Object Object::objectOrNone(std::string_view name) {
    auto value = take(name);
    return {value ? std::move(*value) : json::Value{json::Members{}}, mPlace / name};
}

json::Items Object::list(std::string_view name, std::size_t most) {
    auto items = as<json::Items, MessageCode::notAList>(required(name), mPlace / name);
    if (items.size() > most) refuse<MessageCode::tooManyEntries>(mPlace / name, most);
    return items;
}

json::Items Object::listOrNone(std::string_view name, std::size_t most) {
    return has(name) ? list(name, most) : json::Items{};
}

bool Object::has(std::string_view name) const {
    return std::any_of(mMembers.begin(), mMembers.end(),
                       [&](const json::Member& member) { return member.name == name; });
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
    if (!value) refuse<MessageCode::isMissing>(mPlace / name);
    return std::move(*value);
}

std::int64_t Object::whole(std::string_view name, std::optional<std::int64_t> missing,
                           std::int64_t least, std::int64_t greatest) {
    const auto value = take(name);
    if (!value && missing) return *missing;
    if (!value) refuse<MessageCode::isMissing>(mPlace / name);
    const auto number = wholeNumber(*value, least, greatest);
    if (!number) refuse<MessageCode::notAWholeNumber>(mPlace / name, least, greatest);
    return *number;
}

std::int16_t codeOf(const std::string& word, Words words, const Pointer& place) {
    const auto at = std::find(words.begin(), words.end(), word);
    if (at != words.end()) return static_cast<std::int16_t>(at - words.begin());
    std::string known;
    for (const std::string_view each : words)
        known += (known.empty() ? "\"" : ", \"") + std::string(each) + '"';
    refuse<MessageCode::unknownWord>(place, shown(word), known);
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
