#include "model/sql_reader/Drawing.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/StatementReader.h"
#include "model/sql_reader/parse.h"

#include <algorithm>

namespace zandor::sql_reader {

namespace {

constexpr std::size_t longest = 100'000;

Refusal refusalAt(StringView text, Message message, std::size_t position) {
    position = std::min(position, text.size());
    const StringView before = text.substr(0, position);
    const auto lines = std::count(before.begin(), before.end(), u'\n');
    const std::size_t lineBreak = before.rfind(u'\n');
    const std::size_t begin = lineBreak == StringView::npos ? 0 : lineBreak + 1;
    return {std::move(message), position, static_cast<std::int32_t>(lines + 1),
            static_cast<std::int32_t>(position - begin + 1)};
}

Ref<model::Query> readParsed(const ParserText& text, Dialect dialect, const Schema& schema) {
    const nlohmann::json parsed = parse(text.text);
    const Tree tree = Tree::ofParts(parsed);
    const auto statements = tree.list("stmts");
    if (statements.empty()) refuse<MessageCode::noStatement>(0);
    if (statements.size() > 1)
        refuse<MessageCode::oneStatement>(
            static_cast<std::size_t>(parsed["stmts"][1].value("stmt_location", 0)));
    const Tree statement = Tree(parsed["stmts"][0]["stmt"]);
    return drawn(StatementReader(schema, text, dialect).select(statement));
}

} // namespace

Drawn read(StringView text, Dialect dialect, const Schema& schema) {
    if (text.size() > longest)
        return refusalAt(text, model::say<MessageCode::tooLong>(longest), longest);
    ParserText lexedText;
    try {
        lexedText = lexed(text, dialect);
    } catch (const Refused& refused) {
        return refusalAt(text, refused.message, refused.place);
    }
    try {
        return readParsed(lexedText, dialect, schema);
    } catch (const Refused& refused) {
        const bool behind = refused.place >= lexedText.text.size();
        return refusalAt(text, refused.message,
                         behind ? text.size() : lexedText.origin(refused.place));
    }
}

} // namespace zandor::sql_reader
