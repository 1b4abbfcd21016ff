#pragma once

#include "frontends/windows/automation/model/Own.h"

#include <Zandor/model/Description.h>

#include <model.h>

namespace zandor::automation {

/// A table as a host describes it, before it stands in a query.
class TableDescriptionObject final : public Wrapper<_ZDTableDescription, model::TableDescription> {
public:
    using Wrapper::Wrapper;

    STDMETHODIMP get_Name(BSTR* value) override;
    STDMETHODIMP put_Name(BSTR value) override;
    STDMETHODIMP get_Schema(BSTR* value) override;
    STDMETHODIMP put_Schema(BSTR value) override;
    STDMETHODIMP AddColumn(BSTR Name, ZDColumnType Type, VARIANT_BOOL PrimaryKey,
                           VARIANT DeclaredType) override;
};

} // namespace zandor::automation
