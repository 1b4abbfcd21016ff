#pragma once

#include "frontends/windows/automation/model/Own.h"

#include <Zandor/TalvikZandorLib.h>

#include <model.h>

namespace zandor::automation {

/// A table of the ready-made model.
class TableObject final : public Wrapper<_ZDTable, TalvikZandorLib::ZDTable> {
public:
    using Wrapper::Wrapper;

    STDMETHODIMP get_Name(BSTR* value) override;
    STDMETHODIMP get_Key(BSTR* value) override;
    STDMETHODIMP get_Left(LONG* value) override;
    STDMETHODIMP put_Left(LONG value) override;
    STDMETHODIMP get_Top(LONG* value) override;
    STDMETHODIMP put_Top(LONG value) override;
    STDMETHODIMP get_Width(LONG* value) override;
    STDMETHODIMP put_Width(LONG value) override;
    STDMETHODIMP get_Height(LONG* value) override;
    STDMETHODIMP put_Height(LONG value) override;
    STDMETHODIMP get_Selected(SHORT* value) override;
    STDMETHODIMP put_Selected(SHORT value) override;
    STDMETHODIMP get_Columns(IDispatch** value) override;
    STDMETHODIMP get_SourceName(BSTR* value) override;
    STDMETHODIMP get_Schema(BSTR* value) override;
};

} // namespace zandor::automation
