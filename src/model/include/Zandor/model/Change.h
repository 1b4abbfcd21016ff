#pragma once

#include <Zandor/model/ColumnDefinition.h>
#include <Zandor/model/Join.h>
#include <Zandor/model/Record.h>
#include <Zandor/model/Table.h>

/// The difference between two moments of one query, small because it names what is different only.
/// It holds the objects themselves, so that whoever knows a join from before a deletion knows it
/// again after that was undone.
namespace zandor::model {

/// A table and all of it that can change, but for what is selected in it: that is no change.
struct TableState {
    Ref<Table> object = {};                       ///< the table itself
    String name = {};                             ///< as TableRecord::name
    std::int32_t left = 0;                        ///< in twips, as the three below
    std::int32_t top = 0;                         ///< of the upper edge
    std::int32_t width = 0;                       ///< the border included
    std::int32_t height = 0;                      ///< the border included
    std::shared_ptr<TableContents> contents = {}; ///< never nothing; no two tables share one

    friend bool operator==(const TableState&, const TableState&) = default;
};

/// A join and all of it that can change.
struct JoinState {
    Ref<Join> object = {};       ///< the join itself
    ColumnPlace left = {};       ///< its left end
    ColumnPlace right = {};      ///< its right end
    std::int16_t type = 0;       ///< as ZDJoin::JoinType
    std::int16_t comparison = 0; ///< as ZDJoin::CompareOperator

    friend bool operator==(const JoinState&, const JoinState&) = default;
};

/// The criterion of one row.
struct CriterionState {
    std::int16_t row = 0;         ///< of the grid
    criteria::TiedText text = {}; ///< with what its names are tied to

    friend bool operator==(const CriterionState&, const CriterionState&) = default;
};

/// An output column and all of it that can change.
struct DefinitionState {
    Ref<ColumnDefinition> object = {};         ///< the definition itself
    ColumnPlace column = {};                   ///< what comes out
    String synonym = {};                       ///< as ZDColumnDefinition::Synonym
    std::int16_t sortOrder = 0;                ///< as ZDColumnDefinition::SortOrder
    bool visible = true;                       ///< as ZDColumnDefinition::Visible
    std::int32_t width = 0;                    ///< as SizedDefinition::Width
    std::vector<CriterionState> criteria = {}; ///< in the order of their rows
    Total total = Total::None;                 ///< as ColumnDefinition::total
    std::int16_t sortPriority = 0;             ///< as ColumnDefinition::sortPriority
    criteria::TiedText expression = {};        ///< as ColumnDefinition::expression
    Format format = Format::None;              ///< as ColumnDefinition::format
    std::int16_t decimals = asManyAsThereAre;  ///< as ColumnDefinition::decimals

    friend bool operator==(const DefinitionState&, const DefinitionState&) = default;
};

/// What is different in a list. An object that changed its position has both gone and come.
template <class State>
struct ListChange {
    /// An item with its place in the list.
    struct Placed {
        std::int32_t position; ///< from 1
        State state;           ///< as it was, or is
    };
    /// An item that was there before and is there after.
    struct Pair {
        State before; ///< as it was
        State after;  ///< as it is
    };
    std::vector<Placed> gone = {};  ///< by position in the list before
    std::vector<Placed> come = {};  ///< by position in the list after
    std::vector<Pair> changed = {}; ///< in the order of the list

    /// Whether nothing is different.
    bool empty() const { return gone.empty() && come.empty() && changed.empty(); }
    /// The way back.
    ListChange reversed() const {
        ListChange result{come, gone, changed};
        for (Pair& pair : result.changed) std::swap(pair.before, pair.after);
        return result;
    }
};

/// The difference between two moments of a query. Query::apply makes it once more, and reversed
/// undoes it.
struct Change {
    LastKeys lastBefore = {};                     ///< at the earlier moment
    LastKeys lastAfter = {};                      ///< at the later one
    QueryOptions optionsBefore = {};              ///< at the earlier moment
    QueryOptions optionsAfter = {};               ///< at the later one
    ListChange<TableState> tables = {};           ///< of the tables
    ListChange<JoinState> joins = {};             ///< of the joins
    ListChange<DefinitionState> definitions = {}; ///< of the output columns

    /// Whether nothing is different.
    bool empty() const {
        return lastBefore == lastAfter && optionsBefore == optionsAfter && tables.empty() &&
               joins.empty() && definitions.empty();
    }
    /// The way back.
    Change reversed() const {
        return {lastAfter,         lastBefore,       optionsAfter,          optionsBefore,
                tables.reversed(), joins.reversed(), definitions.reversed()};
    }
};

} // namespace zandor::model
