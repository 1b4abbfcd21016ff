#include "designer/tables/OwnPlaces.h"

#include "designer/document/Document.h"

#include <algorithm>

namespace zandor::designer {

namespace {

using TablesOfQuery = platform::Each<TalvikZandorLib::ZDTable>;

QPoint placeOf(const TalvikZandorLib::ZDTable& table) { return {table.Left(), table.Top()}; }

} // namespace

OwnPlaces::OwnPlaces(Document& document, QObject* parent) : QObject(parent), mDocument(document) {
    connect(&document, &Document::replaced, this, [this] { mPlaces.clear(); });
}

bool OwnPlaces::areAll() const {
    for (const auto& table : TablesOfQuery(mDocument.query()->Tables())) {
        const auto known = mPlaces.find(table->Key());
        if (known == mPlaces.end()) return false;
        const auto& places = known->second;
        if (std::find(places.begin(), places.end(), placeOf(*table)) == places.end()) return false;
    }
    return true;
}

void OwnPlaces::note() {
    for (const auto& table : TablesOfQuery(mDocument.query()->Tables()))
        mPlaces[table->Key()].push_back(placeOf(*table));
}

} // namespace zandor::designer
