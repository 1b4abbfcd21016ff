#pragma once

#include "frontends/windows/automation/model/Own.h"

#include <Zandor/TalvikZandorLib.h>

#include <model.h>

namespace zandor::automation {

/// An output column of the ready-made model, or one that is being made.
class DefinitionObject final
    : public Wrapper<_ZDColumnDefinition, TalvikZandorLib::ZDColumnDefinition> {
public:
    using Wrapper::Wrapper;

    STDMETHODIMP get_Key(BSTR* value) override;
    STDMETHODIMP put_Key(BSTR value) override;
    STDMETHODIMP get_Column(IDispatch** value) override;
    STDMETHODIMP putref_Column(IDispatch* value) override;
    STDMETHODIMP get_Synonym(BSTR* value) override;
    STDMETHODIMP put_Synonym(BSTR value) override;
    STDMETHODIMP get_SortOrder(SHORT* value) override;
    STDMETHODIMP put_SortOrder(SHORT value) override;
    STDMETHODIMP get_Visible(VARIANT_BOOL* value) override;
    STDMETHODIMP put_Visible(VARIANT_BOOL value) override;
    STDMETHODIMP get_Criteria(IDispatch** value) override;
    STDMETHODIMP HasCriterium(BSTR Key, VARIANT_BOOL* value) override;
    STDMETHODIMP AddCriterium(BSTR Text, BSTR Key) override;
    STDMETHODIMP get_Expression(BSTR* value) override;
    STDMETHODIMP put_Expression(BSTR value) override;
    STDMETHODIMP get_Total(SHORT* value) override;
    STDMETHODIMP put_Total(SHORT value) override;
    STDMETHODIMP get_SortPriority(SHORT* value) override;
    STDMETHODIMP put_SortPriority(SHORT value) override;
};

} // namespace zandor::automation
