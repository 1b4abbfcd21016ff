#pragma once

#include <Zandor/model/export.h>
#include <Zandor/platform/String.h>

#include <algorithm>
#include <concepts>
#include <cstdint>
#include <functional>
#include <string>
#include <string_view>
#include <utility>
#include <variant>
#include <vector>

/// A text of a table of messages, in the context in which catalogues of translations have it.
#define ZANDOR_TEXT(context, english) english

namespace zandor::model {

/// A row of a table of messages, of which each house has one (messages.def beside its headers).
struct MessageText {
    /// Stays as it is from version to version; no other row of any house has it. ASCII.
    const char* code = "";
    /// UTF-8, with %1 to %9 in the place of arguments.
    const char* english = "";
};

/// How many arguments a text has places for: the greatest of its %1 to %9.
constexpr std::size_t placesIn(std::string_view english) {
    std::size_t most = 0;
    for (std::size_t at = 0; at + 1 < english.size(); ++at)
        if (english[at] == '%' && english[at + 1] >= '1' && english[at + 1] <= '9')
            most = std::max(most, static_cast<std::size_t>(english[at + 1] - '0'));
    return most;
}

struct MessageArgument;

/// Something to be said to a person: which text of a table, and what belongs in its places. The
/// words are made where they are shown, in whatever language that is.
class ZANDOR_MODEL_EXPORT Message {
public:
    /// Nothing is said: no code, no words.
    Message() = default;
    /// `arguments` in the order of their numbers; a place without one shows its mark, as "%3".
    Message(MessageText text, std::vector<MessageArgument> arguments);

    /// The name of the text's code: "noTables".
    std::string_view code() const { return mText.code; }
    /// Whether it is the one of a code, which is a value of a house's MessageCode.
    template <class Code>
    bool is(Code code) const {
        return this->code() == textOf(code).code;
    }
    /// The text with its places, in English.
    const char* english() const { return mText.english; }
    /// What belongs in its places, in the order of their numbers.
    const std::vector<MessageArgument>& arguments() const { return mArguments; }

    /// The words in English: one line.
    platform::String text() const;
    /// The words in another language. `translate` gives the text for an English one, with places
    /// by the same numbers; it is asked for those of arguments too that are messages themselves.
    using Translate = std::function<platform::String(const char* english)>;
    /// The words as Translate gives them.
    platform::String words(const Translate& translate) const;

    /// Whether the codes and the arguments are the same.
    ZANDOR_MODEL_EXPORT friend bool operator==(const Message&, const Message&);

private:
    MessageText mText;
    std::vector<MessageArgument> mArguments;
};

/// What takes a place in a text: a name, a number, words of an engine or the system, which are the
/// same in all languages and are made one line; or a message of its own.
struct ZANDOR_MODEL_EXPORT MessageArgument {
    MessageArgument(platform::StringView text); ///< UTF-16; line breaks become blanks
    /// As above.
    MessageArgument(const platform::String& text) : MessageArgument(platform::StringView(text)) {}
    /// As above.
    MessageArgument(const char16_t* text) : MessageArgument(platform::StringView(text)) {}
    /// UTF-8; a malformed sequence becomes U+FFFD.
    MessageArgument(std::string_view text) : MessageArgument(platform::fromUtf8(text)) {}
    /// As above.
    MessageArgument(const std::string& text) : MessageArgument(std::string_view(text)) {}
    /// As above.
    MessageArgument(const char* text) : MessageArgument(std::string_view(text)) {}
    /// In decimal digits.
    MessageArgument(std::integral auto number)
        : content(platform::decimal(static_cast<std::int64_t>(number))) {}
    MessageArgument(char) = delete;
    MessageArgument(char16_t) = delete;
    MessageArgument(bool) = delete;
    /// A message in the place of an argument; it is translated by itself.
    MessageArgument(Message message) : content(std::move(message)) {}

    std::variant<platform::String, Message> content; ///< what takes the place

    friend bool operator==(const MessageArgument&, const MessageArgument&) = default;
};

/// The message of a code, a value of a house's MessageCode, with as many arguments as its text has
/// places for; it does not compile with more or fewer.
template <auto code, class... Arguments>
Message say(Arguments&&... arguments) {
    static_assert(placesIn(textOf(code).english) == sizeof...(Arguments));
    return {textOf(code), {MessageArgument(std::forward<Arguments>(arguments))...}};
}

} // namespace zandor::model
