#pragma once

#include "frontends/windows/automation/model/Own.h"

#include <Zandor/TalvikZandorLib.h>

#include <model.h>

namespace zandor::automation {

/// A criterion of the ready-made model.
class CriteriumObject final : public Wrapper<_ZDCriterium, TalvikZandorLib::ZDCriterium> {
public:
    using Wrapper::Wrapper;

    STDMETHODIMP get_Criterium(BSTR* value) override;
    STDMETHODIMP put_Criterium(BSTR value) override;
};

} // namespace zandor::automation
