#pragma once

#include "frontends/windows/automation/model/Own.h"

#include <Zandor/TalvikZandorLib.h>

#include <model.h>

namespace zandor::automation {

/// A column of the ready-made model.
class ColumnObject final : public Wrapper<_ZDColumn, TalvikZandorLib::ZDColumn> {
public:
    using Wrapper::Wrapper;

    STDMETHODIMP get_Name(BSTR* value) override;
    STDMETHODIMP get_Key(BSTR* value) override;
    STDMETHODIMP get_Marker(VARIANT_BOOL* value) override;
    STDMETHODIMP get_Selected(VARIANT_BOOL* value) override;
    STDMETHODIMP put_Selected(VARIANT_BOOL value) override;
    STDMETHODIMP get_activated(SHORT* value) override;
    STDMETHODIMP put_activated(SHORT value) override;
    STDMETHODIMP get_Type(ZDColumnType* value) override;
    STDMETHODIMP get_DeclaredType(BSTR* value) override;
};

} // namespace zandor::automation
