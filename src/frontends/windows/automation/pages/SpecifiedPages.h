#pragma once

#include "frontends/windows/automation/com/Facet.h"
#include "frontends/windows/automation/com/ids.h"

namespace zandor::automation {

/// The pages that a form shows of the control's properties: there is one.
class SpecifiedPages final : public FacetOf<ISpecifyPropertyPages> {
public:
    using FacetOf::FacetOf;

    STDMETHODIMP GetPages(CAUUID* pages) override {
        if (!pages) return E_POINTER;
        *pages = {0, static_cast<GUID*>(CoTaskMemAlloc(sizeof(GUID)))};
        if (!pages->pElems) return E_OUTOFMEMORY;
        *pages->pElems = ids::propertyPage;
        pages->cElems = 1;
        return S_OK;
    }
};

} // namespace zandor::automation
