#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/model/Criteria.h>

namespace zandor::automation {

/// An output column that belongs to no query yet and takes any column; see OpenJoin.
class OpenDefinition final : public TalvikZandorLib::ZDColumnDefinition {
    using String = platform::String;
    using ColumnRef = platform::Ref<TalvikZandorLib::ZDColumn>;

public:
    ColumnRef Column() const override { return mColumn; }
    void Column(const ColumnRef& value) override { mColumn = value; }
    String Synonym() const override { return mSynonym; }
    void Synonym(const String& value) override { mSynonym = value; }
    std::int16_t SortOrder() const override { return mSortOrder; }
    void SortOrder(std::int16_t value) override { mSortOrder = value; }
    bool Visible() const override { return mVisible; }
    void Visible(bool value) override { mVisible = value; }
    String Key() const override { return mKey; }
    void Key(const String& value) { mKey = value; }
    model::Criteria& Criteria() override { return mCriteria; }
    bool HasCriterium(const String& key) const override { return mCriteria.Contains(key); }
    void AddCriterium(const String& text, const String& key) override { mCriteria.Add(text, key); }

private:
    ColumnRef mColumn;
    String mSynonym;
    std::int16_t mSortOrder = 0;
    bool mVisible = true;
    String mKey;
    model::Criteria mCriteria;
};

} // namespace zandor::automation
