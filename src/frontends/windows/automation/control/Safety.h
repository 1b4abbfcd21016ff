#pragma once

#include "frontends/windows/automation/com/Facet.h"

namespace zandor::automation {

/// Whether scripts of unknown hands may have the control: it neither reads nor writes anything but
/// the model that it is handed, so it is safe as it is.
class Safety final : public FacetOf<IObjectSafety> {
public:
    using FacetOf::FacetOf;

    STDMETHODIMP GetInterfaceSafetyOptions(REFIID iid, DWORD* supported, DWORD* enabled) override;
    STDMETHODIMP SetInterfaceSafetyOptions(REFIID iid, DWORD mask, DWORD enabled) override;

private:
    bool has(REFIID iid) const;

    DWORD mEnabled = 0; ///< as somebody has asked for it
};

} // namespace zandor::automation
