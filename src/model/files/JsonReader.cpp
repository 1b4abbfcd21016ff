#include "model/files/JsonReader.h"

#include "model/files/Refusal.h"
#include "model/files/limits.h"

#include <nlohmann/json.hpp>

#include <algorithm>
#include <unordered_set>

namespace zandor::files::json {

namespace {

/// What is wrong at the byte at an offset. Columns count characters from 1.
model::Message brokenAt(std::string_view text, std::size_t offset,
                        const model::MessageArgument& reason) {
    const std::string_view before = text.substr(0, std::min(offset, text.size()));
    const auto line = std::count(before.begin(), before.end(), '\n') + 1;
    const std::string_view start = before.substr(before.rfind('\n') + 1);
    const auto column = std::count_if(start.begin(), start.end(), [](char c) {
        return (static_cast<unsigned char>(c) & 0xC0) != 0x80; // no byte within a character
    });
    return model::say<MessageCode::brokenGrammar>(line, column + 1, reason);
}

/// The parser's words about what is wrong, without its prefix and without the text it read, which
/// may be anything and of any length.
std::string complaint(std::string what) {
    const auto dash = what.find(" - ");
    if (dash != std::string::npos) what.erase(0, dash + 3);
    const auto token = what.find("; last read:");
    if (token != std::string::npos) what.erase(token);
    return what;
}

std::size_t utf16Length(std::string_view utf8) {
    return static_cast<std::size_t>(
        std::count_if(utf8.begin(), utf8.end(),
                      [](char c) { return (static_cast<unsigned char>(c) & 0xC0) != 0x80; }) +
        std::count_if(utf8.begin(), utf8.end(),
                      [](char c) { return static_cast<unsigned char>(c) >= 0xF0; }));
}

/// Builds the tree from what the parser meets, and refuses what goes beyond the limits before it
/// takes memory.
class Builder final : public nlohmann::json_sax<nlohmann::json> {
public:
    explicit Builder(std::string_view text) : mText(text) {}

    Value result() { return std::move(mRoot); }

    bool null() override { return add({Null{}}); }
    bool boolean(bool value) override { return add({value}); }
    bool number_integer(number_integer_t value) override {
        return add({Number{std::to_string(value)}});
    }
    bool number_unsigned(number_unsigned_t value) override {
        return add({Number{std::to_string(value)}});
    }
    bool number_float(number_float_t, const string_t& digits) override {
        check(digits);
        return add({Number{digits}});
    }
    bool string(string_t& value) override {
        check(value);
        return add({std::move(value)});
    }
    bool binary(binary_t&) override { return false; }
    bool start_object(std::size_t) override { return open({Members{}}); }
    bool start_array(std::size_t) override { return open({Items{}}); }
    bool end_object() override { return close(); }
    bool end_array() override { return close(); }

    bool key(string_t& name) override {
        Frame& frame = mOpen.back();
        frame.name = name;
        check(name);
        if (!frame.names.insert(name).second) refuse<MessageCode::standsTwice>(place());
        return true;
    }

    bool parse_error(std::size_t position, const std::string&,
                     const nlohmann::detail::exception& error) override {
        constexpr int numberTooLarge = 406;
        const model::MessageArgument reason =
            error.id == numberTooLarge
                ? model::MessageArgument(model::say<MessageCode::numberTooLarge>())
                : model::MessageArgument(complaint(error.what()));
        throw Refusal{brokenAt(mText, position == 0 ? 0 : position - 1, reason)};
    }

private:
    /// An array or object whose end has not come yet.
    struct Frame {
        Value value;
        std::string name; ///< of the member that is being read
        std::unordered_set<std::string> names;
    };

    Pointer place() const {
        Pointer pointer;
        for (const Frame& frame : mOpen) {
            const Items* items = std::get_if<Items>(&frame.value.content);
            pointer = items ? pointer / items->size() : pointer / frame.name;
        }
        return pointer;
    }

    void check(const std::string& text) const {
        if (text.size() > limits::textLength && utf16Length(text) > limits::textLength)
            refuse<MessageCode::textTooLong>(place(), limits::textLength);
        if (text.find('\0') != std::string::npos) refuse<MessageCode::zeroInText>(place());
    }

    bool open(Value value) {
        if (mOpen.size() == limits::depth)
            refuse<MessageCode::levelsTooDeep>(place(), limits::depth);
        mOpen.push_back({std::move(value), {}, {}});
        return true;
    }

    bool close() {
        Value value = std::move(mOpen.back().value);
        mOpen.pop_back();
        return add(std::move(value));
    }

    bool add(Value value) {
        if (++mCount > limits::values) refuse<MessageCode::tooManyValues>(place(), limits::values);
        if (mOpen.empty()) {
            mRoot = std::move(value);
            return true;
        }
        Frame& frame = mOpen.back();
        if (Items* items = std::get_if<Items>(&frame.value.content))
            items->push_back(std::move(value));
        else
            std::get<Members>(frame.value.content)
                .push_back({std::move(frame.name), std::move(value)});
        return true;
    }

    const std::string_view mText;
    std::vector<Frame> mOpen;
    Value mRoot;
    std::size_t mCount = 0;
};

} // namespace

Value read(std::string_view text) {
    if (text.size() > limits::fileSize)
        throw Refusal{model::say<MessageCode::fileTooLarge>(Pointer().shown(),
                                                            limits::fileSize / 1024 / 1024),
                      model::say<MessageCode::chooseQueryFile>()};
    Builder builder(text);
    nlohmann::json::sax_parse(text.begin(), text.end(), &builder);
    return builder.result();
}

} // namespace zandor::files::json
