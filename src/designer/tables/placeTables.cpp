#include "designer/tables/placeTables.h"

#include "designer/document/Document.h"

#include <Zandor/model/Layout.h>

#include <QCoreApplication>

#include <algorithm>
#include <limits>

namespace zandor::designer {

using model::layout::Box;
using platform::Each;
using platform::Ref;

namespace {

using Tables = std::vector<Ref<model::Table>>;

constexpr int canvasEnd = std::numeric_limits<std::int16_t>::max();

/// Pairs of the tables that a join connects.
std::vector<model::layout::Link> linksAmong(model::Query& query, const Tables& tables) {
    const auto position = [&](const Ref<TalvikZandorLib::ZDTable>& table) {
        return static_cast<std::size_t>(std::find(tables.begin(), tables.end(), table) -
                                        tables.begin());
    };
    std::vector<model::layout::Link> links;
    for (const auto& join : Each<TalvikZandorLib::ZDJoin>(query.Joins())) {
        const auto left = position(join->LeftTable());
        const auto right = position(join->RightTable());
        if (left < tables.size() && right < tables.size()) links.emplace_back(left, right);
    }
    return links;
}

Tables tablesOf(model::Query& query) {
    Tables tables;
    for (const auto& each : Each<TalvikZandorLib::ZDTable>(query.Tables()))
        tables.push_back(std::static_pointer_cast<model::Table>(each));
    return tables;
}

std::vector<model::layout::Size> sizesOf(const Tables& tables) {
    std::vector<model::layout::Size> sizes;
    for (const auto& table : tables) {
        const model::layout::Size usual{2000, 2000}; // what the control gives a table without one
        const bool sized = table->Width() > 0 && table->Height() > 0;
        sizes.push_back(sized ? model::layout::Size{table->Width(), table->Height()} : usual);
    }
    return sizes;
}

std::vector<Box> arranged(model::Query& query, const Tables& tables, int canvasWidth) {
    return model::layout::arrange(sizesOf(tables), linksAmong(query, tables), {}, canvasWidth);
}

void move(model::Table& table, const Box& box, QPoint by) {
    const auto within = [](int start, int size) {
        return static_cast<float>(std::clamp(start, 0, std::max(canvasEnd - size, 0)));
    };
    table.Left(within(box.left + by.x(), box.width));
    table.Top(within(box.top + by.y(), box.height));
}

/// Gives a table without a size one in which its entries have room.
void fit(model::Table& table) {
    if (table.Width() > 0 && table.Height() > 0) return;
    std::size_t longest = table.Name().size();
    for (const auto& column : Each<TalvikZandorLib::ZDColumn>(table.Columns()))
        longest = std::max(longest, column->Name().size());
    const auto entries = static_cast<std::size_t>(table.Columns().Count());
    const auto size = model::layout::fittedSize(entries, longest);
    table.Width(static_cast<float>(size.width));
    table.Height(static_cast<float>(size.height));
}

/// With sizes.
Tables unplacedOf(model::Query& query) {
    Tables unplaced = tablesOf(query);
    for (const auto& table : unplaced) fit(*table);
    std::erase_if(unplaced,
                  [](const auto& table) { return table->Left() >= 0 && table->Top() >= 0; });
    return unplaced;
}

} // namespace

void placeFree(model::Query& query, const Ref<model::Table>& added, int canvasWidth) {
    fit(*added);
    std::vector<Box> taken;
    for (const auto& table : tablesOf(query))
        if (table != added)
            taken.push_back({table->Left(), table->Top(), table->Width(), table->Height()});
    const auto boxes = model::layout::arrange(sizesOf({added}), {}, taken, canvasWidth);
    move(*added, boxes.front(), {});
}

void placeAt(model::Query& query, const Tables& tables, QPoint place) {
    const auto boxes = arranged(query, tables, canvasEnd / 2);
    for (std::size_t n = 0; n < tables.size(); ++n)
        move(*tables[n], boxes[n], place - QPoint(model::layout::margin, model::layout::margin));
}

void arrangeGrown(model::Query& query, const Tables& added, int canvasWidth) {
    const Tables tables = tablesOf(query);
    std::vector<std::optional<model::layout::Place>> standing;
    for (const auto& table : tables) {
        standing.emplace_back();
        if (std::find(added.begin(), added.end(), table) == added.end())
            standing.back() = {table->Left(), table->Top()};
    }
    const auto boxes = model::layout::arrangeAgain(sizesOf(tables), linksAmong(query, tables),
                                                   standing, canvasWidth);
    for (std::size_t n = 0; n < tables.size(); ++n) move(*tables[n], boxes[n], {});
}

void arrangeUnplaced(model::Query& query, int canvasWidth) {
    const Tables unplaced = unplacedOf(query);
    if (!unplaced.empty()) arrangeGrown(query, unplaced, canvasWidth);
}

void placeUnplaced(model::Query& query, int canvasWidth) {
    const Tables unplaced = unplacedOf(query);
    Tables all = unplaced; // links count those that stand behind them
    std::vector<Box> taken;
    for (const auto& table : tablesOf(query)) {
        if (std::find(unplaced.begin(), unplaced.end(), table) != unplaced.end()) continue;
        all.push_back(table);
        taken.push_back({table->Left(), table->Top(), table->Width(), table->Height()});
    }
    const auto boxes =
        model::layout::arrange(sizesOf(unplaced), linksAmong(query, all), taken, canvasWidth);
    for (std::size_t n = 0; n < unplaced.size(); ++n) move(*unplaced[n], boxes[n], {});
}

void arrangeTables(Document& document, int canvasWidth) {
    const auto name =
        QCoreApplication::translate("zandor::designer::TableAdding", "Arrange tables");
    document.change(name, [&](model::Query& query) {
        const Tables tables = tablesOf(query);
        // As it would have grown by itself.
        const auto boxes = model::layout::arrangeAgain(
            sizesOf(tables), linksAmong(query, tables),
            std::vector<std::optional<model::layout::Place>>(tables.size()), canvasWidth);
        for (std::size_t n = 0; n < tables.size(); ++n) move(*tables[n], boxes[n], {});
    });
}

} // namespace zandor::designer
