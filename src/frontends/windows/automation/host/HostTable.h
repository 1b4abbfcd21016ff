#pragma once

#include "frontends/windows/automation/host/HostCollection.h"

namespace zandor::automation {

/// A column that is a host's own object.
class HostColumn final : public HostObject, public TalvikZandorLib::ZDColumn {
    using String = platform::String;

public:
    explicit HostColumn(IDispatch* object)
        : HostObject(object), mTyped(Held<_ZDColumn>::of(object)) {}

    String Name() const override { return stringOf(get(L"Name", mTyped, &_ZDColumn::get_Name)); }
    String Key() const override { return stringOf(get(L"Key", mTyped, &_ZDColumn::get_Key)); }
    /// False where the host's columns know nothing of it.
    bool Marker() const override {
        return has(L"Marker") && flagOf(get(L"Marker", mTyped, &_ZDColumn::get_Marker));
    }
    bool Selected() const override {
        return flagOf(get(L"Selected", mTyped, &_ZDColumn::get_Selected));
    }
    void Selected(bool value) override {
        put(L"Selected", Value(value), mTyped, &_ZDColumn::put_Selected);
    }
    /// By name always.
    void activated(std::int16_t value) override { put(L"activated", Value(value)); }

private:
    const Held<_ZDColumn> mTyped;
};

/// A table that is a host's own object. Where the user puts it is written by name always, in
/// single precision.
class HostTable final : public HostObject, public TalvikZandorLib::ZDTable {
    using String = platform::String;

public:
    explicit HostTable(IDispatch* object)
        : HostObject(object), mTyped(Held<_ZDTable>::of(object)) {}

    String Name() const override { return stringOf(get(L"Name", mTyped, &_ZDTable::get_Name)); }
    String Key() const override { return stringOf(get(L"Key", mTyped, &_ZDTable::get_Key)); }
    std::int32_t Left() const override { return longOf(get(L"Left", mTyped, &_ZDTable::get_Left)); }
    std::int32_t Top() const override { return longOf(get(L"Top", mTyped, &_ZDTable::get_Top)); }
    std::int32_t Width() const override {
        return longOf(get(L"Width", mTyped, &_ZDTable::get_Width));
    }
    std::int32_t Height() const override {
        return longOf(get(L"Height", mTyped, &_ZDTable::get_Height));
    }
    void Left(float value) override { put(L"Left", Value(value)); }
    void Top(float value) override { put(L"Top", Value(value)); }
    void Width(float value) override { put(L"Width", Value(value)); }
    void Height(float value) override { put(L"Height", Value(value)); }
    std::int16_t Selected() const override {
        return integerOf(get(L"Selected", mTyped, &_ZDTable::get_Selected));
    }
    void Selected(std::int16_t value) override {
        put(L"Selected", Value(value), mTyped, &_ZDTable::put_Selected);
    }
    TalvikZandorLib::Collection<TalvikZandorLib::ZDColumn>& Columns() override {
        mColumns.give(objectOf(get(L"Columns", mTyped, &_ZDTable::get_Columns)));
        return mColumns;
    }

private:
    const Held<_ZDTable> mTyped;
    HostList<TalvikZandorLib::ZDColumn> mColumns;
};

} // namespace zandor::automation
