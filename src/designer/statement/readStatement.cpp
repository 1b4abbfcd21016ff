#include "designer/statement/readStatement.h"

#include "designer/OpenedQuery.h"
#include "designer/statement/ModelWords.h"
#include "designer/tr.h"

#include <Zandor/SqlReader.h>
#include <Zandor/model/Names.h>
#include <Zandor/qt/Text.h>

#include <QSet>

#include <algorithm>

namespace zandor::designer {

using model::sql::Dialect;
using platform::String;
using platform::StringView;
using platform::qt::fromQt;
using platform::qt::toQt;
using reader::TableEntry;
using reader::TableId;

namespace {

/// A table that is there cannot be read.
struct TableNotRead {
    reader::Error error;
};

/// Looks tables up as the engine of a dialect does.
class Tables {
public:
    explicit Tables(const StatementGround& ground) : mGround(ground) {}

    std::optional<model::TableDescription> find(StringView schema, StringView name) const {
        const TableId* id = listed(schema, name);
        if (!id && !schema.empty()) id = ofDefaultSchema(schema, name);
        if (!id) return {};
        auto description = mGround.reader.table(*id);
        if (!description) throw TableNotRead{description.failure()};
        return *description;
    }

    std::vector<String> names() const {
        std::vector<String> names;
        for (const TableEntry& entry : mGround.tables) names.push_back(entry.id.name);
        return names;
    }

private:
    const TableId* listed(StringView schema, StringView name) const {
        const TableId* alike = nullptr;
        for (const auto& [id, isView] : mGround.tables) {
            if (id.schema == schema && id.name == name) return &id;
            if (!alike && model::sameName(id.schema, schema) && model::sameName(id.name, name))
                alike = &id;
        }
        // PostgreSQL has written bare names small by now, and means quoted ones as they stand.
        return mGround.dialect == Dialect::PostgreSQL ? nullptr : alike;
    }

    /// The default schema is listed without its name: the table is its, where it can be read under
    /// the name given.
    const TableId* ofDefaultSchema(StringView schema, StringView name) const {
        const TableId* id = listed({}, name);
        const bool there = id && mGround.reader.table({String(schema), id->name});
        return there ? id : nullptr;
    }

    const StatementGround& mGround;
};

std::optional<Undrawn> tooMuch(model::Query& query) {
    const auto refuse = [](const QString& words, int most, int count) {
        return Undrawn{words.arg(most).arg(count)};
    };
    if (const int tables = query.Tables().Count(); tables > mostTables)
        return refuse(tr("The drawing takes %1 tables, and the statement has %2."), mostTables,
                      tables);
    if (const int joins = query.Joins().Count(); joins > mostJoins)
        return refuse(tr("The drawing takes %1 joins, and the statement has %2."), mostJoins,
                      joins);
    if (const int columns = query.ColumnDefinitions().Count(); columns > mostOutputColumns)
        return refuse(tr("The grid takes %1 columns, and the statement has %2."), mostOutputColumns,
                      columns);
    return {};
}

} // namespace

QString Undrawn::withPlace() const {
    if (line == 0) return message;
    return inWords(model::say<sql_reader::MessageCode::atPlace>(line, column, fromQt(message)));
}

model::Result<platform::Ref<model::Query>, Undrawn> readStatement(const QString& text,
                                                                  const StatementGround& ground) {
    const Tables tables(ground);
    const sql_reader::Schema schema{
        [&](StringView schema, StringView name) { return tables.find(schema, name); },
        tables.names()};
    try {
        const auto drawn = sql_reader::read(fromQt(text), ground.dialect, schema);
        if (!drawn) {
            const sql_reader::Refusal& refusal = drawn.failure();
            return Undrawn{inWords(refusal.message), static_cast<int>(refusal.position),
                           refusal.line, refusal.column};
        }
        if (auto refusal = tooMuch(**drawn)) return *refusal;
        return *drawn;
    } catch (const TableNotRead& table) {
        return Undrawn{inWords(table.error)};
    }
}

std::vector<TableId> tablesNamedIn(const QString& text, const std::vector<TableEntry>& tables) {
    std::vector<TableId> named;
    for (const TableEntry& entry : tables) {
        const QString name = toQt(entry.id.name);
        const auto isWord = [&](QChar sign) { return sign.isLetterOrNumber() || sign == u'_'; };
        for (qsizetype at = text.indexOf(name, 0, Qt::CaseInsensitive); at >= 0;
             at = text.indexOf(name, at + 1, Qt::CaseInsensitive)) {
            const qsizetype end = at + name.size();
            if ((at > 0 && isWord(text[at - 1])) || (end < text.size() && isWord(text[end])))
                continue;
            named.push_back(entry.id);
            break;
        }
    }
    return named;
}

} // namespace zandor::designer
