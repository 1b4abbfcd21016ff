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
    Ref<Table> object = {};
    String name = {};
    std::int32_t left = 0;
    std::int32_t top = 0;
    std::int32_t width = 0;
    std::int32_t height = 0;

    friend bool operator==(const TableState&, const TableState&) = default;
};

struct JoinState {
    Ref<Join> object = {};
    ColumnPlace left = {};
    ColumnPlace right = {};
    std::int16_t type = 0;
    std::int16_t comparison = 0;

    friend bool operator==(const JoinState&, const JoinState&) = default;
};

struct CriterionState {
    std::int16_t row = 0;
    String text = {};
    criteria::References references = {};

    friend bool operator==(const CriterionState&, const CriterionState&) = default;
};

struct DefinitionState {
    Ref<ColumnDefinition> object = {};
    ColumnPlace column = {};
    String synonym = {};
    std::int16_t sortOrder = 0;
    bool visible = true;
    std::int32_t width = 0;
    std::vector<CriterionState> criteria = {}; ///< in the order of their rows

    friend bool operator==(const DefinitionState&, const DefinitionState&) = default;
};

/// What is different in a list. An object that changed its position has both gone and come.
template <class State>
struct ListChange {
    struct Placed {
        std::int32_t position; ///< from 1
        State state;
    };
    struct Pair {
        State before;
        State after;
    };
    std::vector<Placed> gone = {};  ///< by position in the list before
    std::vector<Placed> come = {};  ///< by position in the list after
    std::vector<Pair> changed = {}; ///< in the order of the list

    bool empty() const { return gone.empty() && come.empty() && changed.empty(); }
    ListChange reversed() const {
        ListChange result{come, gone, changed};
        for (Pair& pair : result.changed) std::swap(pair.before, pair.after);
        return result;
    }
};

struct Change {
    LastKeys lastBefore = {};
    LastKeys lastAfter = {};
    ListChange<TableState> tables = {};
    ListChange<JoinState> joins = {};
    ListChange<DefinitionState> definitions = {};

    bool empty() const {
        return lastBefore == lastAfter && tables.empty() && joins.empty() && definitions.empty();
    }
    Change reversed() const {
        return {lastAfter, lastBefore, tables.reversed(), joins.reversed(), definitions.reversed()};
    }
};

} // namespace zandor::model
