#include "designer/OpenedQuery.h"

#include "designer/ExampleQuery.h"
#include "model/Names.h"
#include "model/reader/Connection.h"
#include "model/reader/addTables.h"

#include <QFileInfo>

namespace designer {

using reader::Error;
using reader::Result;
using reader::TableEntry;
using reader::TableId;

namespace {

Result<std::vector<TableId>> named(const QStringList& names, const std::vector<TableEntry>& present,
                                   const QString& file) {
    if (names.size() > mostTables)
        return Error{QStringLiteral("%1 tables are too many; the canvas takes %2.")
                         .arg(names.size())
                         .arg(mostTables)};
    std::vector<TableId> result;
    for (const QString& name : names) {
        const auto found = std::find_if(present.begin(), present.end(), [&](const auto& entry) {
            return model::sameName(entry.id.name, name.toStdU16String());
        });
        if (found == present.end())
            return Error{QStringLiteral("There is no table \"%1\" in %2.").arg(name, file)};
        result.push_back(found->id);
    }
    return result;
}

std::vector<TableId> firstOf(const std::vector<TableEntry>& present) {
    std::vector<TableId> result;
    for (const TableEntry& entry : present) {
        if (result.size() == mostTables) break;
        result.push_back(entry.id);
    }
    return result;
}

QString counted(std::int32_t count, const char* one, const char* many) {
    return QStringLiteral("%1 %2").arg(count).arg(QLatin1String(count == 1 ? one : many));
}

QString contents(model::Query& query, std::size_t present, bool chosen) {
    QString text = counted(query.Tables().Count(), "table", "tables") + QStringLiteral(", ") +
                   counted(query.Joins().Count(), "join", "joins");
    if (!chosen && present > static_cast<std::size_t>(query.Tables().Count()))
        text += QStringLiteral(" \u2014 of %1 tables in the database; choose with --tables")
                    .arg(present);
    return text;
}

} // namespace

Result<OpenedQuery> openQuery(const Arguments& arguments, const QString& sample,
                              std::int32_t canvasWidth) {
    const QString file = arguments.file.isEmpty() ? sample : arguments.file;
    auto connection = reader::openSqlite(file);
    if (!connection) return Error{connection.error()};
    const auto schema = reader::makeSqliteReader(connection->database());
    const auto present = schema->tables();
    if (!present) return Error{present.error()};

    const bool example = arguments.file.isEmpty() && arguments.tables.isEmpty();
    const QStringList names = example ? exampleTables() : arguments.tables;
    auto chosen = names.isEmpty() ? firstOf(*present) : named(names, *present, file);
    if (!chosen) return Error{chosen.error()};

    OpenedQuery opened;
    opened.query = platform::makeRef<model::Query>();
    const auto added = reader::addTables(*opened.query, *schema, *chosen, canvasWidth);
    if (!added) return Error{added.error()};
    if (opened.query->Joins().Count() > mostJoins)
        return Error{QStringLiteral("These tables have %1 joins, and the canvas takes %2; choose "
                                    "fewer tables with --tables.")
                         .arg(opened.query->Joins().Count())
                         .arg(mostJoins)};
    if (example) {
        placeInARow(*added);
        addExampleColumns(*opened.query);
    }
    opened.name = QFileInfo(file).fileName();
    opened.message = contents(*opened.query, present->size(), !names.isEmpty());
    return opened;
}

} // namespace designer
