#include "designer/statement/FindingPlace.h"

#include "designer/canvasSize.h"

#include <Zandor/ZandorWidget.h>
#include <Zandor/model/Layout.h>
#include <Zandor/qt/Text.h>

#include <algorithm>

namespace zandor::designer {

namespace {

using platform::qt::toQt;

constexpr int firstRow = 1; // of the grid, below the fields

struct Place {
    platform::Ref<model::Table> table;
    platform::Ref<model::Column> column; ///< may be nothing
};

Place placeOf(const model::ColumnPlace& place) { return {place.table().table(), place.column()}; }

template <class Item>
platform::Ref<Item> itemOf(const auto& items, const platform::String& key) {
    if (key.empty()) return nullptr;
    for (const auto& item : items)
        if (item->Key() == key) return std::dynamic_pointer_cast<Item>(item);
    return nullptr;
}

/// The tables and columns that a finding is about.
std::vector<Place> placesOf(model::Query& query, const model::Finding& finding) {
    using namespace TalvikZandorLib;
    using platform::Each;
    std::vector<Place> places;
    if (const auto table = itemOf<model::Table>(Each<ZDTable>(query.Tables()), finding.table))
        places.push_back({table, nullptr});
    if (const auto join = itemOf<model::Join>(Each<ZDJoin>(query.Joins()), finding.join)) {
        places.push_back(placeOf(join->right()));
        places.push_back(placeOf(join->left()));
    }
    if (const auto definition = itemOf<model::ColumnDefinition>(
            Each<ZDColumnDefinition>(query.ColumnDefinitions()), finding.definition))
        places.push_back(placeOf(definition->place()));
    std::erase_if(places, [](const Place& place) { return !place.table; });
    return places;
}

/// Where a view of `extent` that begins at `now` has to begin to show a stretch, or as much of it
/// as goes in.
int scrolled(int now, int extent, int begin, int end) {
    if (begin < now || end - begin > extent) return std::max(0, begin - model::layout::margin);
    return end > now + extent ? end + model::layout::margin - extent : now;
}

} // namespace

bool isOfColumn(const model::Finding& finding) {
    using enum model::Finding::Kind;
    return finding.kind == badExpression || finding.kind == badTotal ||
           finding.kind == sortNotOutput || finding.kind == definitionWithoutColumn;
}

void bringIntoView(ZandorWidget& control, const TalvikZandorLib::ZDTable& table) {
    const int width = control.width() * twipsPerPixel;
    // Output columns have the lower pane.
    const double share = control.OnlyJoin() ? 1 : control.upperPaneShare();
    const int height = static_cast<int>(control.height() * twipsPerPixel * share);
    const int left =
        scrolled(control.VisibleFrameLeft(), width, table.Left(), table.Left() + table.Width());
    const int top =
        scrolled(control.VisibleFrameTop(), height, table.Top(), table.Top() + table.Height());
    if (left != control.VisibleFrameLeft()) control.setVisibleFrameLeft(left);
    if (top != control.VisibleFrameTop()) control.setVisibleFrameTop(top);
}

void showPlace(ZandorWidget& control, model::Query& query, const model::Finding& finding) {
    for (const auto& [table, column] : placesOf(query, finding)) {
        bringIntoView(control, *table);
        if (column) control.SelectColumnNames(toQt(table->Name()), toQt(column->Name()));
        control.SetCurrentTable(toQt(table->Name()));
    }
    // The cell comes last, for it is where one goes on typing.
    if (finding.row > 0 || isOfColumn(finding))
        control.showCell(toQt(finding.definition), std::max<int>(finding.row, firstRow));
}

} // namespace zandor::designer
