#pragma once

#include "Host.h"

/// Query models written in Python, behind the control's interfaces, as thin adapters.
namespace zandor::python {

/// What an attribute of a host lists. Whatever the host returns the next time, nothing hangs on it.
template <class T>
class PythonCollection final : public TalvikZandorLib::EditableCollection<T> {
public:
    PythonCollection(const Host& owner, const char* attribute)
        : mOwner(owner), mAttribute(attribute) {}

    /// The collection as the attribute has it now.
    PythonCollection& now() {
        const Gil gil;
        mList = Object::take(PyObject_GetAttrString(mOwner.object(), mAttribute));
        return *this;
    }

    std::int32_t Count() const override {
        const List list(*this);
        return list.host.template get<std::int32_t>("Count");
    }
    Ref<T> Item(std::int32_t position) const override {
        const List list(*this);
        return list.host.template call<Ref<T>>("Item", position);
    }
    Ref<T> Item(const platform::String& key) const override {
        const List list(*this);
        return list.host.template call<Ref<T>>("Item", key);
    }
    void Remove(const platform::String& key) override {
        const List list(*this);
        list.host.call("Remove", key);
    }

private:
    /// The collection during a call, in which the attribute may get another.
    struct List {
        explicit List(const PythonCollection& of) : object(of.mList), host(object.get()) {}
        const Gil gil;
        const Object object;
        const Host host;
    };

    const Host& mOwner;
    const char* const mAttribute;
    Object mList;
};

class PythonColumn final : public TalvikZandorLib::ZDColumn, public Host {
public:
    using Host::Host;
    platform::String Name() const override { return get<platform::String>("Name"); }
    platform::String Key() const override { return get<platform::String>("Key"); }
    bool Marker() const override { return get<bool>("Marker"); }
    bool Selected() const override { return get<bool>("Selected"); }
    void Selected(bool value) override { set("Selected", value); }
    void activated(std::int16_t value) override { set("activated", value); }
};

class PythonTable final : public TalvikZandorLib::ZDTable, public Host {
public:
    using Host::Host;
    platform::String Name() const override { return get<platform::String>("Name"); }
    platform::String Key() const override { return get<platform::String>("Key"); }
    std::int32_t Left() const override { return get<std::int32_t>("Left"); }
    std::int32_t Top() const override { return get<std::int32_t>("Top"); }
    std::int32_t Width() const override { return get<std::int32_t>("Width"); }
    std::int32_t Height() const override { return get<std::int32_t>("Height"); }
    void Left(float value) override { set("Left", value); }
    void Top(float value) override { set("Top", value); }
    void Width(float value) override { set("Width", value); }
    void Height(float value) override { set("Height", value); }
    std::int16_t Selected() const override { return get<std::int16_t>("Selected"); }
    void Selected(std::int16_t value) override { set("Selected", value); }
    TalvikZandorLib::Collection<TalvikZandorLib::ZDColumn>& Columns() override {
        return mColumns.now();
    }

private:
    PythonCollection<TalvikZandorLib::ZDColumn> mColumns{*this, "Columns"};
};

class PythonJoin final : public TalvikZandorLib::ZDJoin, public Host {
    using Table = Ref<TalvikZandorLib::ZDTable>;
    using Column = Ref<TalvikZandorLib::ZDColumn>;

public:
    using Host::Host;
    Table LeftTable() const override { return get<Table>("LeftTable"); }
    void LeftTable(const Table& value) override { set("LeftTable", value); }
    Column LeftColumn() const override { return get<Column>("LeftColumn"); }
    void LeftColumn(const Column& value) override { set("LeftColumn", value); }
    Table RightTable() const override { return get<Table>("RightTable"); }
    void RightTable(const Table& value) override { set("RightTable", value); }
    Column RightColumn() const override { return get<Column>("RightColumn"); }
    void RightColumn(const Column& value) override { set("RightColumn", value); }
    std::int16_t JoinType() const override { return get<std::int16_t>("JoinType"); }
    void JoinType(std::int16_t value) override { set("JoinType", value); }
    std::int16_t CompareOperator() const override { return get<std::int16_t>("CompareOperator"); }
    void CompareOperator(std::int16_t value) override { set("CompareOperator", value); }
    platform::String Key() const override { return get<platform::String>("Key"); }
};

class PythonCriterium final : public TalvikZandorLib::ZDCriterium, public Host {
public:
    using Host::Host;
    platform::String Criterium() const override { return get<platform::String>("Criterium"); }
    void Criterium(const platform::String& value) override { set("Criterium", value); }
};

class PythonDefinition : public TalvikZandorLib::ZDColumnDefinition, public Host {
    using ZDColumn = Ref<TalvikZandorLib::ZDColumn>;

public:
    using Host::Host;
    ZDColumn Column() const override { return get<ZDColumn>("Column"); }
    void Column(const ZDColumn& value) override { set("Column", value); }
    platform::String Synonym() const override { return get<platform::String>("Synonym"); }
    void Synonym(const platform::String& value) override { set("Synonym", value); }
    std::int16_t SortOrder() const override { return get<std::int16_t>("SortOrder"); }
    void SortOrder(std::int16_t value) override { set("SortOrder", value); }
    bool Visible() const override { return get<bool>("Visible"); }
    void Visible(bool value) override { set("Visible", value); }
    platform::String Key() const override { return get<platform::String>("Key"); }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDCriterium>& Criteria() override {
        return mCriteria.now();
    }
    bool HasCriterium(const platform::String& key) const override {
        return call<bool>("HasCriterium", key);
    }
    void AddCriterium(const platform::String& text, const platform::String& key) override {
        call("AddCriterium", text, key);
    }

private:
    PythonCollection<TalvikZandorLib::ZDCriterium> mCriteria{*this, "Criteria"};
};

/// A definition that is also a SizedDefinition.
class PythonSizedDefinition final : public PythonDefinition,
                                    public TalvikZandorLib::SizedDefinition {
public:
    using PythonDefinition::PythonDefinition;
    std::int32_t Width() const override { return get<std::int32_t>("Width"); }
    void Width(std::int32_t value) override { set("Width", value); }
};

class PythonQuery : public TalvikZandorLib::Zandor, public Host {
    using ZDJoin = Ref<TalvikZandorLib::ZDJoin>;
    using ZDColumnDefinition = Ref<TalvikZandorLib::ZDColumnDefinition>;

public:
    using Host::Host;
    TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& Tables() override {
        return mTables.now();
    }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDJoin>& Joins() override {
        return mJoins.now();
    }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDColumnDefinition>&
    ColumnDefinitions() override {
        return mDefinitions.now();
    }
    ZDJoin AddJoin(const ZDJoin& join) override { return call<ZDJoin>("AddJoin", join); }
    ZDColumnDefinition AddColumnDefinition(const ZDColumnDefinition& definition) override {
        return call<ZDColumnDefinition>("AddColumnDefinition", definition);
    }
    void DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) override {
        call("DeleteTable", table);
    }

private:
    PythonCollection<TalvikZandorLib::ZDTable> mTables{*this, "Tables"};
    PythonCollection<TalvikZandorLib::ZDJoin> mJoins{*this, "Joins"};
    PythonCollection<TalvikZandorLib::ZDColumnDefinition> mDefinitions{*this, "ColumnDefinitions"};
};

/// A query that is also OrderedDefinitions.
class PythonOrderedQuery final : public PythonQuery, public TalvikZandorLib::OrderedDefinitions {
public:
    using PythonQuery::PythonQuery;
    void StandsBehind(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition,
                      const Ref<TalvikZandorLib::ZDColumnDefinition>& predecessor) override {
        call("StandsBehind", definition, predecessor);
    }
};

class PythonLibrary final : public TalvikZandorLib::Library, public Host {
public:
    using Host::Host;
    Ref<TalvikZandorLib::Zandor> NewZandor() override {
        return call<Ref<TalvikZandorLib::Zandor>>("NewZandor");
    }
    Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override {
        return call<Ref<TalvikZandorLib::ZDJoin>>("NewZDJoin");
    }
    Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override {
        return call<Ref<TalvikZandorLib::ZDColumnDefinition>>("NewZDColumnDefinition");
    }
};

} // namespace zandor::python
