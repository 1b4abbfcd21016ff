#pragma once

#include <Zandor/model/Change.h>
#include <Zandor/model/Items.h>
#include <Zandor/model/export.h>

#include <unordered_map>

namespace zandor::model {

class Query;

/// Remembers a query, and tells what is different later. Columns of tables are not looked at: they
/// never change.
class ZANDOR_MODEL_EXPORT Snapshot {
public:
    /// Of a query as it is.
    explicit Snapshot(Query& query) { update(query); }

    /// What came about since the last time; from now on the query is remembered as it is. Always of
    /// the same query. Takes as long as there were changes; only when a list has got or lost items
    /// is its order gone through.
    Change update(Query& query);

private:
    /// One list of the query.
    template <class State>
    class List {
    public:
        /// `revised` is what the query's log has written since the last time.
        template <class Object, class Interface>
        ListChange<State> update(const Items<Object, Interface>& items,
                                 const std::vector<const Revision*>& revised);

    private:
        template <class Object, class Interface>
        void updateOrder(const Items<Object, Interface>& items, ListChange<State>& change);
        void sort(std::vector<typename ListChange<State>::Pair>& changed) const;

        // Objects go by their revisions, and none is gone as long as a state holds its object.
        std::vector<const Revision*> mOrder;
        std::unordered_map<const Revision*, State> mStates;
    };

    ChangeLog::Moment mMoment = 0;
    LastKeys mLastKeys;
    QueryOptions mOptions;
    List<TableState> mTables;
    List<JoinState> mJoins;
    List<DefinitionState> mDefinitions;
};

} // namespace zandor::model
