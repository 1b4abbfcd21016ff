#include "model/sql_reader/parse.h"

#include "model/sql_reader/Refused.h"

#include <pg_query.h>

#include <Zandor/model/Names.h>

namespace zandor::sql_reader {

namespace {

/// The parser counts characters, from 1.
std::size_t byteOf(const std::string& text, int character) {
    std::size_t byte = 0;
    for (int n = 1; byte < text.size(); ++byte) {
        const bool begins = (static_cast<unsigned char>(text[byte]) & 0xC0U) != 0x80U;
        if (begins && n++ == character) break;
    }
    return byte;
}

/// Whether parts stand in each other deeper than those who walk the tree have room for.
bool isTooDeep(std::string_view tree) {
    constexpr int deepest = 1500;
    int depth = 0;
    bool quoted = false;
    for (std::size_t i = 0; i < tree.size(); ++i) {
        const char c = tree[i];
        if (c == '"') quoted = !quoted;
        if (quoted && c == '\\') ++i;
        if (quoted) continue;
        if (c == '{') ++depth;
        if (c == '}') --depth;
        if (depth > deepest) return true;
    }
    return false;
}

/// The tree has no numbers below zero: they are taken from the text, where their signs stand, maybe
/// several and with parentheses between.
void fillNegative(nlohmann::json& node, const std::string& text) {
    if (!node.is_structured()) return;
    for (auto& below : node) fillNegative(below, text);
    if (!node.is_object() || !node.contains("ival") || !node.contains("location")) return;
    auto& number = node["ival"];
    if (!number.is_object() || !number.empty()) return;
    std::size_t at = node["location"].get<std::size_t>();
    bool negative = false;
    for (; at < text.size() && (text[at] < '0' || text[at] > '9'); ++at)
        negative = negative != (text[at] == '-');
    std::int64_t value = 0;
    for (; at < text.size() && text[at] >= '0' && text[at] <= '9'; ++at)
        value = value * 10 + (text[at] - '0');
    // A zero keeps its sign, as the text has it.
    if (value == 0 && negative) {
        node.erase("ival");
        node["fval"] = {{"fval", "-0"}};
        return;
    }
    number["ival"] = negative ? -value : value;
}

} // namespace

nlohmann::json parse(const std::string& text) {
    const PgQueryParseResult result = pg_query_parse(text.c_str());
    const auto freed = [&](auto value) {
        pg_query_free_parse_result(result);
        return value;
    };
    if (result.error) {
        const std::size_t place = byteOf(text, result.error->cursorpos);
        // Names have come here in quotes of their own.
        std::string words = result.error->message;
        for (std::size_t at = 0; (at = words.find("\"\"", at)) != std::string::npos;)
            words.erase(at, 1);
        const model::Message message = model::say<MessageCode::notParsed>(
            model::oneLine(platform::fromUtf8(std::string_view(words))));
        throw freed(Refused{message, place});
    }
    if (isTooDeep(result.parse_tree))
        throw freed(Refused{model::say<MessageCode::tooDeep>(), 0});
    nlohmann::json tree = freed(nlohmann::json::parse(result.parse_tree));
    fillNegative(tree, text);
    return tree;
}

} // namespace zandor::sql_reader
