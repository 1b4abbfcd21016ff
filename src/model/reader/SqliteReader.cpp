#include <Zandor/DatabaseReader.h>

#include "model/reader/columnType.h"
#include "model/reader/namesInJson.h"
#include "model/reader/sortByName.h"

#include <Zandor/reader/rows.h>

#include <utility>

namespace zandor::reader {

namespace {

/// The pragmas as tables, for as such they take a name as a bound parameter, whatever characters it
/// has.
class SqliteReader final : public DatabaseReader {
public:
    explicit SqliteReader(const QSqlDatabase& database) : mDatabase(database) {}

    Result<std::vector<TableEntry>> tables() override;
    Result<model::TableDescription> table(const TableId& id) override;
    Result<std::vector<ForeignKey>> foreignKeys(const TableId& child) override;

private:
    static QString schemaOf(const TableId& id) {
        return id.schema.empty() ? QStringLiteral("main") : toQt(id.schema);
    }
    Result<std::vector<String>> primaryKey(const TableId& id) const;

    QSqlDatabase mDatabase;
};

Result<std::vector<TableEntry>> SqliteReader::tables() {
    const auto failed = model::say<MessageCode::tablesNotRead>();
    const QString notItsOwn = QStringLiteral(" AND name NOT LIKE 'sqlite\\_%' ESCAPE '\\'");
    std::vector<TableEntry> entries;
    bool hasVirtual = false;
    // Neither a view nor a virtual table has a page of its own.
    auto error = readRows(mDatabase, failed,
                          QStringLiteral("SELECT name, type = 'view' FROM sqlite_master "
                                         "WHERE rootpage = 0 AND type IN ('table', 'view')") +
                              notItsOwn,
                          {}, [&](const QSqlQuery& row) {
                              if (row.value(1).toBool())
                                  entries.push_back({{{}, textAt(row, 0)}, true});
                              else
                                  hasVirtual = true;
                          });
    if (error) return *error;
    // The list of tables alone tells those that a virtual one keeps for itself, but it reads the
    // columns of all tables for it.
    error = readRows(mDatabase, failed,
                     QStringLiteral("SELECT json_group_array(name) FROM ") +
                         (hasVirtual ? QStringLiteral("pragma_table_list WHERE schema = 'main' AND "
                                                      "type IN ('table', 'virtual')")
                                     : QStringLiteral("sqlite_master WHERE type = 'table'")) +
                         notItsOwn,
                     {}, [&](const QSqlQuery& row) {
                         forEachName(row.value(0).toString(), [&](String name) {
                             entries.push_back({{{}, std::move(name)}, false});
                         });
                     });
    if (error) return *error;
    sortByName(entries);
    return entries;
}

Result<model::TableDescription> SqliteReader::table(const TableId& id) {
    model::TableDescription description{id.schema, id.name, {}};
    constexpr int hiddenInVirtualTable = 1; // generated columns, 2 and 3, are like any other
    const auto error =
        readRows(mDatabase, model::say<MessageCode::tableNotRead>(id.name),
                 QStringLiteral("SELECT name, type, pk, hidden FROM pragma_table_xinfo(?, ?)"),
                 {toQt(id.name), schemaOf(id)}, [&](const QSqlQuery& row) {
                     if (row.value(3).toInt() == hiddenInVirtualTable) return;
                     const String type = textAt(row, 1);
                     description.columns.push_back(
                         {textAt(row, 0), columnType(type), type, row.value(2).toInt() > 0});
                 });
    if (error) return *error;
    if (description.columns.empty()) return Error{model::say<MessageCode::noSuchTable>(id.name)};
    return description;
}

Result<std::vector<String>> SqliteReader::primaryKey(const TableId& id) const {
    std::vector<String> columns;
    const auto error = readRows(
        mDatabase, model::say<MessageCode::primaryKeyNotRead>(id.name),
        QStringLiteral("SELECT name FROM pragma_table_xinfo(?, ?) WHERE pk > 0 ORDER BY pk"),
        {toQt(id.name), schemaOf(id)},
        [&](const QSqlQuery& row) { columns.push_back(textAt(row, 0)); });
    if (error) return *error;
    return columns;
}

Result<std::vector<ForeignKey>> SqliteReader::foreignKeys(const TableId& child) {
    std::vector<ForeignKey> keys;
    const auto error = readRows(
        mDatabase, model::say<MessageCode::foreignKeysNotRead>(child.name),
        // SQLite numbers them backwards.
        QStringLiteral("SELECT seq, \"table\", \"from\", \"to\" FROM pragma_foreign_key_list(?, ?) "
                       "ORDER BY id DESC, seq"),
        {toQt(child.name), schemaOf(child)}, [&](const QSqlQuery& row) {
            if (row.value(0).toInt() == 0)
                keys.push_back({child, {child.schema, textAt(row, 1)}, {}});
            keys.back().columns.emplace_back(textAt(row, 2), textAt(row, 3));
        });
    if (error) return *error;

    std::vector<ForeignKey> usable;
    for (ForeignKey& key : keys) {
        if (key.columns.front().second.empty()) {
            const auto parent = primaryKey(key.parent);
            if (!parent) return parent.failure();
            if (parent->size() != key.columns.size()) continue;
            for (std::size_t n = 0; n < parent->size(); ++n) key.columns[n].second = (*parent)[n];
        }
        usable.push_back(std::move(key));
    }
    return usable;
}

} // namespace

std::unique_ptr<DatabaseReader> makeSqliteReader(const QSqlDatabase& database) {
    return std::make_unique<SqliteReader>(database);
}

} // namespace zandor::reader
