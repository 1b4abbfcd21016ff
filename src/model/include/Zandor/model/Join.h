#pragma once

#include <Zandor/model/Place.h>
#include <Zandor/model/export.h>

namespace zandor::model {

class Query;

/// A join between a column of one table and a column of another. It names its ends by key; they
/// read as nothing once the table was deleted or the query is gone.
///
/// A new join takes any ends, and Query::AddJoin judges them. Once it has its key it stays with its
/// query: an end of another query is error 5, and nothing as an end error 91.
class ZANDOR_MODEL_EXPORT Join final : public TalvikZandorLib::ZDJoin {
public:
    Ref<TalvikZandorLib::ZDTable> LeftTable() const override;
    /// Setting another table than before empties the column of that end.
    void LeftTable(const Ref<TalvikZandorLib::ZDTable>& value) override;
    Ref<TalvikZandorLib::ZDColumn> LeftColumn() const override;
    /// The end's table becomes the column's when none was set; error 5 when another was.
    void LeftColumn(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    Ref<TalvikZandorLib::ZDTable> RightTable() const override;
    void RightTable(const Ref<TalvikZandorLib::ZDTable>& value) override;
    Ref<TalvikZandorLib::ZDColumn> RightColumn() const override;
    void RightColumn(const Ref<TalvikZandorLib::ZDColumn>& value) override;

    std::int16_t JoinType() const override { return mJoinType; }
    /// Error 380 outside 0 to 3.
    void JoinType(std::int16_t value) override;
    std::int16_t CompareOperator() const override { return mCompareOperator; }
    /// Error 380 outside 0 to 5.
    void CompareOperator(std::int16_t value) override;
    /// Empty until the join was added to a query; then kept for good.
    String Key() const override { return mKey; }

    /// The ends by key. Their columns are empty as long as none is set.
    const ColumnPlace& left() const { return mLeft; }
    /// As left.
    const ColumnPlace& right() const { return mRight; }
    /// Raised by every change.
    Revision& revision() { return mRevision; }

private:
    friend class Query; ///< gives the key

    void setTable(Revised<ColumnPlace>& end, const Ref<TalvikZandorLib::ZDTable>& value);
    void setColumn(Revised<ColumnPlace>& end, const Ref<TalvikZandorLib::ZDColumn>& value);
    void requireHome(const TablePlace& end, const TablePlace& value) const;

    Revision mRevision;
    Revised<ColumnPlace> mLeft{mRevision};
    Revised<ColumnPlace> mRight{mRevision};
    Revised<std::int16_t> mJoinType{mRevision};
    Revised<std::int16_t> mCompareOperator{mRevision};
    String mKey;
};

} // namespace zandor::model
