#include "designer/OpenedQuery.h"

#include "designer/ExampleQuery.h"
#include "designer/tables/leftOutWords.h"
#include "designer/tr.h"

#include <Zandor/model/Names.h>
#include <Zandor/reader/addTables.h>

namespace zandor::designer {

using reader::Error;
using reader::Result;
using reader::TableEntry;
using reader::TableId;

namespace {

Result<std::vector<TableId>> named(const QStringList& names, const std::vector<TableEntry>& present,
                                   const QString& file) {
    if (names.size() > mostTables)
        return Error{
            tr("%1 tables are too many; the canvas takes %2.").arg(names.size()).arg(mostTables)};
    std::vector<TableId> result;
    for (const QString& name : names) {
        const auto found = std::find_if(present.begin(), present.end(), [&](const auto& entry) {
            return model::sameName(entry.id.name, name.toStdU16String());
        });
        if (found == present.end())
            return Error{tr("There is no table \"%1\" in %2.").arg(name, file)};
        result.push_back(found->id);
    }
    return result;
}

} // namespace

Result<OpenedQuery> openQuery(reader::DatabaseReader& schema,
                              const std::vector<TableEntry>& present, const FirstTables& wanted) {
    const bool example = wanted.example && wanted.names.isEmpty();
    const QStringList names = example ? exampleTables() : wanted.names;
    const auto chosen = named(names, present, wanted.database);
    if (!chosen) return chosen.failure();

    OpenedQuery opened;
    opened.query = platform::makeRef<model::Query>();
    std::vector<reader::LeftOut> leftOut;
    const auto added =
        reader::addTables(*opened.query, schema, *chosen, wanted.canvasWidth, &leftOut);
    if (!added) return added.failure();
    if (opened.query->Joins().Count() > mostJoins)
        return Error{tr("These tables have %1 joins, and the canvas takes %2; choose fewer tables "
                        "with --tables.")
                         .arg(opened.query->Joins().Count())
                         .arg(mostJoins)};
    if (example) {
        placeInARow(*added);
        addExampleColumns(*opened.query);
    }
    opened.message = leftOutWords(leftOut);
    return opened;
}

} // namespace zandor::designer
