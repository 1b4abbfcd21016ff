#include "designer/document/becomeQuery.h"

#include <Zandor/model/Names.h>
#include <Zandor/sql/Builder.h>

#include <algorithm>
#include <map>

namespace zandor::designer {

using model::ColumnDefinition;
using model::Join;
using model::Query;
using model::Table;
using platform::Each;
using platform::Ref;
using platform::String;

namespace {

template <class Own, class Interface>
std::vector<Ref<Own>> listOf(const TalvikZandorLib::Collection<Interface>& items) {
    std::vector<Ref<Own>> list;
    for (const auto& item : Each<Interface>(items))
        list.push_back(std::static_pointer_cast<Own>(item));
    return list;
}

std::vector<Ref<Table>> tablesIn(Query& query) {
    return listOf<Table, TalvikZandorLib::ZDTable>(query.Tables());
}
std::vector<Ref<Join>> joinsIn(Query& query) {
    return listOf<Join, TalvikZandorLib::ZDJoin>(query.Joins());
}
std::vector<Ref<ColumnDefinition>> definitionsIn(Query& query) {
    return listOf<ColumnDefinition, TalvikZandorLib::ZDColumnDefinition>(query.ColumnDefinitions());
}
std::vector<Ref<model::Column>> columnsIn(Table& table) {
    return listOf<model::Column, TalvikZandorLib::ZDColumn>(table.Columns());
}

/// Whether they say the same, wherever they came from.
bool sameQuery(const model::SavedQuery& one, const model::SavedQuery& other) {
    const auto text = [](const model::SavedQuery& saved) {
        return statementText(*Query::restored(saved.record), model::sql::Dialect::Standard,
                             model::sql::ValueForm::literal)
            .text;
    };
    return text(one) == text(other);
}

bool sameSource(Table& one, Table& other) {
    if (!one.savedQuery() != !other.savedQuery()) return false;
    if (one.savedQuery() && !sameQuery(*one.savedQuery(), *other.savedQuery())) return false;
    const auto ofOne = columnsIn(one);
    const auto ofOther = columnsIn(other);
    return one.schema() == other.schema() && one.sourceName() == other.sourceName() &&
           std::ranges::equal(ofOne, ofOther, [](const auto& left, const auto& right) {
               return left->Name() == right->Name();
           });
}

class Becoming {
public:
    Becoming(Query& query, Query& other) : mQuery(query), mOther(other) {}

    void become() {
        matchTables();
        matchRenamed();
        takeTables();
        takeJoins();
        takeDefinitions();
        order();
        model::QueryOptions options = mOther.options();
        options.description = mQuery.options().description;
        takeComments(options.comments);
        mQuery.options(std::move(options));
    }

private:
    /// Comments stand by the own tables and columns.
    void takeComments(std::vector<model::Comment>& comments) const {
        std::map<String, String> keys;
        for (const auto& table : tablesIn(mOther))
            keys.emplace(table->Key(), mOwn.at(table.get())->Key());
        const auto definitions = definitionsIn(mOther);
        for (std::size_t n = 0; n < definitions.size(); ++n)
            keys.emplace(definitions[n]->Key(), mDefinitions[n]->Key());
        for (auto& comment : comments)
            if (const auto own = keys.find(comment.key); own != keys.end()) comment.key = own->second;
    }

    /// Tables of one name over one source.
    void matchTables() {
        mGone = tablesIn(mQuery);
        for (const auto& table : tablesIn(mOther))
            match(table, [&](const Ref<Table>& own) {
                return model::sameName(own->Name(), table->Name());
            });
    }

    void matchRenamed() {
        for (const auto& table : tablesIn(mOther))
            if (!mOwn.contains(table.get())) match(table, [](const Ref<Table>&) { return true; });
    }

    void match(const Ref<Table>& table, const auto& fits) {
        const auto found = std::ranges::find_if(
            mGone, [&](const Ref<Table>& own) { return fits(own) && sameSource(*own, *table); });
        if (found == mGone.end()) return;
        mOwn[table.get()] = *found;
        mGone.erase(found);
    }

    void takeTables() {
        for (const auto& table : mGone) mQuery.DeleteTable(table);
        // By names that nobody has, for two may have changed theirs.
        std::vector<std::pair<Ref<Table>, String>> renamed;
        for (const auto& table : tablesIn(mOther))
            if (const auto own = mOwn.find(table.get());
                own != mOwn.end() && own->second->Name() != table->Name())
                renamed.emplace_back(own->second, table->Name());
        for (const auto& [own, name] : renamed) mQuery.renameTable(own, freeName());
        for (const auto& [own, name] : renamed) mQuery.renameTable(own, name);
        for (const auto& table : tablesIn(mOther))
            if (!mOwn.contains(table.get())) mOwn[table.get()] = added(*table);
    }

    String freeName() const {
        for (int n = 1;; ++n) {
            String name = u"\uE000" + platform::decimal(n);
            if (!mQuery.tableNamed(name) && !mOther.tableNamed(name)) return name;
        }
    }

    Ref<Table> added(Table& table) {
        const auto own = table.savedQuery()
                             ? mQuery.addQuery(table.sourceName(), *table.savedQuery())
                             : mQuery.addTable(descriptionOf(table));
        if (own->Name() != table.Name()) mQuery.renameTable(own, table.Name());
        for (const auto& gone : mGone)
            if (model::sameName(gone->Name(), table.Name())) {
                own->Left(static_cast<float>(gone->Left()));
                own->Top(static_cast<float>(gone->Top()));
                own->Width(static_cast<float>(gone->Width()));
                own->Height(static_cast<float>(gone->Height()));
            }
        return own;
    }

    static model::TableDescription descriptionOf(Table& table) {
        model::TableDescription description{table.schema(), table.sourceName(), {}};
        for (const auto& column : columnsIn(table))
            if (!table.isAllColumns(*column)) description.columns.push_back(column->description());
        return description;
    }

    /// The own column for one of the other query.
    Ref<model::Column> own(const model::ColumnPlace& place) const {
        const auto table = place.table().table();
        const auto column = place.column();
        if (!table || !column) return nullptr;
        const auto& ownTable = mOwn.at(table.get());
        return table->isAllColumns(*column) ? columnsIn(*ownTable).front()
                                            : ownTable->columnNamed(column->Name());
    }

    void takeJoins() {
        auto left = joinsIn(mQuery);
        for (const auto& join : joinsIn(mOther)) {
            const auto from = own(join->left());
            const auto to = own(join->right());
            const auto found = std::ranges::find_if(left, [&](const Ref<Join>& each) {
                return each->left().column() == from && each->right().column() == to;
            });
            Ref<Join> mine;
            if (found != left.end()) {
                mine = *found;
                left.erase(found);
            } else {
                mine = platform::makeRef<Join>();
                mine->LeftColumn(from);
                mine->RightColumn(to);
                mQuery.AddJoin(mine);
            }
            mine->JoinType(join->JoinType());
            mine->CompareOperator(join->CompareOperator());
            mJoins.push_back(mine);
        }
        for (const auto& join : left) mQuery.Joins().Remove(join->Key());
    }

    bool alike(const ColumnDefinition& mine, const ColumnDefinition& definition) const {
        if (definition.isExpression())
            return mine.expression().text == definition.expression().text;
        return !mine.isExpression() && mine.place().column() == own(definition.place());
    }

    Ref<ColumnDefinition> taken(std::vector<Ref<ColumnDefinition>>& left,
                                const ColumnDefinition& definition) const {
        const auto take = [&](const auto& fits) -> Ref<ColumnDefinition> {
            const auto found = std::ranges::find_if(
                left, [&](const auto& mine) { return alike(*mine, definition) && fits(*mine); });
            if (found == left.end()) return nullptr;
            Ref<ColumnDefinition> mine = *found;
            left.erase(found);
            return mine;
        };
        auto mine = take([&](const ColumnDefinition& each) {
            return each.total() == definition.total() && each.Visible() == definition.Visible();
        });
        return mine ? mine : take([](const ColumnDefinition&) { return true; });
    }

    void takeDefinitions() {
        auto left = definitionsIn(mQuery);
        std::vector<std::pair<Ref<ColumnDefinition>, Ref<ColumnDefinition>>> pairs;
        for (const auto& definition : definitionsIn(mOther))
            pairs.emplace_back(taken(left, *definition), definition);
        for (const auto& definition : left) mQuery.ColumnDefinitions().Remove(definition->Key());
        for (auto& [mine, definition] : pairs) {
            if (!mine) {
                mine = platform::makeRef<ColumnDefinition>();
                if (definition->isExpression())
                    mine->expression(definition->expression().text);
                else
                    mine->Column(own(definition->place()));
                mQuery.AddColumnDefinition(mine);
            }
            fill(*mine, *definition);
            mDefinitions.push_back(mine);
        }
    }

    void fill(ColumnDefinition& mine, ColumnDefinition& definition) const {
        // What a name in it meant may have gone.
        if (definition.isExpression() && !mGone.empty())
            mine.expression(definition.expression().text);
        mine.Synonym(definition.Synonym());
        mine.SortOrder(definition.SortOrder());
        mine.sortPriority(definition.sortPriority());
        mine.Visible(definition.Visible());
        mine.total(definition.total());
        const bool same =
            std::ranges::equal(mine.criteria().rows(), definition.criteria().rows(),
                               [](const auto& left, const auto& right) {
                                   return left.first == right.first &&
                                          left.second->Criterium() == right.second->Criterium();
                               });
        if (same && mGone.empty()) return;
        mine.Criteria().clear();
        for (const auto& [row, criterium] : definition.criteria().rows())
            mine.AddCriterium(criterium->Criterium(), platform::decimal(row));
    }

    /// All lists in the order of the other query.
    void order() {
        std::vector<Ref<Table>> tables;
        for (const auto& table : tablesIn(mOther)) tables.push_back(mOwn.at(table.get()));
        model::Change change;
        change.lastBefore = change.lastAfter = mQuery.lastKeys();
        change.optionsBefore = change.optionsAfter = mQuery.options();
        move(tablesIn(mQuery), tables, change.tables, [](const Ref<Table>& table) {
            return model::TableState{
                table,          table->Name(),   table->Left(),    table->Top(),
                table->Width(), table->Height(), table->contents()};
        });
        move(joinsIn(mQuery), mJoins, change.joins, [](const Ref<Join>& join) {
            return model::JoinState{join, join->left(), join->right(), join->JoinType(),
                                    join->CompareOperator()};
        });
        mQuery.apply(change);
        for (std::size_t n = 0; n < mDefinitions.size(); ++n)
            mQuery.StandsBehind(mDefinitions[n], n == 0 ? nullptr : mDefinitions[n - 1]);
    }

    template <class Object, class State>
    static void move(const std::vector<Ref<Object>>& now, const std::vector<Ref<Object>>& wanted,
                     model::ListChange<State>& change, const auto& stateOf) {
        if (now == wanted) return;
        for (std::size_t n = 0; n < now.size(); ++n) {
            const auto position = static_cast<std::int32_t>(n + 1);
            change.gone.push_back({position, stateOf(now[n])});
            change.come.push_back({position, stateOf(wanted[n])});
        }
    }

    Query& mQuery;
    Query& mOther;
    std::map<const Table*, Ref<Table>> mOwn;         ///< for each table of the other query
    std::vector<Ref<Table>> mGone;                   ///< own ones that the other query has not
    std::vector<Ref<Join>> mJoins;                   ///< own ones, in the order of the other query
    std::vector<Ref<ColumnDefinition>> mDefinitions; ///< likewise
};

} // namespace

void becomeQuery(Query& query, Query& other) { Becoming(query, other).become(); }

} // namespace zandor::designer
