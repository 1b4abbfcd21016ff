#pragma once

#include "frontends/windows/automation/host/HostCollection.h"

namespace zandor::automation {

/// A query that is a host's own object. What it answers to AddJoin and AddColumnDefinition is what
/// it has stored; where it answers nothing, that is what it was given.
class HostQuery final : public HostObject, public TalvikZandorLib::Zandor {
    template <class T>
    using Ref = platform::Ref<T>;
    using ZDTable = TalvikZandorLib::ZDTable;
    using ZDJoin = TalvikZandorLib::ZDJoin;
    using ZDColumnDefinition = TalvikZandorLib::ZDColumnDefinition;

public:
    explicit HostQuery(IDispatch* object)
        : HostObject(object), mTyped(Held<_ZDQuery>::of(object)) {}

    TalvikZandorLib::Collection<ZDTable>& Tables() override {
        mTables.give(objectOf(get(L"Tables", mTyped, &_ZDQuery::get_Tables)));
        return mTables;
    }
    TalvikZandorLib::EditableCollection<ZDJoin>& Joins() override {
        mJoins.give(objectOf(get(L"Joins", mTyped, &_ZDQuery::get_Joins)));
        return mJoins;
    }
    TalvikZandorLib::EditableCollection<ZDColumnDefinition>& ColumnDefinitions() override {
        mDefinitions.give(
            objectOf(get(L"ColumnDefinitions", mTyped, &_ZDQuery::get_ColumnDefinitions)));
        return mDefinitions;
    }
    Ref<ZDJoin> AddJoin(const Ref<ZDJoin>& join) override {
        return add(L"AddJoin", join, &_ZDQuery::AddJoin);
    }
    Ref<ZDColumnDefinition>
    AddColumnDefinition(const Ref<ZDColumnDefinition>& definition) override {
        return add(L"AddColumnDefinition", definition, &_ZDQuery::AddColumnDefinition);
    }
    void DeleteTable(const Ref<ZDTable>& table) override {
        const Held<IDispatch> given = toHost(table);
        if (mTyped)
            require(mTyped->DeleteTable(given.get()), mTyped.get(), __uuidof(_ZDQuery));
        else
            call(L"DeleteTable", given);
    }

private:
    template <class T>
    Ref<T> add(const wchar_t* member, const Ref<T>& item,
               HRESULT (STDMETHODCALLTYPE _ZDQuery::*adder)(IDispatch*, IDispatch**)) {
        const Held<IDispatch> given = toHost(item);
        Held<IDispatch> stored;
        if (mTyped) {
            require((mTyped.get()->*adder)(given.get(), stored.slot()), mTyped.get(),
                    __uuidof(_ZDQuery));
        } else {
            const Value answered = call(member, given);
            if (answered.vt == VT_DISPATCH) stored = answered.pdispVal;
        }
        return stored ? fromHost<T>(stored.get()) : item;
    }

    const Held<_ZDQuery> mTyped;
    HostList<ZDTable> mTables;
    HostList<ZDJoin> mJoins;
    HostList<ZDColumnDefinition> mDefinitions;
};

} // namespace zandor::automation
