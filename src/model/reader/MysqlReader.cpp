#include <Zandor/DatabaseReader.h>

#include "model/reader/columnType.h"
#include "model/reader/sortByName.h"

#include <Zandor/reader/rows.h>

#include <algorithm>
#include <array>

namespace zandor::reader {

namespace {

/// Reads information_schema, each time of one table: with its names as constants the engine opens
/// that table and no other.
class MysqlReader final : public DatabaseReader {
public:
    explicit MysqlReader(const QSqlDatabase& database) : mDatabase(database) {}

    Result<std::vector<TableEntry>> tables() override;
    Result<model::TableDescription> table(const TableId& id) override;
    Result<std::vector<ForeignKey>> foreignKeys(const TableId& child) override;

private:
    Error whyWithoutColumns(const TableId& id) const;

    QSqlDatabase mDatabase;
};

/// A schema as ids have it: empty for the database that the session is in.
QString schemaColumn(const char* column) {
    return QStringLiteral("IF(%1 = DATABASE(), '', %1)").arg(QLatin1String(column));
}

/// The table that an id names in one of the views of information_schema.
QString named(const TableId& id) {
    return QStringLiteral("table_schema = %1 AND table_name = ?")
        .arg(id.schema.empty() ? QStringLiteral("DATABASE()") : QStringLiteral("?"));
}

/// What named() has to be given.
QVariantList namesOf(const TableId& id) {
    if (id.schema.empty()) return {toQt(id.name)};
    return {toQt(id.schema), toQt(id.name)};
}

QString quoted(const platform::String& name) {
    return u'`' + toQt(name).replace(u'`', QStringLiteral("``")) + u'`';
}

/// `kind` is the type's name alone; a word in an ENUM's list would be taken for another.
model::ColumnType typeOf(const QString& kind, const QString& declared) {
    using model::ColumnType;
    static constexpr std::array<std::pair<const char*, ColumnType>, 10> own = {{
        {"enum", ColumnType::Text},
        {"set", ColumnType::Text},
        {"inet4", ColumnType::Text},
        {"inet6", ColumnType::Text},
        {"bit", ColumnType::Integer}, // compared as a number
        // these have INT in them
        {"multipoint", ColumnType::Unknown},
        {"point", ColumnType::Unknown},
        {"linestring", ColumnType::Unknown},
        {"multilinestring", ColumnType::Unknown},
        {"geometrycollection", ColumnType::Unknown},
    }};
    // BOOLEAN is a word for the second.
    if (declared == u"bit(1)" || declared == u"tinyint(1)") return ColumnType::Boolean;
    const auto known = std::find_if(own.begin(), own.end(), [&](const auto& each) {
        return kind == QLatin1String(each.first);
    });
    return known == own.end() ? columnType(kind.toStdU16String()) : known->second;
}

Result<std::vector<TableEntry>> MysqlReader::tables() {
    std::vector<TableEntry> entries;
    // A server's databases have little to do with each other; only who has chosen none sees all.
    const auto error = readRows(
        mDatabase, model::say<MessageCode::tablesNotRead>(),
        QStringLiteral("SELECT %1, table_name, table_type LIKE '%VIEW' "
                       "FROM information_schema.tables WHERE table_type <> 'SEQUENCE' "
                       "AND table_type NOT LIKE '%TEMPORARY' AND (table_schema = DATABASE() OR "
                       "DATABASE() IS NULL AND table_schema NOT IN ('information_schema', "
                       "'performance_schema', 'mysql', 'sys'))")
            .arg(schemaColumn("table_schema")),
        {}, [&](const QSqlQuery& row) {
            entries.push_back({{textAt(row, 0), textAt(row, 1)}, row.value(2).toBool()});
        });
    if (error) return *error;
    sortByName(entries);
    return entries;
}

Result<model::TableDescription> MysqlReader::table(const TableId& id) {
    model::TableDescription description{id.schema, id.name, {}};
    // The mark of a column as one of the primary key is given to a unique one too, without that.
    const auto error = readRows(
        mDatabase, model::say<MessageCode::tableNotRead>(id.name),
        QStringLiteral("SELECT column_name, data_type, column_type, column_name IN "
                       "(SELECT column_name FROM information_schema.statistics "
                       "WHERE index_name = 'PRIMARY' AND %1) "
                       "FROM information_schema.columns WHERE %1 ORDER BY ordinal_position")
            .arg(named(id)),
        namesOf(id) + namesOf(id), [&](const QSqlQuery& row) {
            const QString declared = row.value(2).toString();
            description.columns.push_back({textAt(row, 0),
                                           typeOf(row.value(1).toString(), declared),
                                           declared.toStdU16String(), row.value(3).toBool()});
        });
    if (error) return *error;
    if (description.columns.empty()) return whyWithoutColumns(id);
    return description;
}

/// A view of what is there no more has no columns either; the engine says so only when it is used.
Error MysqlReader::whyWithoutColumns(const TableId& id) const {
    bool found = false;
    const auto failed = model::say<MessageCode::tableNotRead>(id.name);
    auto error =
        readRows(mDatabase, failed,
                 QStringLiteral("SELECT 1 FROM information_schema.tables WHERE ") + named(id),
                 namesOf(id), [&](const QSqlQuery&) { found = true; });
    if (found && !error) {
        const QString schema = id.schema.empty() ? QString() : quoted(id.schema) + u'.';
        error = readRows(mDatabase, failed,
                         QStringLiteral("SHOW COLUMNS FROM ") + schema + quoted(id.name), {},
                         [](const QSqlQuery&) {});
    }
    return error ? *error : Error{model::say<MessageCode::noSuchTable>(id.name)};
}

Result<std::vector<ForeignKey>> MysqlReader::foreignKeys(const TableId& child) {
    std::vector<ForeignKey> keys;
    // The engine forgets the order of declaration, but numbers those that have no name.
    const auto error = readRows(
        mDatabase, model::say<MessageCode::foreignKeysNotRead>(child.name),
        QStringLiteral("SELECT ordinal_position, %1, referenced_table_name, column_name, "
                       "referenced_column_name FROM information_schema.key_column_usage "
                       "WHERE referenced_table_name IS NOT NULL AND %2 "
                       "ORDER BY CHAR_LENGTH(constraint_name), constraint_name, ordinal_position")
            .arg(schemaColumn("referenced_table_schema"), named(child)),
        namesOf(child), [&](const QSqlQuery& row) {
            if (row.value(0).toInt() == 1)
                keys.push_back({child, {textAt(row, 1), textAt(row, 2)}, {}});
            keys.back().columns.emplace_back(textAt(row, 3), textAt(row, 4));
        });
    if (error) return *error;
    return keys;
}

} // namespace

std::unique_ptr<DatabaseReader> makeMysqlReader(const QSqlDatabase& database) {
    return std::make_unique<MysqlReader>(database);
}

} // namespace zandor::reader
