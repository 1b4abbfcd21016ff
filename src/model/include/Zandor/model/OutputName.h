#pragma once

#include <Zandor/model/Place.h>
#include <Zandor/model/References.h>
#include <Zandor/model/Total.h>
#include <Zandor/model/export.h>

namespace zandor::model {

/// What an output column with a total or an expression is, as a column of which the grid asks the
/// name: "sum(orders.total)". It is made when it is asked for and stays as it was then, so that a
/// definition that is given it becomes a copy.
class ZANDOR_MODEL_EXPORT OutputName final : public TalvikZandorLib::ZDColumn {
public:
    /// Of what a definition is.
    OutputName(ColumnPlace place, criteria::TiedText expression, Total total)
        : mPlace(std::move(place)), mExpression(std::move(expression)), mTotal(total) {}

    /// The expression as it was typed, or "table.column", or "*" for an entry of all columns; in
    /// the parentheses of its total.
    String Name() const override;
    /// That of the column; empty for an expression.
    String Key() const override { return mPlace.key(); }
    bool Marker() const override { return false; }
    bool Selected() const override { return false; }
    void Selected(bool) override {} ///< there is no entry to select
    void activated(std::int16_t) override {}

    /// As ColumnDefinition::place.
    const ColumnPlace& place() const { return mPlace; }
    /// As ColumnDefinition::expression.
    const criteria::TiedText& expression() const { return mExpression; }
    /// As ColumnDefinition::total.
    Total total() const { return mTotal; }

private:
    const ColumnPlace mPlace;
    const criteria::TiedText mExpression;
    const Total mTotal;
};

} // namespace zandor::model
