#pragma once

#include <Zandor/headless/Faults.h>
#include <Zandor/platform/KeyedCollection.h>

#include <initializer_list>
#include <memory>
#include <string>
#include <vector>

/// A host's own query model, whose every member can be made to fail. Tests look at the plain fields
/// and builders of the objects, which are not recorded; the control uses their members, which are.
namespace fake {

using zandor::platform::Ref;
using zandor::platform::String;

/// Calls are named "ZDTable.Name" for a getter or method, "ZDTable.Left=" for a setter; of the
/// collections "Tables.Count", "Tables.Item(position)", "Tables.Item(key)", "Joins.Remove".
using Calls = std::shared_ptr<zandor::platform::headless::Faults>;

/// Every call that a model can get.
const std::vector<std::string>& memberNames();

/// A part of a model; all parts share one record of calls.
class Part {
public:
    explicit Part(Calls calls) : mCalls(std::move(calls)) {}

protected:
    /// std::logic_error when the name is missing among memberNames().
    void called(const std::string& member) const;

private:
    Calls mCalls;
};

template <class T>
class Collection final : public TalvikZandorLib::EditableCollection<T>, private Part {
public:
    Collection(Calls calls, std::string name) : Part(std::move(calls)), mName(std::move(name)) {}

    std::int32_t Count() const override {
        called(mName + ".Count");
        return items.Count();
    }
    Ref<T> Item(std::int32_t position) const override {
        called(mName + ".Item(position)");
        return items.Item(position);
    }
    Ref<T> Item(const String& key) const override {
        called(mName + ".Item(key)");
        return items.Item(key);
    }
    void Remove(const String& key) override {
        called(mName + ".Remove");
        items.Remove(key);
    }

    zandor::platform::KeyedCollection<T> items;

private:
    std::string mName;
};

class Column final : public TalvikZandorLib::ZDColumn, private Part {
public:
    explicit Column(Calls calls) : Part(std::move(calls)) {}
    String Name() const override;
    String Key() const override;
    bool Marker() const override;
    bool Selected() const override;
    void Selected(bool value) override;
    void activated(std::int16_t value) override;

    String name;
    String key;
    bool marker = false;
    bool selected = false;
    std::int16_t activatedValue = -1; ///< -1: never written
};

class Table final : public TalvikZandorLib::ZDTable, private Part {
public:
    explicit Table(Calls calls) : Part(calls), columns(calls, "Columns"), mCalls(calls) {}
    String Name() const override;
    String Key() const override;
    std::int32_t Left() const override;
    std::int32_t Top() const override;
    std::int32_t Width() const override;
    std::int32_t Height() const override;
    void Left(float value) override;
    void Top(float value) override;
    void Width(float value) override;
    void Height(float value) override;
    std::int16_t Selected() const override;
    void Selected(std::int16_t value) override;
    TalvikZandorLib::Collection<TalvikZandorLib::ZDColumn>& Columns() override;

    /// The column's key is "k" and its name, unless given.
    Ref<Column> addColumn(const String& name, const String& key = {});
    /// By name.
    Column& column(const String& name) const;
    Ref<Column> columnRef(const String& name) const;
    Table& place(float left, float top, float width, float height);

    String name;
    String key;
    float left = -1;
    float top = -1;
    float width = 0;
    float height = 0;
    std::int16_t selected = 0;
    Collection<TalvikZandorLib::ZDColumn> columns;

private:
    Calls mCalls;
};

class Join final : public TalvikZandorLib::ZDJoin, private Part {
public:
    explicit Join(Calls calls) : Part(std::move(calls)) {}
    Ref<TalvikZandorLib::ZDTable> LeftTable() const override;
    void LeftTable(const Ref<TalvikZandorLib::ZDTable>& value) override;
    Ref<TalvikZandorLib::ZDColumn> LeftColumn() const override;
    void LeftColumn(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    Ref<TalvikZandorLib::ZDTable> RightTable() const override;
    void RightTable(const Ref<TalvikZandorLib::ZDTable>& value) override;
    Ref<TalvikZandorLib::ZDColumn> RightColumn() const override;
    void RightColumn(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    std::int16_t JoinType() const override;
    void JoinType(std::int16_t value) override;
    std::int16_t CompareOperator() const override;
    void CompareOperator(std::int16_t value) override;
    String Key() const override;

    Ref<TalvikZandorLib::ZDTable> leftTable, rightTable;
    Ref<TalvikZandorLib::ZDColumn> leftColumn, rightColumn;
    std::int16_t joinType = 0;
    std::int16_t compareOperator = 0;
    String key;
};

class Criterion final : public TalvikZandorLib::ZDCriterium, private Part {
public:
    explicit Criterion(Calls calls) : Part(std::move(calls)) {}
    String Criterium() const override;
    void Criterium(const String& value) override;

    String text;
};

class Definition : public TalvikZandorLib::ZDColumnDefinition, private Part {
public:
    explicit Definition(Calls calls) : Part(calls), criteria(calls, "Criteria"), mCalls(calls) {}
    Ref<TalvikZandorLib::ZDColumn> Column() const override;
    void Column(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    String Synonym() const override;
    void Synonym(const String& value) override;
    std::int16_t SortOrder() const override;
    void SortOrder(std::int16_t value) override;
    bool Visible() const override;
    void Visible(bool value) override;
    String Key() const override;
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDCriterium>& Criteria() override;
    bool HasCriterium(const String& key) const override;
    void AddCriterium(const String& text, const String& key) override;

    /// The text under a key; error 5 when there is none.
    String criterion(const String& key) const;
    void addCriterion(const String& text, const String& key);

    Ref<TalvikZandorLib::ZDColumn> column;
    String synonym;
    std::int16_t sortOrder = 0;
    bool visible = true;
    String key;
    Collection<TalvikZandorLib::ZDCriterium> criteria;

private:
    Calls mCalls;
};

class Model : public TalvikZandorLib::Zandor, private Part {
public:
    explicit Model(Calls calls = std::make_shared<zandor::platform::headless::Faults>());
    TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& Tables() override;
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDJoin>& Joins() override;
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDColumnDefinition>&
    ColumnDefinitions() override;
    /// Gives the join the key "j" and the next number.
    Ref<TalvikZandorLib::ZDJoin> AddJoin(const Ref<TalvikZandorLib::ZDJoin>& join) override;
    /// Gives the definition the key "x" and the next number.
    Ref<TalvikZandorLib::ZDColumnDefinition>
    AddColumnDefinition(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition) override;
    /// Removes the table only: joins and definitions of it stay.
    void DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) override;

    /// The table's key is "t" and its name, unless given. Unplaced and unsized.
    Ref<Table> table(const String& name, std::initializer_list<String> columns = {},
                     const String& key = {});
    Ref<Join> join(const Ref<Table>& left, const String& leftColumn, const Ref<Table>& right,
                   const String& rightColumn, std::int16_t joinType = 0,
                   std::int16_t compareOperator = 0);
    /// Criteria go under the keys "4", "5" and so on.
    Ref<Definition> definition(const Ref<Table>& table, const String& column,
                               std::initializer_list<String> criteria = {});

    // What the model holds, by position from 1 and without a record of it.
    Table& tableAt(std::int32_t position) const;
    Join& joinAt(std::int32_t position) const;
    Definition& definitionAt(std::int32_t position) const;
    std::int32_t tableCount() const { return tables.items.Count(); }
    std::int32_t joinCount() const { return joins.items.Count(); }
    std::int32_t definitionCount() const { return definitions.items.Count(); }

    /// The nth call of a member from now on fails with `error`, which is any exception.
    /// std::logic_error for a name that is not among memberNames().
    template <class Error>
    void fail(const std::string& member, const Error& error, int nth = 1) {
        mustKnow(member);
        calls->failNext(member, error, nth);
    }

    /// The calls of this model, its parts and its library, and the failures armed.
    const Calls calls;

    /// When set, AddJoin and AddColumnDefinition store a copy of their own.
    bool storesCopies = false;

    Collection<TalvikZandorLib::ZDTable> tables;
    Collection<TalvikZandorLib::ZDJoin> joins;
    Collection<TalvikZandorLib::ZDColumnDefinition> definitions;

private:
    static void mustKnow(const std::string& member);

    std::int32_t mLastJoin = 0;
    std::int32_t mLastDefinition = 0;
};

/// Makes empty models, joins and definitions that share one record of calls.
class Library final : public TalvikZandorLib::Library, private Part {
public:
    explicit Library(Calls calls = std::make_shared<zandor::platform::headless::Faults>())
        : Part(calls), calls(calls) {}
    Ref<TalvikZandorLib::Zandor> NewZandor() override;
    Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override;
    Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override;

    /// A model for a test to build, on the same record.
    Ref<Model> newModel() const { return zandor::platform::makeRef<Model>(calls); }

    const Calls calls;
};

} // namespace fake
