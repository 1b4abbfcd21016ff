#pragma once

#include <Zandor/platform/Ref.h>
#include <Zandor/platform/export.h>

#include <vector>

/// What the control asks of the host's query model. A host implements these classes over its own;
/// an exception thrown from any of them is reported to the user and ends the procedure that called.
namespace TalvikZandorLib {

namespace platform = zandor::platform;

using platform::Ref;
using platform::String;

/// A list of the model, walked by position and asked by key.
template <class T>
class Collection {
public:
    virtual ~Collection() = default;
    /// How many items there are, 0 or more.
    virtual std::int32_t Count() const = 0;
    /// Position is 1-based; error 9 outside 1 to Count.
    virtual Ref<T> Item(std::int32_t position) const = 0;
    /// Error 5 when no item has the key.
    virtual Ref<T> Item(const String& key) const = 0;
};

/// A list from which the control removes.
template <class T>
class EditableCollection : public Collection<T> {
public:
    /// Error 5 when no item has the key; nothing changes then.
    virtual void Remove(const String& key) = 0;
};

/// A column of a table: an entry of its list.
class ZANDOR_CONTROL_EXPORT ZDColumn {
public:
    virtual ~ZDColumn() = default;
    /// The entry's text. Joins are drawn to the entry of this name.
    virtual String Name() const = 0;
    /// Unique in the table.
    virtual String Key() const = 0;
    /// Whether the column is decorated in the list, as a key column is.
    virtual bool Marker() const = 0;
    /// Whether the user has selected the entry.
    virtual bool Selected() const = 0;
    virtual void Selected(bool value) = 0;
    /// 1 while the user has the column's entry selected, 0 otherwise.
    virtual void activated(std::int16_t value) = 0;
};

/// A table on the canvas. Placement is in twips; a negative Left or Top, and a Width or Height of 0
/// or less, leave the place, respectively the size, to the control.
class ZANDOR_CONTROL_EXPORT ZDTable {
public:
    virtual ~ZDTable() = default;
    /// The title. Hosts and criteria name tables by it, so it should be unique in the query.
    virtual String Name() const = 0;
    /// Unique in the query.
    virtual String Key() const = 0;
    virtual std::int32_t Left() const = 0;   ///< of the left edge on the canvas
    virtual std::int32_t Top() const = 0;    ///< of the upper edge on the canvas
    virtual std::int32_t Width() const = 0;  ///< the border included
    virtual std::int32_t Height() const = 0; ///< title and border included
    virtual void Left(float value) = 0;      ///< the user has moved the table, or the control
    virtual void Top(float value) = 0;       ///< the same for the upper edge
    virtual void Width(float value) = 0;     ///< the user has resized the table, or the control
    virtual void Height(float value) = 0;    ///< the same for the height
    /// Nonzero when the table is the selected one.
    virtual std::int16_t Selected() const = 0;
    virtual void Selected(std::int16_t value) = 0;
    /// The columns, in the order of the list; lives as long as the table.
    virtual Collection<ZDColumn>& Columns() = 0;
};

/// A join between a column of one table and a column of another.
///
/// JoinType: 0 normal, 1 left outer, 2 right outer, 3 both outer.
/// CompareOperator: 0 "=", 1 "<>", 2 "<", 3 ">", 4 "<=", 5 ">=".
class ZANDOR_CONTROL_EXPORT ZDJoin {
public:
    virtual ~ZDJoin() = default;
    /// The table at the left end; nothing while it is not set. A new join gets it first.
    virtual Ref<ZDTable> LeftTable() const = 0;
    virtual void LeftTable(const Ref<ZDTable>& value) = 0;
    /// The column at the left end, one of that table; nothing while it is not set.
    virtual Ref<ZDColumn> LeftColumn() const = 0;
    virtual void LeftColumn(const Ref<ZDColumn>& value) = 0;
    /// The table at the right end; nothing while it is not set. A new join gets it first.
    virtual Ref<ZDTable> RightTable() const = 0;
    virtual void RightTable(const Ref<ZDTable>& value) = 0;
    /// The column at the right end, one of that table; nothing while it is not set.
    virtual Ref<ZDColumn> RightColumn() const = 0;
    virtual void RightColumn(const Ref<ZDColumn>& value) = 0;
    /// 0 to 3; the control sets no other.
    virtual std::int16_t JoinType() const = 0;
    virtual void JoinType(std::int16_t value) = 0;
    /// 0 to 5; the control sets no other.
    virtual std::int16_t CompareOperator() const = 0;
    virtual void CompareOperator(std::int16_t value) = 0;
    /// Unique in the query once it was added; the control does not ask before.
    virtual String Key() const = 0;
};

/// The criterion of an output column in one row of the grid.
class ZANDOR_CONTROL_EXPORT ZDCriterium {
public:
    virtual ~ZDCriterium() = default;
    /// The text as it was typed; empty: none in this row.
    virtual String Criterium() const = 0;
    virtual void Criterium(const String& value) = 0;
};

/// One output column. SortOrder: 0 none, 1 ascending, 2 descending.
class ZANDOR_CONTROL_EXPORT ZDColumnDefinition {
public:
    virtual ~ZDColumnDefinition() = default;
    /// What comes out; the grid shows its name. Nothing while it is not set.
    virtual Ref<ZDColumn> Column() const = 0;
    virtual void Column(const Ref<ZDColumn>& value) = 0;
    /// The name that the column comes out under; empty: its own.
    virtual String Synonym() const = 0;
    virtual void Synonym(const String& value) = 0;
    /// 0 to 2; the control sets no other.
    virtual std::int16_t SortOrder() const = 0;
    virtual void SortOrder(std::int16_t value) = 0;
    /// Whether the column comes out; one that does not may still sort and restrict.
    virtual bool Visible() const = 0;
    virtual void Visible(bool value) = 0;
    /// "x" followed by a decimal number, for a definition that the grid can edit.
    virtual String Key() const = 0;
    /// By position the rows of the grid from the first one for criteria on.
    virtual EditableCollection<ZDCriterium>& Criteria() = 0;
    /// Criteria keys are grid row numbers in decimal: "4", "5" and so on.
    virtual bool HasCriterium(const String& key) const = 0;
    /// Error 457 when the row has a criterion already; nothing is added then.
    virtual void AddCriterium(const String& text, const String& key) = 0;
};

/// The query.
class ZANDOR_CONTROL_EXPORT Zandor {
public:
    virtual ~Zandor() = default;
    virtual Collection<ZDTable>& Tables() = 0;       ///< lives as long as the query
    virtual EditableCollection<ZDJoin>& Joins() = 0; ///< lives as long as the query
    /// In the order of the grid's columns; lives as long as the query.
    virtual EditableCollection<ZDColumnDefinition>& ColumnDefinitions() = 0;
    /// Stores the join and returns it as stored.
    virtual Ref<ZDJoin> AddJoin(const Ref<ZDJoin>& join) = 0;
    /// Stores the definition and returns it as stored.
    virtual Ref<ZDColumnDefinition>
    AddColumnDefinition(const Ref<ZDColumnDefinition>& definition) = 0;
    /// Takes what hangs on the table along: its joins and output columns.
    virtual void DeleteTable(const Ref<ZDTable>& table) = 0;
};

/// What a query may be besides: one whose definitions have an order, which is to be that of the
/// grid's columns. The control asks for it by a cast of the query and never requires it; where it
/// is missing, columns stand where they were dropped and cannot be moved.
class ZANDOR_CONTROL_EXPORT OrderedDefinitions {
public:
    virtual ~OrderedDefinitions() = default;
    /// A definition of the query now stands right behind another one of it, or before all others
    /// when that is nothing.
    virtual void StandsBehind(const Ref<ZDColumnDefinition>& definition,
                              const Ref<ZDColumnDefinition>& predecessor) = 0;
};

/// What a table may be besides: one that is told of its whole selection at once. The control asks
/// for it by a cast of the table and never requires it; where it is missing, `ZDColumn::activated`
/// is called for each column at each press on an entry.
class ZANDOR_CONTROL_EXPORT ActivatedColumns {
public:
    virtual ~ActivatedColumns() = default;
    /// The columns with these keys are activated now, and no others. Error 5 when no column has one
    /// of the keys; those before it are activated then. False, and nothing has happened, where
    /// columns may be others by now than those that were listed: each is called for then.
    virtual bool Activate(const std::vector<String>& keys) = 0;
};

/// What a definition may be besides: one that keeps how wide its column of the grid is. It is asked
/// for by a cast of the definition and never required; where it is missing, a width that somebody
/// gives a column lasts as long as the control shows the query.
class ZANDOR_CONTROL_EXPORT SizedDefinition {
public:
    virtual ~SizedDefinition() = default;
    /// In twips; 0 leaves the width to the control, and so does anything less. A wider column than
    /// `greatestWidth` is never asked for nor shown.
    virtual std::int32_t Width() const = 0;
    virtual void Width(std::int32_t value) = 0;

    /// In twips.
    static constexpr std::int32_t greatestWidth = 100'000;
};

/// Makes the model objects that the control needs of its own accord.
class ZANDOR_CONTROL_EXPORT Library {
public:
    virtual ~Library() = default;
    virtual Ref<Zandor> NewZandor() = 0; ///< an empty query, to begin with and after Terminate
    /// An empty join, which the control fills in and hands to AddJoin.
    virtual Ref<ZDJoin> NewZDJoin() = 0;
    /// An empty definition, which the control fills in and hands to AddColumnDefinition.
    virtual Ref<ZDColumnDefinition> NewZDColumnDefinition() = 0;
};

} // namespace TalvikZandorLib
