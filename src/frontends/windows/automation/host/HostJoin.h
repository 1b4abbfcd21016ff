#pragma once

#include "frontends/windows/automation/host/HostObject.h"
#include "frontends/windows/automation/model/Exchange.h"

#include <model.h>

namespace zandor::automation {

/// A join that is a host's own object.
class HostJoin final : public HostObject, public TalvikZandorLib::ZDJoin {
    using TableRef = platform::Ref<TalvikZandorLib::ZDTable>;
    using ColumnRef = platform::Ref<TalvikZandorLib::ZDColumn>;

public:
    explicit HostJoin(IDispatch* object) : HostObject(object), mTyped(Held<_ZDJoin>::of(object)) {}

    TableRef LeftTable() const override {
        return table(get(L"LeftTable", mTyped, &_ZDJoin::get_LeftTable));
    }
    void LeftTable(const TableRef& value) override {
        put(L"LeftTable", Value(toHost(value)), mTyped, &_ZDJoin::putref_LeftTable);
    }
    ColumnRef LeftColumn() const override {
        return column(get(L"LeftColumn", mTyped, &_ZDJoin::get_LeftColumn));
    }
    void LeftColumn(const ColumnRef& value) override {
        put(L"LeftColumn", Value(toHost(value)), mTyped, &_ZDJoin::putref_LeftColumn);
    }
    TableRef RightTable() const override {
        return table(get(L"RightTable", mTyped, &_ZDJoin::get_RightTable));
    }
    void RightTable(const TableRef& value) override {
        put(L"RightTable", Value(toHost(value)), mTyped, &_ZDJoin::putref_RightTable);
    }
    ColumnRef RightColumn() const override {
        return column(get(L"RightColumn", mTyped, &_ZDJoin::get_RightColumn));
    }
    void RightColumn(const ColumnRef& value) override {
        put(L"RightColumn", Value(toHost(value)), mTyped, &_ZDJoin::putref_RightColumn);
    }
    std::int16_t JoinType() const override {
        return integerOf(get(L"JoinType", mTyped, &_ZDJoin::get_JoinType));
    }
    void JoinType(std::int16_t value) override {
        put(L"JoinType", Value(value), mTyped, &_ZDJoin::put_JoinType);
    }
    std::int16_t CompareOperator() const override {
        return integerOf(get(L"CompareOperator", mTyped, &_ZDJoin::get_CompareOperator));
    }
    void CompareOperator(std::int16_t value) override {
        put(L"CompareOperator", Value(value), mTyped, &_ZDJoin::put_CompareOperator);
    }
    platform::String Key() const override {
        return stringOf(get(L"Key", mTyped, &_ZDJoin::get_Key));
    }

private:
    static TableRef table(const Value& value) {
        return fromHost<TalvikZandorLib::ZDTable>(objectOf(value).get());
    }
    static ColumnRef column(const Value& value) {
        return fromHost<TalvikZandorLib::ZDColumn>(objectOf(value).get());
    }

    const Held<_ZDJoin> mTyped;
};

} // namespace zandor::automation
