#include <Zandor/reader/addTables.h>

#include <Zandor/model/Layout.h>
#include <Zandor/model/Names.h>

#include <algorithm>
#include <optional>

namespace zandor::reader {

using model::layout::Box;
using platform::Each;
using platform::makeRef;
using platform::Ref;
using TalvikZandorLib::ZDTable;

namespace {

using TableList = std::vector<Ref<model::Table>>;

TableList tablesOf(model::Query& query) {
    TableList tables;
    for (const auto& table : Each<ZDTable>(query.Tables()))
        tables.push_back(std::static_pointer_cast<model::Table>(table));
    return tables;
}

/// A foreign key with the tables that it connects, as positions in a list of tables.
struct Relation {
    std::size_t child = 0;
    std::size_t parent = 0;
    ForeignKey key;
};

/// Positions of the tables in a list that were made from a source.
std::vector<std::size_t> instancesOf(const TableId& source, const std::vector<TableId>& sources) {
    std::vector<std::size_t> positions;
    for (std::size_t n = 0; n < sources.size(); ++n)
        if (model::sameName(sources[n].schema, source.schema) &&
            model::sameName(sources[n].name, source.name))
            positions.push_back(n);
    return positions;
}

bool hasSmallerName(const ForeignKey& a, const ForeignKey& b) {
    const auto name = [](const ForeignKey& key) {
        return std::pair(model::foldedName(key.columns.front().first),
                         model::foldedName(key.child.name));
    };
    return name(a) < name(b);
}

/// A join that stands in the query, with its tables as positions in the list of them.
struct Drawn {
    std::size_t left = 0;
    std::size_t right = 0;
    String leftColumn;
    String rightColumn;
};

std::vector<Drawn> joinsAmong(model::Query& query, const TableList& tables) {
    const auto position = [&](const Ref<ZDTable>& table) {
        return static_cast<std::size_t>(std::ranges::find(tables, table) - tables.begin());
    };
    std::vector<Drawn> drawn;
    for (const auto& join : Each<TalvikZandorLib::ZDJoin>(query.Joins()))
        if (join->LeftColumn() && join->RightColumn())
            drawn.push_back({position(join->LeftTable()), position(join->RightTable()),
                             join->LeftColumn()->Name(), join->RightColumn()->Name()});
    return drawn;
}

/// Where a key of a child leads: to the first of the parent's instances that the child is not
/// joined to in another way, so that a second "team" is the other side's. Nothing for a key that is
/// drawn.
std::optional<std::size_t> parentFor(const ForeignKey& key, std::size_t child,
                                     const std::vector<std::size_t>& parents,
                                     const std::vector<Drawn>& drawn,
                                     const std::vector<Relation>& found) {
    const auto& [ofChild, ofParent] = key.columns.front();
    const auto isPair = [child](std::size_t parent, std::size_t a, std::size_t b) {
        return (a == child && b == parent) || (a == parent && b == child);
    };
    std::optional<std::size_t> free;
    for (const std::size_t parent : parents) {
        bool joined = false;
        for (const Drawn& join : drawn) {
            if (!isPair(parent, join.left, join.right)) continue;
            const bool forth = join.left == child;
            if (model::sameName(forth ? join.leftColumn : join.rightColumn, ofChild) &&
                model::sameName(forth ? join.rightColumn : join.leftColumn, ofParent))
                return {};
            joined = true;
        }
        for (const Relation& relation : found)
            joined = joined || isPair(parent, relation.child, relation.parent);
        if (!joined && !free) free = parent;
    }
    return free.value_or(parents.front());
}

/// The columns that a key connects, pair by pair; none for a key that fits no longer.
std::vector<std::pair<Ref<model::Column>, Ref<model::Column>>> ends(const TableList& tables,
                                                                    const Relation& relation) {
    std::vector<std::pair<Ref<model::Column>, Ref<model::Column>>> result;
    for (const auto& [child, parent] : relation.key.columns) {
        result.emplace_back(tables[relation.child]->columnNamed(child),
                            tables[relation.parent]->columnNamed(parent));
        if (!result.back().first || !result.back().second) return {};
    }
    return result;
}

/// The keys of each source, by the smaller name first; those of a source that stands there several
/// times with its first instance.
Result<std::vector<std::vector<ForeignKey>>> keysOf(DatabaseReader& reader,
                                                    const std::vector<TableId>& sources) {
    std::vector<std::vector<ForeignKey>> all(sources.size());
    for (std::size_t child = 0; child < sources.size(); ++child) {
        if (sources[child].name.empty()) continue;
        if (instancesOf(sources[child], sources).front() != child) continue;
        auto keys = reader.foreignKeys(sources[child]);
        if (!keys) return keys.failure();
        std::ranges::stable_sort(*keys, hasSmallerName);
        all[child] = std::move(*keys);
    }
    return all;
}

/// The relations by keys that fit, and that reach a table from `firstNew` on. Those among the
/// earlier ones are as the user left them.
std::vector<Relation> relations(const TableList& tables, const std::vector<TableId>& sources,
                                const std::vector<std::vector<ForeignKey>>& keys,
                                std::size_t firstNew, const std::vector<Drawn>& drawn) {
    std::vector<Relation> result;
    for (std::size_t child = 0; child < sources.size(); ++child) {
        for (const ForeignKey& key : keys[child]) {
            auto parents = instancesOf(key.parent, sources);
            std::erase(parents, child);
            if (parents.empty() || ends(tables, {child, parents.front(), key}).empty()) continue;
            const auto parent = parentFor(key, child, parents, drawn, result);
            if (parent && std::max(child, *parent) >= firstNew)
                result.push_back({child, *parent, key});
        }
    }
    return result;
}

/// Leaves one of those between one pair of tables.
std::vector<LeftOut> choose(std::vector<Relation>& relations) {
    const auto onePair = [](const Relation& a, const Relation& b) {
        return (a.child == b.child && a.parent == b.parent) ||
               (a.child == b.parent && a.parent == b.child);
    };
    std::vector<Relation> chosen;
    std::vector<Relation> others;
    for (Relation& relation : relations) {
        const auto rival = std::ranges::find_if(
            chosen, [&](const Relation& other) { return onePair(relation, other); });
        if (rival == chosen.end()) {
            chosen.push_back(std::move(relation));
        } else if (rival->key != relation.key) {
            if (hasSmallerName(relation.key, rival->key)) std::swap(relation, *rival);
            others.push_back(std::move(relation));
        }
    }
    relations = std::move(chosen);
    std::vector<LeftOut> leftOut;
    for (Relation& other : others) {
        const auto drawn = std::ranges::find_if(
            relations, [&](const Relation& relation) { return onePair(relation, other); });
        leftOut.push_back({drawn->key, std::move(other.key)});
    }
    return leftOut;
}

void place(const TableList& present, const TableList& added, const std::vector<Relation>& relations,
           std::int32_t canvasWidth) {
    // The layout counts the new tables first.
    std::vector<Box> taken;
    std::vector<std::optional<std::size_t>> position(present.size());
    for (std::size_t n = 0; n < present.size(); ++n) {
        const auto& table = *present[n];
        if (table.Left() < 0 || table.Top() < 0) continue;
        constexpr std::int32_t usual = 2000; // what the control gives a table without a size
        const bool sized = table.Width() > 0 && table.Height() > 0;
        position[n] = added.size() + taken.size();
        taken.push_back({table.Left(), table.Top(), sized ? table.Width() : usual,
                         sized ? table.Height() : usual});
    }
    for (std::size_t n = 0; n < added.size(); ++n) position.emplace_back(n);

    std::vector<model::layout::Link> links;
    for (const Relation& relation : relations)
        if (position[relation.child] && position[relation.parent])
            links.emplace_back(*position[relation.child], *position[relation.parent]);

    std::vector<model::layout::Size> sizes;
    for (const auto& table : added) {
        std::size_t longest = table->Name().size();
        for (const auto& column : Each<TalvikZandorLib::ZDColumn>(table->Columns()))
            longest = std::max(longest, column->Name().size());
        sizes.push_back(
            model::layout::fittedSize(static_cast<std::size_t>(table->Columns().Count()), longest));
    }

    const auto boxes = model::layout::arrange(sizes, links, taken, canvasWidth);
    for (std::size_t n = 0; n < added.size(); ++n) {
        added[n]->Left(static_cast<float>(boxes[n].left));
        added[n]->Top(static_cast<float>(boxes[n].top));
        added[n]->Width(static_cast<float>(boxes[n].width));
        added[n]->Height(static_cast<float>(boxes[n].height));
    }
}

void addJoins(model::Query& query, const TableList& tables, const Relation& relation) {
    for (const auto& [child, parent] : ends(tables, relation)) {
        const auto join = makeRef<model::Join>();
        join->LeftColumn(child);
        join->RightColumn(parent);
        query.AddJoin(join);
    }
}

} // namespace

Result<TableList> addTables(model::Query& query, DatabaseReader& reader,
                            const std::vector<TableId>& names, std::int32_t canvasWidth,
                            std::vector<LeftOut>* leftOut) {
    std::vector<model::TableDescription> descriptions;
    for (const TableId& name : names) {
        auto description = reader.table(name);
        if (!description) return description.failure();
        descriptions.push_back(std::move(*description));
    }
    const TableList present = tablesOf(query);
    std::vector<TableId> sources;
    for (const auto& table : present)
        // The database knows nothing of a saved query, nor of a table without a name.
        sources.push_back(table->savedQuery() ? TableId()
                                              : TableId{table->schema(), table->sourceName()});
    sources.insert(sources.end(), names.begin(), names.end());
    const auto keys = keysOf(reader, sources);
    if (!keys) return keys.failure();
    const auto drawn = joinsAmong(query, present);

    TableList added;
    for (const auto& description : descriptions) added.push_back(query.addTable(description));
    TableList all = present;
    all.insert(all.end(), added.begin(), added.end());
    auto found = relations(all, sources, *keys, present.size(), drawn);
    auto others = choose(found);
    if (leftOut) *leftOut = std::move(others);
    place(present, added, found, canvasWidth);
    for (const Relation& relation : found) addJoins(query, all, relation);
    return added;
}

} // namespace zandor::reader
