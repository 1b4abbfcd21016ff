#include <Zandor/DatabaseReader.h>

#include "model/reader/sortByName.h"

#include <Zandor/reader/dialectOf.h>
#include <Zandor/reader/rows.h>

#include <QSqlDriver>
#include <QSqlField>
#include <QSqlIndex>
#include <QSqlRecord>

namespace zandor::reader {

namespace {

/// The driver tells a column's type as the one that its values have in Qt.
model::ColumnType typeOf(const QSqlField& field) {
    using model::ColumnType;
    switch (field.metaType().id()) {
    case QMetaType::Bool: return ColumnType::Boolean;
    case QMetaType::Char:
    case QMetaType::SChar:
    case QMetaType::UChar:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::Long:
    case QMetaType::ULong:
    case QMetaType::LongLong:
    case QMetaType::ULongLong: return ColumnType::Integer;
    case QMetaType::Float:
    case QMetaType::Double: return ColumnType::Decimal;
    case QMetaType::QChar:
    case QMetaType::QString: return ColumnType::Text;
    case QMetaType::QDate: return ColumnType::Date;
    case QMetaType::QTime: return ColumnType::Time;
    case QMetaType::QDateTime: return ColumnType::Timestamp;
    case QMetaType::QByteArray: return ColumnType::Blob;
    default: return ColumnType::Unknown;
    }
}

class GenericReader final : public DatabaseReader {
public:
    explicit GenericReader(const QSqlDatabase& database) : mDatabase(database) {}

    Result<std::vector<TableEntry>> tables() override;
    Result<model::TableDescription> table(const TableId& id) override;
    Result<std::vector<ForeignKey>> foreignKeys(const TableId&) override {
        return std::vector<ForeignKey>();
    }

private:
    static QString nameOf(const TableId& id) {
        return id.schema.empty() ? toQt(id.name) : toQt(id.schema + u'.' + id.name);
    }

    QSqlDatabase mDatabase;
};

Result<std::vector<TableEntry>> GenericReader::tables() {
    // A driver says of a failure here nothing but an empty list.
    if (!mDatabase.isOpen()) return Error{model::say<MessageCode::connectionClosed>()};
    std::vector<TableEntry> entries;
    for (const QString& name : mDatabase.tables(QSql::Tables))
        entries.push_back({{{}, name.toStdU16String()}, false});
    for (const QString& name : mDatabase.tables(QSql::Views))
        entries.push_back({{{}, name.toStdU16String()}, true});
    sortByName(entries);
    return entries;
}

Result<model::TableDescription> GenericReader::table(const TableId& id) {
    const QSqlRecord record = mDatabase.record(nameOf(id));
    if (record.isEmpty())
        return Error{model::say<MessageCode::noSuchTable>(nameOf(id).toStdU16String())};
    const QSqlIndex key = mDatabase.primaryIndex(nameOf(id));
    model::TableDescription description{id.schema, id.name, {}};
    for (int n = 0; n < record.count(); ++n) {
        const QSqlField field = record.field(n);
        description.columns.push_back(
            {field.name().toStdU16String(), typeOf(field), {}, key.contains(field.name())});
    }
    return description;
}

} // namespace

std::unique_ptr<DatabaseReader> makeGenericReader(const QSqlDatabase& database) {
    return std::make_unique<GenericReader>(database);
}

std::unique_ptr<DatabaseReader> makeReader(const QSqlDatabase& database) {
    using model::sql::Dialect;
    switch (dialectOf(database)) {
    case Dialect::SQLite: return makeSqliteReader(database);
    case Dialect::PostgreSQL: return makePostgresReader(database);
    case Dialect::MySQL: return makeMysqlReader(database);
    default: return makeGenericReader(database);
    }
}

} // namespace zandor::reader
