#include <Zandor/DatabaseReader.h>

#include "model/reader/columnType.h"
#include "model/reader/namesInJson.h"
#include "model/reader/sortByName.h"

#include <Zandor/reader/rows.h>

#include <unordered_set>
#include <utility>

namespace zandor::reader {

namespace {

/// Reads pg_catalog, which knows materialized views, partitioned and foreign tables and domains;
/// information_schema knows less, and only what the user owns.
class PostgresReader final : public DatabaseReader {
public:
    explicit PostgresReader(const QSqlDatabase& database) : mDatabase(database) {}

    Result<std::vector<TableEntry>> tables() override;
    Result<model::TableDescription> table(const TableId& id) override;
    Result<std::vector<ForeignKey>> foreignKeys(const TableId& child) override;

private:
    QSqlDatabase mDatabase;
};

/// A table's schema as ids have it: empty when a statement finds the table without being told,
/// which is when it is in the default schema and the engine, which searches its own first, has none
/// of that name. The engine's function for that looks up every table by itself, which takes several
/// times as long.
String toldSchema(const String& schema, bool isDefault, bool engineHasTheName) {
    return isDefault && !engineHasTheName ? String() : schema;
}

/// The table that an id names; two parameters, schema and name. Not to_regclass, which reads the
/// name as SQL does.
const QString isNamed =
    QStringLiteral("n.nspname = coalesce(nullif(?, ''), current_schema()) AND c.relname = ?");

/// What a column's type means. `base` is the declared type or, of a domain, the one it is made
/// from. Only the engine's own types are known by name: another's may have any.
///
/// A text is what the engine compares with a pattern. What it does not is left unknown, also where
/// its values are written as texts: then a pattern is compared with what it reads like.
model::ColumnType typeOf(const QString& base, const QString& category, bool builtIn) {
    using model::ColumnType;
    const char16_t kind = category.isEmpty() ? u'X' : category.front().unicode();
    switch (kind) {
    case u'A': // arrays
    case u'C': // rows
    case u'E': // enumerations
    case u'R': // ranges
        return ColumnType::Unknown;
    default: break;
    }
    static const QStringList unlikeText = {QStringLiteral("json"), QStringLiteral("jsonb"),
                                           QStringLiteral("uuid"), QStringLiteral("xml")};
    if (builtIn && unlikeText.contains(base)) return ColumnType::Unknown;
    // A number of its own, which is compared with what reads like one and not with numbers.
    if (builtIn && base == u"money") return ColumnType::Text;
    if (builtIn) return columnType(base.toStdU16String());
    switch (kind) {
    case u'B': return ColumnType::Boolean;
    case u'D': return ColumnType::Timestamp;
    case u'N': return ColumnType::Decimal;
    case u'S': return ColumnType::Text;
    default: return ColumnType::Unknown;
    }
}

/// The declared type; with what a domain is made from where the engine has no operators for that
/// domain: those of arrays, rows, enumerations, shapes and ranges are none of a domain's, and texts
/// of a form have none. A list of domains comes with what they are made from in the end, which says
/// whether the engine can compare it.
platform::String declaredAs(const QSqlQuery& row) {
    const platform::String declared = textAt(row, 1);
    const platform::String base = textAt(row, 2);
    const bool domain = row.value(6).toBool();
    const platform::String list = row.isNull(7) ? base : textAt(row, 7) + u"[]";
    if (!domain && list != base) return declared + u" AS " + list;
    const bool without = QStringLiteral("ACEGR").contains(row.value(3).toString()) ||
                         base == u"json" || base == u"xml";
    return domain && without ? declared + u" AS " + base : declared;
}

Result<std::vector<TableEntry>> PostgresReader::tables() {
    std::vector<TableEntry> entries;
    std::unordered_set<String> engines; // the names that it has of its own
    String defaultSchema;
    // A partition is a part of its table, of which there may be thousands. A row for each table
    // takes longer than the rest together, and a join with the schemas would be made for each.
    const auto error = readRows(
        mDatabase, model::say<MessageCode::tablesNotRead>(),
        QStringLiteral(
            "SELECT n.nspname, n.nspname = current_schema(), are.views, "
            "n.oid = 'pg_catalog'::regnamespace, are.names FROM ("
            "SELECT relnamespace, relkind IN ('v', 'm') AS views, json_agg(relname) AS names "
            "FROM pg_catalog.pg_class WHERE relnamespace = 'pg_catalog'::regnamespace OR "
            "relkind IN ('r', 'p', 'f', 'v', 'm') AND NOT relispartition AND relnamespace = ANY ("
            "ARRAY(SELECT oid FROM pg_catalog.pg_namespace WHERE nspname <> 'information_schema' "
            "AND nspname NOT LIKE 'pg\\_%')) GROUP BY relnamespace, views) are "
            "JOIN pg_catalog.pg_namespace n ON n.oid = are.relnamespace"),
        {}, [&](const QSqlQuery& row) {
            const String schema = textAt(row, 0);
            if (row.value(1).toBool()) defaultSchema = schema;
            const bool areViews = row.value(2).toBool();
            const bool areTheEngines = row.value(3).toBool();
            forEachName(row.value(4).toString(), [&](String name) {
                if (areTheEngines)
                    engines.insert(std::move(name));
                else
                    entries.push_back({{schema, std::move(name)}, areViews});
            });
        });
    if (error) return *error;
    sortByName(entries); // by all schemas, told or not
    for (TableEntry& entry : entries)
        entry.id.schema = toldSchema(entry.id.schema, entry.id.schema == defaultSchema,
                                     engines.contains(entry.id.name));
    return entries;
}

Result<model::TableDescription> PostgresReader::table(const TableId& id) {
    model::TableDescription description{id.schema, id.name, {}};
    bool found = false;
    const auto error = readRows(
        mDatabase, model::say<MessageCode::tableNotRead>(id.name),
        // A table without columns is one row without a name.
        QStringLiteral(
            "SELECT a.attname, pg_catalog.format_type(a.atttypid, a.atttypmod), "
            "pg_catalog.format_type(base.oid, NULL), base.typcategory, "
            "base.typnamespace = 'pg_catalog'::regnamespace, "
            "coalesce(a.attnum = ANY (pk.indkey), false), base.oid <> a.atttypid, "
            "pg_catalog.format_type(part.oid, NULL) "
            "FROM pg_catalog.pg_class c "
            "JOIN pg_catalog.pg_namespace n ON n.oid = c.relnamespace "
            "LEFT JOIN pg_catalog.pg_index pk ON pk.indrelid = c.oid AND pk.indisprimary "
            "LEFT JOIN pg_catalog.pg_attribute a "
            "ON a.attrelid = c.oid AND a.attnum > 0 AND NOT a.attisdropped "
            "LEFT JOIN LATERAL (WITH RECURSIVE chain AS ("
            "SELECT t.oid, t.typbasetype, t.typcategory, t.typnamespace "
            "FROM pg_catalog.pg_type t WHERE t.oid = a.atttypid UNION ALL "
            "SELECT t.oid, t.typbasetype, t.typcategory, t.typnamespace "
            "FROM chain JOIN pg_catalog.pg_type t ON t.oid = chain.typbasetype) "
            "SELECT * FROM chain WHERE typbasetype = 0) base ON true "
            // What an array has as elements, in the end.
            "LEFT JOIN LATERAL (WITH RECURSIVE parts AS ("
            "SELECT t.oid, t.typbasetype, t.typelem, 0 AS depth "
            "FROM pg_catalog.pg_type t WHERE t.oid = base.oid AND base.typcategory = 'A' UNION ALL "
            "SELECT t.oid, t.typbasetype, t.typelem, parts.depth + 1 "
            "FROM parts JOIN pg_catalog.pg_type t "
            "ON t.oid = coalesce(nullif(parts.typbasetype, 0), parts.typelem) "
            "AND (parts.typbasetype <> 0 OR t.typarray = parts.oid)) "
            "SELECT * FROM parts WHERE depth > 0 ORDER BY depth DESC LIMIT 1) part ON true "
            "WHERE c.relkind IN ('r', 'p', 'f', 'v', 'm') AND %1 ORDER BY a.attnum")
            .arg(isNamed),
        {toQt(id.schema), toQt(id.name)}, [&](const QSqlQuery& row) {
            found = true;
            if (row.isNull(0)) return;
            description.columns.push_back(
                {textAt(row, 0),
                 typeOf(row.value(2).toString(), row.value(3).toString(), row.value(4).toBool()),
                 declaredAs(row), row.value(5).toBool()});
        });
    if (error) return *error;
    if (!found) return Error{model::say<MessageCode::noSuchTable>(id.name)};
    return description;
}

Result<std::vector<ForeignKey>> PostgresReader::foreignKeys(const TableId& child) {
    std::vector<ForeignKey> keys;
    const auto error = readRows(
        mDatabase, model::say<MessageCode::foreignKeysNotRead>(child.name),
        // A key to a partitioned table stands there once more for every partition: those are left
        // out. One that a partition has from its parent is its own.
        QStringLiteral("SELECT pair.position, pn.nspname, pn.nspname = current_schema(), EXISTS ("
                       "SELECT FROM pg_catalog.pg_class hides WHERE hides.relname = p.relname AND "
                       "hides.relnamespace = 'pg_catalog'::regnamespace), "
                       "p.relname, ca.attname, pa.attname "
                       "FROM pg_catalog.pg_constraint k "
                       "JOIN pg_catalog.pg_class c ON c.oid = k.conrelid "
                       "JOIN pg_catalog.pg_namespace n ON n.oid = c.relnamespace "
                       "JOIN pg_catalog.pg_class p ON p.oid = k.confrelid "
                       "JOIN pg_catalog.pg_namespace pn ON pn.oid = p.relnamespace "
                       "CROSS JOIN LATERAL unnest(k.conkey, k.confkey) "
                       "WITH ORDINALITY AS pair(own, other, position) "
                       "JOIN pg_catalog.pg_attribute ca "
                       "ON ca.attrelid = k.conrelid AND ca.attnum = pair.own "
                       "JOIN pg_catalog.pg_attribute pa "
                       "ON pa.attrelid = k.confrelid AND pa.attnum = pair.other "
                       "LEFT JOIN pg_catalog.pg_constraint origin ON origin.oid = k.conparentid "
                       "WHERE k.contype = 'f' AND %1 "
                       "AND origin.conrelid IS DISTINCT FROM k.conrelid "
                       "ORDER BY k.oid, pair.position")
            .arg(isNamed),
        {toQt(child.schema), toQt(child.name)}, [&](const QSqlQuery& row) {
            if (row.value(0).toInt() == 1)
                keys.push_back(
                    {child,
                     {toldSchema(textAt(row, 1), row.value(2).toBool(), row.value(3).toBool()),
                      textAt(row, 4)},
                     {}});
            keys.back().columns.emplace_back(textAt(row, 5), textAt(row, 6));
        });
    if (error) return *error;
    return keys;
}

} // namespace

std::unique_ptr<DatabaseReader> makePostgresReader(const QSqlDatabase& database) {
    return std::make_unique<PostgresReader>(database);
}

} // namespace zandor::reader
