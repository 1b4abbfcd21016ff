#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/model/Criteria.h>
#include <Zandor/platform/KeyedCollection.h>

/// A report of a program's own, whose classes are what the designer asks for: it reads them when
/// it shows the report, and writes into them whatever its user does. A failure is an exception of
/// any kind; the designer shows its text and goes on.
namespace report {

using namespace TalvikZandorLib;
using zandor::platform::KeyedCollection;
using zandor::platform::makeRef;

// [field]
class Field final : public ZDColumn {
public:
    Field(const String& source, const String& name, bool isKey)
        : name(name), key(source + u'.' + name), isKey(isKey) {}

    String Name() const override { return name; }
    String Key() const override { return key; }
    bool Marker() const override { return isKey; }
    bool Selected() const override { return selected; }
    void Selected(bool value) override { selected = value; }
    void activated(std::int16_t) override {}

    const String name, key;
    const bool isKey;
    bool selected = false;
};
// [field]

class Source final : public ZDTable {
public:
    Source(String name, std::int32_t left) : name(std::move(name)), left(left) {}
    void add(const String& field, bool isKey = false) {
        const auto added = makeRef<Field>(name, field, isKey);
        fields.Add(added, added->key);
    }

    String Name() const override { return name; }
    String Key() const override { return name; }
    std::int32_t Left() const override { return left; }
    std::int32_t Top() const override { return top; }
    std::int32_t Width() const override { return width; }
    std::int32_t Height() const override { return height; }
    void Left(float value) override { left = static_cast<std::int32_t>(value); }
    void Top(float value) override { top = static_cast<std::int32_t>(value); }
    void Width(float value) override { width = static_cast<std::int32_t>(value); }
    void Height(float value) override { height = static_cast<std::int32_t>(value); }
    std::int16_t Selected() const override { return selected; }
    void Selected(std::int16_t value) override { selected = value; }
    Collection<ZDColumn>& Columns() override { return fields; }

    const String name;
    KeyedCollection<ZDColumn> fields;
    std::int32_t left, top = 600, width = 2400, height = 1500; // twips, 1440 to an inch
    std::int16_t selected = 0;
};

// [link]
class Link final : public ZDJoin {
public:
    Ref<ZDTable> LeftTable() const override { return from; }
    Ref<ZDColumn> LeftColumn() const override { return fromField; }
    Ref<ZDTable> RightTable() const override { return to; }
    Ref<ZDColumn> RightColumn() const override { return toField; }
    void LeftTable(const Ref<ZDTable>& value) override { from = value; }
    void LeftColumn(const Ref<ZDColumn>& value) override { fromField = value; }
    void RightTable(const Ref<ZDTable>& value) override { to = value; }
    void RightColumn(const Ref<ZDColumn>& value) override { toField = value; }
    std::int16_t JoinType() const override { return type; }
    void JoinType(std::int16_t value) override { type = value; }
    std::int16_t CompareOperator() const override { return comparison; }
    void CompareOperator(std::int16_t value) override { comparison = value; }
    String Key() const override { return key; }

    String key; // empty: not in the report yet
    Ref<ZDTable> from, to;
    Ref<ZDColumn> fromField, toField;
    std::int16_t type = 0, comparison = 0;
};
// [link]

class Output final : public ZDColumnDefinition {
public:
    Ref<ZDColumn> Column() const override { return field; }
    void Column(const Ref<ZDColumn>& value) override { field = value; }
    String Synonym() const override { return title; }
    void Synonym(const String& value) override { title = value; }
    std::int16_t SortOrder() const override { return order; }
    void SortOrder(std::int16_t value) override { order = value; }
    bool Visible() const override { return shown; }
    void Visible(bool value) override { shown = value; }
    String Key() const override { return key; }
    EditableCollection<ZDCriterium>& Criteria() override { return conditions; }
    bool HasCriterium(const String& row) const override { return conditions.Contains(row); }
    void AddCriterium(const String& text, const String& row) override { conditions.Add(text, row); }

    String key; // "x" and a number; empty: not in the report yet
    Ref<ZDColumn> field;
    String title;
    std::int16_t order = 0;
    bool shown = true;
    zandor::model::Criteria conditions; // by row of the grid
};

// [report]
class Report final : public Zandor {
public:
    Collection<ZDTable>& Tables() override { return sources; }
    EditableCollection<ZDJoin>& Joins() override { return links; }
    EditableCollection<ZDColumnDefinition>& ColumnDefinitions() override { return outputs; }

    Ref<ZDJoin> AddJoin(const Ref<ZDJoin>& join) override {
        return add(dynamic_cast<Link&>(*join), u'j', join, links);
    }
    Ref<ZDColumnDefinition> AddColumnDefinition(const Ref<ZDColumnDefinition>& output) override {
        return add(dynamic_cast<Output&>(*output), u'x', output, outputs);
    }
    void DeleteTable(const Ref<ZDTable>& table) override {
        const auto& fields = dynamic_cast<Source&>(*table).fields;
        removeWhere(links, [&](ZDJoin& link) {
            return link.LeftTable() == table || link.RightTable() == table;
        });
        removeWhere(outputs, [&](ZDColumnDefinition& output) {
            return fields.Contains(output.Column()->Key());
        });
        sources.Remove(table->Key());
    }

    KeyedCollection<ZDTable> sources;
    KeyedCollection<ZDJoin> links;
    KeyedCollection<ZDColumnDefinition> outputs;

private:
    /// What comes for the first time gets its key.
    template <class Own, class T>
    Ref<T> add(Own& own, char16_t letter, const Ref<T>& item, KeyedCollection<T>& to) {
        if (own.key.empty()) own.key = letter + zandor::platform::decimal(++lastKey);
        to.Add(item, own.key);
        return item;
    }

    template <class T, class Wanted>
    static void removeWhere(KeyedCollection<T>& items, Wanted wanted) {
        for (std::int32_t n = items.Count(); n > 0; --n)
            if (wanted(*items.Item(n))) items.Remove(items.Item(n)->Key());
    }

    int lastKey = 0;
};
// [report]

// [library]
/// What the designer makes of its own accord: an empty report to begin with, and links and outputs
/// that it fills in before it hands them to AddJoin and AddColumnDefinition.
class Library final : public TalvikZandorLib::Library {
public:
    Ref<Zandor> NewZandor() override { return makeRef<Report>(); }
    Ref<ZDJoin> NewZDJoin() override { return makeRef<Link>(); }
    Ref<ZDColumnDefinition> NewZDColumnDefinition() override { return makeRef<Output>(); }
};
// [library]

} // namespace report
