#include "model/sql_reader/Drawing.h"
#include "model/sql_reader/Refused.h"
#include "model/sql_reader/StatementReader.h"
#include "model/sql_reader/parse.h"

#include <Zandor/model/CommentLimit.h>
#include <Zandor/model/Names.h>
#include <Zandor/sql/Builder.h>

#include <algorithm>
#include <array>

namespace zandor::sql_reader {

namespace {

Refusal refusalAt(StringView text, Message message, std::size_t position) {
    position = std::min(position, text.size());
    const StringView before = text.substr(0, position);
    const auto lines = std::count(before.begin(), before.end(), u'\n');
    const std::size_t lineBreak = before.rfind(u'\n');
    const std::size_t begin = lineBreak == StringView::npos ? 0 : lineBreak + 1;
    return {std::move(message), position, static_cast<std::int32_t>(lines + 1),
            static_cast<std::int32_t>(position - begin + 1)};
}

/// The first word, where it is one that other statements begin with.
bool isOtherStatement(StringView text) {
    constexpr auto words = std::to_array<StringView>(
        {u"alter",    u"begin", u"call",     u"commit",  u"create",  u"delete",
         u"describe", u"drop",  u"exec",     u"execute", u"explain", u"grant",
         u"insert",   u"merge", u"pragma",   u"replace", u"revoke",  u"rollback",
         u"set",      u"show",  u"truncate", u"update",  u"use"});
    const auto isLetter = [](char16_t c) {
        return (c >= u'a' && c <= u'z') || (c >= u'A' && c <= u'Z');
    };
    const auto begin = std::find_if(text.begin(), text.end(), isLetter);
    const auto end = std::find_if_not(begin, text.end(), isLetter);
    const String first = model::foldedName(StringView(begin, end));
    return std::find(words.begin(), words.end(), first) != words.end();
}

/// Without what stands around it.
StringView trimmed(StringView text) {
    constexpr StringView around = u" \t\r\n;";
    const std::size_t begin = text.find_first_not_of(around);
    if (begin == StringView::npos) return {};
    return text.substr(begin, text.find_last_not_of(around) + 1 - begin);
}

/// With one blank for each place of them, and truth as the number that stands for it beside a
/// column of that name.
String comparable(StringView text) {
    String out;
    for (const char16_t c : text) {
        const bool blank = c == u' ' || c == u'\n' || c == u'\t' || c == u'\r';
        if (!blank)
            out += c;
        else if (!out.empty() && out.back() != u' ')
            out += u' ';
    }
    for (const auto& [word, number] : {std::pair(u"TRUE", u'1'), std::pair(u"FALSE", u'0')})
        for (auto at = out.find(word); at != String::npos; at = out.find(word, at))
            out.replace(at, StringView(word).size(), 1, number);
    return out;
}

Ref<model::Query> readParsed(StringView typed, const ParserText& text, Dialect dialect,
                             const Schema& schema) {
    if (text.comments.size() > model::mostComments)
        refuse<MessageCode::tooManyComments>(text.comments[model::mostComments].byte,
                                             model::mostComments);
    const nlohmann::json parsed = parse(text.text);
    const Tree tree = Tree::ofParts(parsed);
    const auto statements = tree.list("stmts");
    if (statements.empty()) refuse<MessageCode::noStatement>(0);
    if (statements.size() > 1)
        refuse<MessageCode::oneStatement>(
            static_cast<std::size_t>(parsed["stmts"][1].value("stmt_location", 0)));
    const Tree statement = Tree(parsed["stmts"][0]["stmt"]);
    const auto written = [&](model::Query& query) {
        return model::sql::statementText(query, dialect, model::sql::ValueForm::literal).text;
    };
    const auto isWhole = [&](model::Query& query) { return written(query) == trimmed(typed); };
    const String whole = comparable(typed);
    const StatementReader::IsWritten isPart = [&](model::Query& query) {
        return whole.find(comparable(written(query))) != String::npos;
    };
    const auto readAs = [&](const ParserText& meant) {
        return drawn(StatementReader(schema, meant, dialect, isPart).select(statement), isWhole);
    };
    auto query = readAs(text);
    if (text.text.find("CAST('") == std::string::npos || isWhole(*query)) return query;
    // PostgreSQL's parser has one tree for CAST('2024-05-01' AS date) and DATE '2024-05-01'.
    ParserText asWritten = text;
    asWritten.keepsCasts = true;
    try {
        if (auto other = readAs(asWritten); isWhole(*other)) query = std::move(other);
    } catch (const Refused&) {
        return query;
    }
    return query;
}

} // namespace

Drawn read(StringView text, Dialect dialect, const Schema& schema) {
    if (text.size() > longestText)
        return refusalAt(text, model::say<MessageCode::tooLong>(longestText), longestText);
    // The parser would take it for the end.
    if (const auto zero = text.find(u'\0'); zero != StringView::npos)
        return refusalAt(text, model::say<MessageCode::notParsed>(u"U+0000"), zero);
    ParserText lexedText;
    try {
        lexedText = lexed(text, dialect);
    } catch (const Refused& refused) {
        return refusalAt(text, refused.message, refused.place);
    }
    if (isOtherStatement(platform::fromUtf8(std::string_view(lexedText.text))))
        return refusalAt(text, model::say<MessageCode::selectOnly>(), lexedText.origin(0));
    try {
        return readParsed(text, lexedText, dialect, schema);
    } catch (const Refused& refused) {
        const bool behind = refused.place >= lexedText.text.size();
        return refusalAt(text, refused.message,
                         behind ? text.size() : lexedText.origin(refused.place));
    }
}

} // namespace zandor::sql_reader
