#pragma once

#include "frontends/windows/automation/model/Own.h"

#include <Zandor/Query.h>

#include <model.h>

namespace zandor::automation {

/// A query of the ready-made model.
class QueryObject final : public Wrapper<_ZDQuery, TalvikZandorLib::Zandor> {
public:
    using Wrapper::Wrapper;

    STDMETHODIMP get_Tables(IDispatch** value) override;
    STDMETHODIMP get_Joins(IDispatch** value) override;
    STDMETHODIMP get_ColumnDefinitions(IDispatch** value) override;
    STDMETHODIMP AddJoin(IDispatch* Join, IDispatch** stored) override;
    STDMETHODIMP AddColumnDefinition(IDispatch* Definition, IDispatch** stored) override;
    STDMETHODIMP DeleteTable(IDispatch* Table) override;
    STDMETHODIMP AddTable(IDispatch* Description, IDispatch** table) override;
    STDMETHODIMP RenameTable(IDispatch* Table, BSTR Name) override;
    STDMETHODIMP SQL(ZDDialect Dialect, BSTR* text) override;
    STDMETHODIMP Findings(ZDDialect Dialect, VARIANT* texts) override;
    STDMETHODIMP get_Distinct(VARIANT_BOOL* value) override;
    STDMETHODIMP put_Distinct(VARIANT_BOOL value) override;
    STDMETHODIMP get_First(LONG* value) override;
    STDMETHODIMP put_First(LONG value) override;
    STDMETHODIMP get_Description(BSTR* value) override;
    STDMETHODIMP put_Description(BSTR value) override;

private:
    model::Query& query() const;
};

} // namespace zandor::automation
