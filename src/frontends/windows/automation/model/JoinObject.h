#pragma once

#include "frontends/windows/automation/model/Own.h"

#include <Zandor/TalvikZandorLib.h>

#include <model.h>

namespace zandor::automation {

/// A join of the ready-made model, or one that is being made.
class JoinObject final : public Wrapper<_ZDJoin, TalvikZandorLib::ZDJoin> {
public:
    using Wrapper::Wrapper;

    STDMETHODIMP get_Key(BSTR* value) override;
    STDMETHODIMP put_Key(BSTR value) override;
    STDMETHODIMP get_LeftTable(IDispatch** value) override;
    STDMETHODIMP putref_LeftTable(IDispatch* value) override;
    STDMETHODIMP get_LeftColumn(IDispatch** value) override;
    STDMETHODIMP putref_LeftColumn(IDispatch* value) override;
    STDMETHODIMP get_RightTable(IDispatch** value) override;
    STDMETHODIMP putref_RightTable(IDispatch* value) override;
    STDMETHODIMP get_RightColumn(IDispatch** value) override;
    STDMETHODIMP putref_RightColumn(IDispatch* value) override;
    STDMETHODIMP get_JoinType(SHORT* value) override;
    STDMETHODIMP put_JoinType(SHORT value) override;
    STDMETHODIMP get_CompareOperator(SHORT* value) override;
    STDMETHODIMP put_CompareOperator(SHORT value) override;
};

} // namespace zandor::automation
