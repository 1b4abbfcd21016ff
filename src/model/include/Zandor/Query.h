#pragma once

#include <Zandor/model/Change.h>
#include <Zandor/model/ColumnDefinition.h>
#include <Zandor/model/Description.h>
#include <Zandor/model/Join.h>
#include <Zandor/model/QueryOptions.h>
#include <Zandor/model/Record.h>
#include <Zandor/model/Table.h>
#include <Zandor/model/export.h>

#include <unordered_set>

namespace zandor::model {

/// A query: tables, the joins between them, and output columns. It owns its objects; they may be
/// held longer than the query, and then know nothing of each other.
///
/// Keys are a letter and a number ("t1" tables, "c1" columns, "j1" joins, "x1" definitions) and are
/// never given twice in a query, not even after the object was deleted. Only a change that is
/// undone takes the keys back that it gave.
class ZANDOR_MODEL_EXPORT Query final : public TalvikZandorLib::Zandor,
                                        public TalvikZandorLib::OrderedDefinitions {
public:
    Query() { mRevision.enter(mLog); }
    Query(const Query&) = delete;
    Query& operator=(const Query&) = delete;

    TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& Tables() override { return *mTables; }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDJoin>& Joins() override {
        return mJoins;
    }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDColumnDefinition>&
    ColumnDefinitions() override {
        return mDefinitions;
    }

    /// Both ends must be columns of this query's tables: error 91 when one is not set, error 5 when
    /// one is of another query or deleted, error 457 when the join is in the query already. A join
    /// that was removed from this query comes back under its old key. Nothing changes on an error.
    Ref<TalvikZandorLib::ZDJoin> AddJoin(const Ref<TalvikZandorLib::ZDJoin>& join) override;
    /// The same rules for the definition's column; one that is an expression needs none.
    Ref<TalvikZandorLib::ZDColumnDefinition>
    AddColumnDefinition(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition) override;
    /// Both must be definitions of this query: error 91 when the first is nothing, error 5 for one
    /// that is not in the query and for two that are one; nothing changes then. The statement's
    /// columns, and the order of its sorting, follow.
    void StandsBehind(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition,
                      const Ref<TalvikZandorLib::ZDColumnDefinition>& predecessor) override;
    /// Takes the joins and definitions that hang on the table along, also the expressions that name
    /// it; criteria of others that name it name nothing from then on. Error 91 for nothing, error 5
    /// for a table that does not stand in this query.
    void DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) override;

    /// Puts a table into the query, unplaced, with the entry "*" before its columns. Its name is
    /// the source's, or, when that is taken, the source's with "_1", "_2" and so on behind it.
    /// Error 5 when the source has no name.
    Ref<Table> addTable(const TableDescription& source);
    /// Puts a saved query into this one as a table, as addTable does; its columns are those that
    /// come out of it, each under a name that is its own. Error 5 for an empty name and where
    /// refusalOf has something to say; nothing changes then.
    Ref<Table> addQuery(const String& name, SavedQuery saved);
    /// Why a saved query cannot stand as a table: a fault, nothing that comes out of it, or queries
    /// in each other deeper than deepestSavedQuery. Nothing when it can.
    static std::optional<Message> refusalOf(const SavedQuery& saved);
    /// Gives a table that is a saved query what that one is by now. Columns of the same names keep
    /// their keys, and what hangs on them. Error 5 where refusalOf has something to say and for a
    /// table that is no saved query of this query, error 91 for nothing; nothing changes then.
    void refreshQuery(const Ref<Table>& table, SavedQuery saved);
    /// As above, and for a column that is used in this query and comes out no more.
    std::optional<Message> refusalOf(const Table& table, const SavedQuery& saved) const;
    /// Gives a table of this query another name; criteria that name it are written anew. Error 5
    /// for an empty name or a foreign table, error 91 for nothing, error 457 when another table has
    /// the name; nothing changes then.
    void renameTable(const Ref<Table>& table, const String& name);
    /// The table of a name as databases compare names, or nothing.
    Ref<Table> tableNamed(platform::StringView name) const;

    /// What is said of the query as a whole.
    const QueryOptions& options() const { return *mOptions; }
    /// Error 380 when `first` is outside its range; nothing changes then.
    void options(QueryOptions value);

    /// Everything that the query is. Ends and columns that read as nothing are recorded as none.
    QueryRecord record() const;
    /// The query that a record was made from, with all its keys. Error 5 when the record has a
    /// fault.
    static Ref<Query> restored(const QueryRecord& record);

    /// The numbers of the keys given last.
    LastKeys lastKeys() const { return {mLastTable, mLastColumn, mLastJoin, mLastDefinition}; }
    /// Makes what a Snapshot of this query found once more; reversed, it is undone. The query must
    /// be as it was before the change (after it): error 5 when it is seen not to be, nothing
    /// changes then.
    void apply(const Change& change);

private:
    friend class Snapshot; ///< reads the log

    void set(const TableState& state);
    void set(const JoinState& state);
    void set(const DefinitionState& state);
    Ref<Table> add(const TableDescription& source, SavedQueryRef saved);
    std::optional<Message> refusalOf(const Table& table,
                                     const std::vector<ColumnDescription>& given) const;
    std::unordered_set<String> usedColumns() const;
    void restoreTable(const TableRecord& record);
    ColumnPlace restoredEnd(const EndRecord& record) const;
    criteria::References restored(const std::vector<NameRecord>& names) const;
    /// Error 6 when there are no more numbers.
    String nextKey(char16_t letter, std::int32_t& last);
    /// Before the tables change, so that no criterion slips from one table to another.
    void tieCriteria();
    void requireNames(ColumnDefinition& definition);
    void requireOwn(const Ref<TalvikZandorLib::ZDTable>& table) const;

    // Shared with the objects, which may be held longer than the query.
    const std::shared_ptr<ChangeLog> mLog = std::make_shared<ChangeLog>();
    // Shared so that joins and definitions can tell whether the query is still there.
    const std::shared_ptr<model::Tables> mTables = std::make_shared<model::Tables>(mLog);
    Revision mRevision;
    Revised<QueryOptions> mOptions{mRevision};
    Items<Join, TalvikZandorLib::ZDJoin> mJoins{mLog};
    Items<ColumnDefinition, TalvikZandorLib::ZDColumnDefinition> mDefinitions{mLog};
    std::int32_t mLastTable = 0;
    std::int32_t mLastColumn = 0;
    std::int32_t mLastJoin = 0;
    std::int32_t mLastDefinition = 0;
};

} // namespace zandor::model
