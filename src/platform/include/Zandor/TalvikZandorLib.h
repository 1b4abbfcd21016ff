#pragma once

#include <Zandor/platform/Ref.h>
#include <Zandor/platform/export.h>

/// What the control asks of the host's query model. A host implements these classes over its own;
/// an exception thrown from any of them is reported to the user and ends the procedure that called.
namespace TalvikZandorLib {

namespace platform = zandor::platform;

using platform::Ref;
using platform::String;

template <class T>
class Collection {
public:
    virtual ~Collection() = default;
    virtual std::int32_t Count() const = 0;
    /// Position is 1-based; error 9 outside 1 to Count.
    virtual Ref<T> Item(std::int32_t position) const = 0;
    /// Error 5 when no item has the key.
    virtual Ref<T> Item(const String& key) const = 0;
};

template <class T>
class EditableCollection : public Collection<T> {
public:
    /// Error 5 when no item has the key.
    virtual void Remove(const String& key) = 0;
};

class ZANDOR_CONTROL_EXPORT ZDColumn {
public:
    virtual ~ZDColumn() = default;
    virtual String Name() const = 0;
    virtual String Key() const = 0;
    /// Whether the column is decorated in the list, as a key column is.
    virtual bool Marker() const = 0;
    virtual bool Selected() const = 0;
    virtual void Selected(bool value) = 0;
    /// 1 while the user has the column's entry selected, 0 otherwise.
    virtual void activated(std::int16_t value) = 0;
};

/// Placement is in twips; a negative Left or Top, and a Width or Height of 0 or less, leave the
/// place, respectively the size, to the control.
class ZANDOR_CONTROL_EXPORT ZDTable {
public:
    virtual ~ZDTable() = default;
    virtual String Name() const = 0;
    virtual String Key() const = 0;
    virtual std::int32_t Left() const = 0;
    virtual std::int32_t Top() const = 0;
    virtual std::int32_t Width() const = 0;
    virtual std::int32_t Height() const = 0;
    virtual void Left(float value) = 0;
    virtual void Top(float value) = 0;
    virtual void Width(float value) = 0;
    virtual void Height(float value) = 0;
    /// Nonzero when the table is the selected one.
    virtual std::int16_t Selected() const = 0;
    virtual void Selected(std::int16_t value) = 0;
    virtual Collection<ZDColumn>& Columns() = 0;
};

/// JoinType: 0 normal, 1 left outer, 2 right outer, 3 both outer.
/// CompareOperator: 0 "=", 1 "<>", 2 "<", 3 ">", 4 "<=", 5 ">=".
class ZANDOR_CONTROL_EXPORT ZDJoin {
public:
    virtual ~ZDJoin() = default;
    virtual Ref<ZDTable> LeftTable() const = 0;
    virtual void LeftTable(const Ref<ZDTable>& value) = 0;
    virtual Ref<ZDColumn> LeftColumn() const = 0;
    virtual void LeftColumn(const Ref<ZDColumn>& value) = 0;
    virtual Ref<ZDTable> RightTable() const = 0;
    virtual void RightTable(const Ref<ZDTable>& value) = 0;
    virtual Ref<ZDColumn> RightColumn() const = 0;
    virtual void RightColumn(const Ref<ZDColumn>& value) = 0;
    virtual std::int16_t JoinType() const = 0;
    virtual void JoinType(std::int16_t value) = 0;
    virtual std::int16_t CompareOperator() const = 0;
    virtual void CompareOperator(std::int16_t value) = 0;
    virtual String Key() const = 0;
};

class ZANDOR_CONTROL_EXPORT ZDCriterium {
public:
    virtual ~ZDCriterium() = default;
    virtual String Criterium() const = 0;
    virtual void Criterium(const String& value) = 0;
};

/// One output column. SortOrder: 0 none, 1 ascending, 2 descending.
class ZANDOR_CONTROL_EXPORT ZDColumnDefinition {
public:
    virtual ~ZDColumnDefinition() = default;
    virtual Ref<ZDColumn> Column() const = 0;
    virtual void Column(const Ref<ZDColumn>& value) = 0;
    virtual String Synonym() const = 0;
    virtual void Synonym(const String& value) = 0;
    virtual std::int16_t SortOrder() const = 0;
    virtual void SortOrder(std::int16_t value) = 0;
    virtual bool Visible() const = 0;
    virtual void Visible(bool value) = 0;
    /// "x" followed by a decimal number, for a definition that the grid can edit.
    virtual String Key() const = 0;
    virtual EditableCollection<ZDCriterium>& Criteria() = 0;
    /// Criteria keys are grid row numbers in decimal: "4", "5" and so on.
    virtual bool HasCriterium(const String& key) const = 0;
    virtual void AddCriterium(const String& text, const String& key) = 0;
};

/// The query.
class ZANDOR_CONTROL_EXPORT Zandor {
public:
    virtual ~Zandor() = default;
    virtual Collection<ZDTable>& Tables() = 0;
    virtual EditableCollection<ZDJoin>& Joins() = 0;
    virtual EditableCollection<ZDColumnDefinition>& ColumnDefinitions() = 0;
    /// Stores the join and returns it as stored.
    virtual Ref<ZDJoin> AddJoin(const Ref<ZDJoin>& join) = 0;
    /// Stores the definition and returns it as stored.
    virtual Ref<ZDColumnDefinition>
    AddColumnDefinition(const Ref<ZDColumnDefinition>& definition) = 0;
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

    static constexpr std::int32_t greatestWidth = 100'000;
};

/// Makes the model objects that the control needs of its own accord.
class ZANDOR_CONTROL_EXPORT Library {
public:
    virtual ~Library() = default;
    virtual Ref<Zandor> NewZandor() = 0;
    virtual Ref<ZDJoin> NewZDJoin() = 0;
    virtual Ref<ZDColumnDefinition> NewZDColumnDefinition() = 0;
};

} // namespace TalvikZandorLib
