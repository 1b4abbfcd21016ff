#pragma once

#include "Report.h"

#include <Zandor/TalvikZandorLib.h>

#include <functional>

/// The report as the designer's query model. Every class is a thin handle over a struct of the
/// report and made anew whenever the designer asks: the designer tells objects apart by their keys
/// alone. So there is one truth, the report, and nothing to keep in step with it.
///
/// A failure is an exception, of any kind: the designer shows its text and goes on.
namespace report {

namespace platform = zandor::platform;

using platform::Ref;
using platform::String;

/// A list of the report as a collection of handles.
template <class Interface>
class Handles final : public TalvikZandorLib::EditableCollection<Interface> {
public:
    using Make = std::function<Ref<Interface>(std::size_t)>;
    Handles(std::function<std::size_t()> count, Make make,
            std::function<void(std::size_t)> remove = {})
        : mCount(std::move(count)), mMake(std::move(make)), mRemove(std::move(remove)) {}

    std::int32_t Count() const override { return static_cast<std::int32_t>(mCount()); }
    Ref<Interface> Item(std::int32_t position) const override { // from 1
        if (position < 1 || position > Count()) throw platform::errors::subscriptOutOfRange();
        return mMake(static_cast<std::size_t>(position) - 1);
    }
    Ref<Interface> Item(const String& key) const override { return mMake(find(key)); }
    void Remove(const String& key) override { mRemove(find(key)); }

private:
    std::size_t find(const String& key) const {
        for (std::size_t at = 0; at < mCount(); ++at)
            if (mMake(at)->Key() == key) return at;
        throw platform::errors::invalidProcedureCall();
    }

    std::function<std::size_t()> mCount;
    Make mMake;
    std::function<void(std::size_t)> mRemove;
};

// [column]
class Column final : public TalvikZandorLib::ZDColumn {
public:
    Column(std::shared_ptr<Source> source, std::size_t position)
        : source(std::move(source)), position(position) {}

    String Name() const override { return platform::fromUtf8(field().name); }
    String Key() const override { return platform::fromUtf8(field().name); }
    bool Marker() const override { return field().key; }
    bool Selected() const override { return field().marked; }
    void Selected(bool value) override { field().marked = value; }
    void activated(std::int16_t) override {}

    const std::shared_ptr<Source> source;
    const std::size_t position;

private:
    Field& field() const { return source->fields.at(position); }
};
// [column]

class Table final : public TalvikZandorLib::ZDTable {
public:
    explicit Table(std::shared_ptr<Source> source);

    String Name() const override { return platform::fromUtf8(source->name); }
    String Key() const override { return u't' + platform::decimal(source->id); }
    std::int32_t Left() const override { return source->left; }
    std::int32_t Top() const override { return source->top; }
    std::int32_t Width() const override { return source->width; }
    std::int32_t Height() const override { return source->height; }
    void Left(float value) override { source->left = static_cast<int>(value); }
    void Top(float value) override { source->top = static_cast<int>(value); }
    void Width(float value) override { source->width = static_cast<int>(value); }
    void Height(float value) override { source->height = static_cast<int>(value); }
    std::int16_t Selected() const override { return source->current ? -1 : 0; }
    void Selected(std::int16_t value) override { source->current = value != 0; }
    TalvikZandorLib::Collection<TalvikZandorLib::ZDColumn>& Columns() override { return mColumns; }

    const std::shared_ptr<Source> source;

private:
    Handles<TalvikZandorLib::ZDColumn> mColumns;
};

class Join final : public TalvikZandorLib::ZDJoin {
public:
    explicit Join(std::shared_ptr<Link> link) : link(std::move(link)) {}

    Ref<TalvikZandorLib::ZDTable> LeftTable() const override;
    void LeftTable(const Ref<TalvikZandorLib::ZDTable>& value) override;
    Ref<TalvikZandorLib::ZDColumn> LeftColumn() const override;
    void LeftColumn(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    Ref<TalvikZandorLib::ZDTable> RightTable() const override;
    void RightTable(const Ref<TalvikZandorLib::ZDTable>& value) override;
    Ref<TalvikZandorLib::ZDColumn> RightColumn() const override;
    void RightColumn(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    std::int16_t JoinType() const override { return static_cast<std::int16_t>(link->kind); }
    void JoinType(std::int16_t value) override { link->kind = value; }
    std::int16_t CompareOperator() const override {
        return static_cast<std::int16_t>(link->comparison);
    }
    void CompareOperator(std::int16_t value) override { link->comparison = value; }
    String Key() const override { return u'j' + platform::decimal(link->id); }

    const std::shared_ptr<Link> link;
};

class Condition final : public TalvikZandorLib::ZDCriterium {
public:
    Condition(std::shared_ptr<Output> output, int row) : mOutput(std::move(output)), mRow(row) {}

    String Criterium() const override;
    void Criterium(const String& value) override;
    String Key() const { return platform::decimal(mRow); }

private:
    std::shared_ptr<Output> mOutput;
    int mRow;
};

/// By position every row from the first to the last one with a condition, so that each shows in
/// its own; a row without one reads as empty.
class Conditions final : public TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDCriterium> {
public:
    explicit Conditions(std::shared_ptr<Output> output) : mOutput(std::move(output)) {}

    std::int32_t Count() const override;
    Ref<TalvikZandorLib::ZDCriterium> Item(std::int32_t position) const override;
    Ref<TalvikZandorLib::ZDCriterium> Item(const String& key) const override;
    void Remove(const String& key) override;
    bool contains(const String& key) const;

private:
    std::shared_ptr<Output> mOutput;
};

class Definition final : public TalvikZandorLib::ZDColumnDefinition {
public:
    explicit Definition(std::shared_ptr<Output> output) : output(output), mConditions(output) {}

    Ref<TalvikZandorLib::ZDColumn> Column() const override;
    void Column(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    String Synonym() const override { return platform::fromUtf8(output->title); }
    void Synonym(const String& value) override { output->title = platform::toUtf8(value); }
    std::int16_t SortOrder() const override { return static_cast<std::int16_t>(output->order); }
    void SortOrder(std::int16_t value) override { output->order = value; }
    bool Visible() const override { return output->shown; }
    void Visible(bool value) override { output->shown = value; }
    /// The one key whose form matters: "x" and a number.
    String Key() const override { return u'x' + platform::decimal(output->id); }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDCriterium>& Criteria() override {
        return mConditions;
    }
    bool HasCriterium(const String& key) const override { return mConditions.contains(key); }
    void AddCriterium(const String& text, const String& key) override;

    const std::shared_ptr<Output> output;

private:
    Conditions mConditions;
};

class Model final : public TalvikZandorLib::Zandor {
public:
    explicit Model(std::shared_ptr<Report> report);

    TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& Tables() override { return mTables; }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDJoin>& Joins() override {
        return mJoins;
    }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDColumnDefinition>&
    ColumnDefinitions() override {
        return mDefinitions;
    }
    Ref<TalvikZandorLib::ZDJoin> AddJoin(const Ref<TalvikZandorLib::ZDJoin>& join) override;
    Ref<TalvikZandorLib::ZDColumnDefinition>
    AddColumnDefinition(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition) override;
    void DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) override;

private:
    const std::shared_ptr<Report> mReport;
    Handles<TalvikZandorLib::ZDTable> mTables;
    Handles<TalvikZandorLib::ZDJoin> mJoins;
    Handles<TalvikZandorLib::ZDColumnDefinition> mDefinitions;
};

// [library]
/// What the designer makes of its own accord: an empty query to begin with, and joins and output
/// columns that it fills in before it hands them to AddJoin and AddColumnDefinition.
class Library final : public TalvikZandorLib::Library {
public:
    Ref<TalvikZandorLib::Zandor> NewZandor() override {
        return platform::makeRef<Model>(std::make_shared<Report>());
    }
    Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override {
        return platform::makeRef<Join>(std::make_shared<Link>());
    }
    Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override {
        return platform::makeRef<Definition>(std::make_shared<Output>());
    }
};
// [library]

} // namespace report
