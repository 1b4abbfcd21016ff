#include "must.h"

#include "model/criteria/QueryColumns.h"

#include <Zandor/sql/Printer.h>

#include <Zandor/sql/Builder.h>

#include <algorithm>

using namespace zandor;

namespace {

using model::ColumnType;
using platform::String;
using platform::StringView;

constexpr int typeCount = static_cast<int>(ColumnType::Blob) + 1;

bool isOneLine(StringView text) {
    return !text.empty() && std::none_of(text.begin(), text.end(), [](char16_t c) {
        return c == u'\n' || c == u'\r' || c == u'\0';
    });
}

/// Two tables that share a column's name, with a column of each type.
platform::Ref<model::Query> someQuery() {
    auto query = platform::makeRef<model::Query>();
    model::TableDescription one{u"", u"orders", {{u"id", ColumnType::Integer, u"", true}}};
    for (int type = 0; type < typeCount; ++type)
        one.columns.push_back(
            {u"c" + platform::decimal(type), static_cast<ColumnType>(type), u"", false});
    query->addTable(one);
    query->addTable(
        {u"sales",
         u"a \"b] c",
         {{u"id", ColumnType::Text, u"", false}, {u"or", ColumnType::Date, u"", false}}});
    return query;
}

void print(const model::sql::Node& condition) {
    namespace sql = model::sql;
    sql::Statement statement;
    statement.items.push_back({sql::AllColumns{u"orders"}, u""});
    statement.from.push_back(
        std::make_shared<const sql::Source>(sql::Source{sql::TableRef{u"", u"orders", u"orders"}}));
    statement.where = condition;
    for (const sql::Dialect dialect : sql::allDialects) {
        for (const sql::ValueForm form : {sql::ValueForm::bound, sql::ValueForm::literal}) {
            const auto printed = sql::print(statement, dialect, form);
            if (const auto* refusal = std::get_if<sql::Refusal>(&printed)) {
                must(isOneLine(refusal->message.text()), "a refusal of one line");
                continue;
            }
            const auto& text = std::get<sql::Printed>(printed).text;
            must(!text.empty(), "a statement");
            const auto again = sql::print(statement, dialect, form);
            must(std::get<sql::Printed>(again).text == text, "the same text each time");
        }
    }
}

/// A criterion of a column of the type, read by itself and in its query.
void use(const String& text, int type, model::sql::Dialect dialect) {
    const auto query = someQuery();
    const model::criteria::QueryColumns columns(query->Tables());
    const auto table = query->tableNamed(u"orders");
    const auto column = table->columnNamed(u"c" + platform::decimal(type));
    const auto reading =
        model::criteria::read(text, model::criteria::columnRef(*column, *table), columns);
    must(!(reading.error && reading.condition), "an error or a condition");
    if (reading.error) {
        must(reading.error->position <= text.size(), "a position in the text");
        must(isOneLine(reading.error->message.text()), "an error of one line");
    }
    if (reading.condition) print(reading.condition);

    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(column);
    definition->AddCriterium(text, u"4");
    query->AddColumnDefinition(definition);
    const auto statement = model::sql::statementText(*query, dialect, model::sql::ValueForm::bound);
    must(statement.runnable() || !statement.findings.empty(), "a statement or a reason");
    query->renameTable(table, u"an Or [other");
    for (const auto& finding : model::sql::build(*query).findings)
        must(isOneLine(finding.text()), "a finding of one line");
}

/// The text as an expression, with a total and beside one.
void useExpression(const String& text, int type, model::sql::Dialect dialect) {
    const auto query = someQuery();
    const auto totals = static_cast<int>(model::lastTotal) + 1;
    for (const auto total : {static_cast<model::Total>(type % totals), model::Total::Count}) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->expression(text);
        definition->total(total);
        definition->AddCriterium(text, u"5");
        query->AddColumnDefinition(definition);
    }
    const auto statement = model::sql::statementText(*query, dialect, model::sql::ValueForm::bound);
    must(text.empty() || statement.runnable() || !statement.findings.empty(),
         "a statement or a reason");
    query->renameTable(query->tableNamed(u"orders"), u"an Or [other");
    for (const auto& finding : model::sql::build(*query).findings)
        must(isOneLine(finding.text()), "a finding of one line");
}

} // namespace

/// The first byte has the encoding of the rest, UTF-16 or UTF-8, the type and the dialect.
extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) return 0;
    const int type = data[0] / 2 % typeCount;
    const auto dialect = model::sql::allDialects[data[0] % std::size(model::sql::allDialects)];
    const std::string_view rest(reinterpret_cast<const char*>(data) + 1, size - 1);
    if (data[0] % 2 != 0) {
        const String text = platform::fromUtf8(rest);
        use(text, type, dialect);
        if (!text.empty()) useExpression(text, type, dialect);
        return 0;
    }
    String text;
    for (std::size_t at = 0; at + 1 < rest.size(); at += 2)
        text += static_cast<char16_t>(static_cast<unsigned char>(rest[at]) |
                                      static_cast<unsigned char>(rest[at + 1]) << 8);
    use(text, type, dialect);
    if (!text.empty()) useExpression(text, type, dialect);
    return 0;
}
