#include "designer/tables/TableAdding.h"

#include "designer/DrawingArea.h"
#include "designer/OpenedQuery.h"
#include "designer/canvasSize.h"
#include "designer/database/patiently.h"
#include "designer/database/readTables.h"
#include "designer/document/Document.h"
#include "designer/document/becomeQuery.h"
#include "designer/statement/ModelWords.h"
#include "designer/tables/leftOutWords.h"
#include "designer/tables/placeTables.h"

#include <Zandor/reader/addTables.h>

namespace zandor::designer {

using platform::Each;
using platform::Ref;
using reader::TableId;

namespace {

constexpr int besideCanvas = 24 * twipsPerPixel; // the scroll bar and a little air
// Below it, sixteen tables would reach deeper than the control can say.
constexpr int leastCanvasWidth = 800 * twipsPerPixel;

std::vector<TableId> sourcesOf(model::Query& query) {
    std::vector<TableId> sources;
    for (const auto& each : Each<TalvikZandorLib::ZDTable>(query.Tables())) {
        const auto table = std::static_pointer_cast<model::Table>(each);
        if (!table->savedQuery()) sources.push_back({table->schema(), table->sourceName()});
    }
    return sources;
}

} // namespace

TableAdding::TableAdding(Document& document, Database& database, DrawingArea& area)
    : QObject(&area), mDocument(document), mDatabase(database), mArea(area), mPlaces(document) {}

void TableAdding::add(const std::vector<TableId>& tables, std::optional<QPoint> place) {
    if (tables.empty() || !mDatabase.isOpen()) return;
    if (!hasRoomFor(tables.size()) || !readBefore(tables) || !fits(tables)) return;
    std::vector<reader::LeftOut> leftOut;
    const QString step =
        tables.size() == 1 ? tr("Add table %1").arg(QString::fromStdU16String(tables.front().name))
                           : tr("Add %1 tables").arg(tables.size());
    make(step, place, [&](model::Query& query) {
        const auto added =
            reader::addTables(query, mDatabase.reader(), tables, canvasWidth(), &leftOut);
        return added ? *added : TableList(); // it went well on the copy
    });
    if (const QString what = leftOutWords(leftOut); !what.isEmpty()) emit noted(what);
}

void TableAdding::addQuery(const QString& name, const model::SavedQuery& saved,
                           std::optional<QPoint> place) {
    if (!hasRoomFor(1)) return;
    make(tr("Add query %1").arg(name), place, [&](model::Query& query) {
        const auto table = query.addQuery(name.toStdU16String(), saved);
        placeFree(query, table, canvasWidth());
        return TableList{table};
    });
}

bool TableAdding::hasRoomFor(std::size_t tables) {
    const auto present = static_cast<std::size_t>(mDocument.query()->Tables().Count());
    if (present + tables <= mostTables) return true;
    emit refused(
        tables == 1
            ? tr("The drawing takes %1 tables, and has them; delete one first.").arg(mostTables)
            : tr("The drawing takes %1 tables and has %2; choose fewer.")
                  .arg(mostTables)
                  .arg(present));
    return false;
}

void TableAdding::make(const QString& step, std::optional<QPoint> place,
                       const std::function<TableList(model::Query&)>& how) {
    mDocument.settle();
    const bool arranges = !place && mPlaces.areAll();
    QString last;
    mDocument.change(step, [&](model::Query& query) {
        const TableList tables = how(query);
        if (tables.empty()) return;
        if (place) placeAt(query, tables, *place);
        if (arranges) arrangeGrown(query, tables, canvasWidth());
        last = QString::fromStdU16String(tables.back()->Name());
    });
    if (arranges) mPlaces.note();
    if (!last.isEmpty()) emit added(last);
}

void TableAdding::become(const QString& step, model::Query& other) {
    mDocument.settle();
    const bool arranged = mPlaces.areAll();
    mDocument.change(step, [&](model::Query& query) {
        becomeQuery(query, other);
        placeUnplaced(query, canvasWidth());
    });
    if (arranged) mPlaces.note();
}

void TableAdding::open(const Ref<model::Query>& query) {
    arrangeUnplaced(*query, canvasWidth());
    mDocument.setQuery(query);
    mPlaces.note();
}

void TableAdding::arrange() {
    arrangeTables(mDocument, canvasWidth());
    mPlaces.note();
}

/// Everything that adding asks for, so that it does not wait for the server then.
bool TableAdding::readBefore(const std::vector<TableId>& tables) {
    std::vector<TableId> all = sourcesOf(*mDocument.query());
    all.insert(all.end(), tables.begin(), tables.end());
    const Wanted wanted = unknownOf(mDatabase, {tables, all});
    // A file is read as quickly as memory, and stays readable when somebody deletes it.
    if (!mDatabase.isServer() || wanted.empty()) return true;
    const auto read = patiently<TablesRead>(
        tr("Reading the tables\u2026"), mArea.window(),
        [connect = mDatabase.connector(), wanted] { return readTables(connect, wanted); });
    if (!read) return false;
    const auto error = takeTables(mDatabase, *read);
    if (error) emit refused(inWords(*error));
    return !error;
}

/// Tries it on a copy, for the joins are known only when they are made.
bool TableAdding::fits(const std::vector<TableId>& tables) {
    const auto copy = model::Query::restored(mDocument.query()->record());
    const auto added = reader::addTables(*copy, mDatabase.reader(), tables, canvasWidth());
    if (!added) {
        emit refused(inWords(added.failure()));
        return false;
    }
    if (copy->Joins().Count() <= mostJoins) return true;
    emit refused(tr("The drawing takes %1 joins, and with this there would be %2; delete tables or "
                    "joins first.")
                     .arg(mostJoins)
                     .arg(copy->Joins().Count()));
    return false;
}

int TableAdding::canvasWidth() const {
    return std::max(mArea.width() * twipsPerPixel - besideCanvas, leastCanvasWidth);
}

} // namespace zandor::designer
