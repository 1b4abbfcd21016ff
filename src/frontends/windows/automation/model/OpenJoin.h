#pragma once

#include <Zandor/TalvikZandorLib.h>

namespace zandor::automation {

/// A join that belongs to no query yet and takes any ends: what the control fills in for a host
/// whose model is of its own objects. The host that stores it as it is gives it its key.
class OpenJoin final : public TalvikZandorLib::ZDJoin {
    using TableRef = platform::Ref<TalvikZandorLib::ZDTable>;
    using ColumnRef = platform::Ref<TalvikZandorLib::ZDColumn>;

public:
    TableRef LeftTable() const override { return mLeftTable; }
    void LeftTable(const TableRef& value) override { mLeftTable = value; }
    ColumnRef LeftColumn() const override { return mLeftColumn; }
    void LeftColumn(const ColumnRef& value) override { mLeftColumn = value; }
    TableRef RightTable() const override { return mRightTable; }
    void RightTable(const TableRef& value) override { mRightTable = value; }
    ColumnRef RightColumn() const override { return mRightColumn; }
    void RightColumn(const ColumnRef& value) override { mRightColumn = value; }
    std::int16_t JoinType() const override { return mJoinType; }
    void JoinType(std::int16_t value) override { mJoinType = value; }
    std::int16_t CompareOperator() const override { return mCompareOperator; }
    void CompareOperator(std::int16_t value) override { mCompareOperator = value; }
    platform::String Key() const override { return mKey; }
    void Key(const platform::String& value) { mKey = value; }

private:
    TableRef mLeftTable, mRightTable;
    ColumnRef mLeftColumn, mRightColumn;
    std::int16_t mJoinType = 0;
    std::int16_t mCompareOperator = 0;
    platform::String mKey;
};

} // namespace zandor::automation
