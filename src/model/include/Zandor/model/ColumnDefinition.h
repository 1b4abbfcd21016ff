#pragma once

#include <Zandor/model/Criteria.h>
#include <Zandor/model/Format.h>
#include <Zandor/model/Place.h>
#include <Zandor/model/Total.h>
#include <Zandor/model/export.h>

namespace zandor::model {

class Query;

/// One output column: a column of a table, or an expression. It names its column by key, which
/// reads as nothing once the table was deleted or the query is gone.
class ZANDOR_MODEL_EXPORT ColumnDefinition final : public TalvikZandorLib::ZDColumnDefinition,
                                                   public TalvikZandorLib::SizedDefinition {
public:
    /// The column under its name in the grid, "table.column" (see FieldColumn); place() leads to
    /// the column itself. With a total "sum(table.column)", and an expression as it was typed: see
    /// OutputName.
    Ref<TalvikZandorLib::ZDColumn> Column() const override;
    /// Any column, by itself or by its name in the grid, as long as the definition is new. Once it
    /// has its key it stays with its query: a column of another query is error 5, and nothing is
    /// error 91. It takes the place of an expression; a total stays.
    void Column(const Ref<TalvikZandorLib::ZDColumn>& value) override;
    String Synonym() const override { return mSynonym; }
    void Synonym(const String& value) override { mSynonym = value; }
    std::int16_t SortOrder() const override { return mSortOrder; }
    /// Error 380 outside 0 to 2.
    void SortOrder(std::int16_t value) override;
    bool Visible() const override { return mVisible; }
    void Visible(bool value) override { mVisible = value; }
    /// Whether it comes out with the rows, and does not only choose or sort them.
    bool comesOut() const { return Visible() && total() != Total::Condition; }
    std::int32_t Width() const override { return mWidth; }
    /// Error 380 outside 0 to greatestWidth.
    void Width(std::int32_t value) override;
    /// Empty until the definition was added to a query; then "x" and a number, kept for good.
    String Key() const override { return mKey; }
    class Criteria& Criteria() override {
        return mCriteria;
    }
    bool HasCriterium(const String& key) const override { return mCriteria.Contains(key); }
    void AddCriterium(const String& text, const String& key) override { mCriteria.Add(text, key); }

    /// What becomes of its values when rows are put together.
    Total total() const { return mTotal; }
    /// Error 380 for none of the constants.
    void total(Total value);
    /// Among the columns that sort, those with a priority come before those without, the lesser
    /// first; those of one priority, and those without (0), go by their order in the query.
    std::int16_t sortPriority() const { return mSortPriority; }
    /// Error 380 outside 0 to greatestSortPriority.
    void sortPriority(std::int16_t value);
    /// How its values are shown to people.
    Format format() const { return mFormat; }
    /// Error 380 for none of the constants.
    void format(Format value);
    /// Behind the point, for a format of numbers: rounded or filled up with zeros to so many; with
    /// asManyAsThereAre as the values have them.
    std::int16_t decimals() const { return mDecimals; }
    /// Error 380 outside asManyAsThereAre to mostDecimals.
    void decimals(std::int16_t value);
    /// What comes out instead of a column, with what its names are tied to; empty for a column.
    const criteria::TiedText& expression() const { return *mExpression; }
    /// The names in a new text mean what they name when the query is next read or changed. A text
    /// takes the place of the column. An empty one leaves nothing to come out until a column is
    /// set.
    void expression(const String& text);
    /// The same text with the places of its names.
    void tie(criteria::TiedText expression) { mExpression = std::move(expression); }
    /// Whether it is an expression.
    bool isExpression() const { return !mExpression->text.empty(); }

    /// Its criteria by row.
    const class Criteria& criteria() const { return mCriteria; }
    /// What comes out, by key.
    const ColumnPlace& place() const { return mPlace; }
    /// Raised by its criteria too.
    Revision& revision() { return *mRevision; }

    /// Of sortPriority.
    static constexpr std::int16_t greatestSortPriority = 255;
    /// Of decimals.
    static constexpr std::int16_t mostDecimals = 15;

private:
    friend class Query; ///< gives the key

    // Shared with the criteria, which may be held longer.
    const std::shared_ptr<Revision> mRevision = std::make_shared<Revision>();
    Revised<ColumnPlace> mPlace{*mRevision};
    Revised<String> mSynonym{*mRevision};
    Revised<std::int16_t> mSortOrder{*mRevision};
    Revised<bool> mVisible{*mRevision, true};
    Revised<std::int32_t> mWidth{*mRevision};
    Revised<Total> mTotal{*mRevision};
    Revised<std::int16_t> mSortPriority{*mRevision};
    Revised<Format> mFormat{*mRevision};
    Revised<std::int16_t> mDecimals{*mRevision, asManyAsThereAre};
    Revised<criteria::TiedText> mExpression{*mRevision};
    String mKey;
    model::Criteria mCriteria{mRevision};
};

} // namespace zandor::model
