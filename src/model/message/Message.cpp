#include <Zandor/model/Message.h>

#include <Zandor/model/Names.h>

#include <string>

namespace zandor::model {

using platform::String;
using platform::StringView;

namespace {

/// Puts the arguments in the places of %1 and so on, all at once: one may have such a mark in it.
String filled(StringView text, const std::vector<String>& arguments) {
    String result;
    for (std::size_t at = 0; at < text.size(); ++at) {
        const bool isMark = text[at] == u'%' && at + 1 < text.size() && text[at + 1] >= u'1' &&
                            text[at + 1] <= u'9';
        const std::size_t number = isMark ? text[at + 1] - u'1' : arguments.size();
        if (number < arguments.size()) {
            result += arguments[number];
            ++at;
        } else {
            result += text[at];
        }
    }
    return result;
}

} // namespace

Message::Message(MessageText text, std::vector<MessageArgument> arguments)
    : mText(text), mArguments(std::move(arguments)) {}

String Message::text() const {
    return words([](const char* english) { return platform::fromUtf8(english); });
}

String Message::words(const Translate& translate) const {
    std::vector<String> arguments;
    arguments.reserve(mArguments.size());
    for (const MessageArgument& argument : mArguments) {
        const auto* text = std::get_if<String>(&argument.content);
        arguments.push_back(text ? *text : std::get<Message>(argument.content).words(translate));
    }
    return *mText.english ? filled(translate(mText.english), arguments) : String();
}

bool operator==(const Message& left, const Message& right) {
    return left.code() == right.code() && left.mArguments == right.mArguments;
}

MessageArgument::MessageArgument(StringView text) : content(oneLine(String(text))) {}

} // namespace zandor::model
