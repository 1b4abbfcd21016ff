#pragma once

#include "frontends/windows/automation/host/HostCollection.h"

namespace zandor::automation {

/// A criterion that is a host's own object. Its text goes by name always.
class HostCriterium final : public HostObject, public TalvikZandorLib::ZDCriterium {
public:
    using HostObject::HostObject;

    platform::String Criterium() const override { return stringOf(get(L"Criterium")); }
    void Criterium(const platform::String& value) override { put(L"Criterium", Value(value)); }
};

/// An output column that is a host's own object.
class HostDefinition final : public HostObject, public TalvikZandorLib::ZDColumnDefinition {
    using String = platform::String;
    using Typed = _ZDColumnDefinition;

public:
    explicit HostDefinition(IDispatch* object)
        : HostObject(object), mTyped(Held<Typed>::of(object)) {}

    platform::Ref<TalvikZandorLib::ZDColumn> Column() const override {
        return fromHost<TalvikZandorLib::ZDColumn>(
            objectOf(get(L"Column", mTyped, &Typed::get_Column)).get());
    }
    void Column(const platform::Ref<TalvikZandorLib::ZDColumn>& value) override {
        put(L"Column", Value(toHost(value)), mTyped, &Typed::putref_Column);
    }
    String Synonym() const override {
        return stringOf(get(L"Synonym", mTyped, &Typed::get_Synonym));
    }
    void Synonym(const String& value) override {
        put(L"Synonym", Value(value), mTyped, &Typed::put_Synonym);
    }
    std::int16_t SortOrder() const override {
        return integerOf(get(L"SortOrder", mTyped, &Typed::get_SortOrder));
    }
    void SortOrder(std::int16_t value) override {
        put(L"SortOrder", Value(value), mTyped, &Typed::put_SortOrder);
    }
    bool Visible() const override { return flagOf(get(L"Visible", mTyped, &Typed::get_Visible)); }
    void Visible(bool value) override {
        put(L"Visible", Value(value), mTyped, &Typed::put_Visible);
    }
    String Key() const override { return stringOf(get(L"Key", mTyped, &Typed::get_Key)); }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDCriterium>& Criteria() override {
        mCriteria.give(objectOf(get(L"Criteria", mTyped, &Typed::get_Criteria)));
        return mCriteria;
    }
    bool HasCriterium(const String& key) const override {
        if (!mTyped) return flagOf(call(L"HasCriterium", key));
        VARIANT_BOOL found = VARIANT_FALSE;
        require(mTyped->HasCriterium(Text(key).get(), &found), mTyped.get(), __uuidof(Typed));
        return found != VARIANT_FALSE;
    }
    void AddCriterium(const String& text, const String& key) override {
        if (mTyped)
            require(mTyped->AddCriterium(Text(text).get(), Text(key).get()), mTyped.get(),
                    __uuidof(Typed));
        else
            call(L"AddCriterium", text, key);
    }

private:
    const Held<Typed> mTyped;
    HostList<TalvikZandorLib::ZDCriterium> mCriteria;
};

} // namespace zandor::automation
