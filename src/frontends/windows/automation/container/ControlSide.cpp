#include "frontends/windows/automation/container/ControlSide.h"

namespace zandor::automation {

STDMETHODIMP ControlSide::GetControlInfo(CONTROLINFO* info) {
    if (!info) return E_POINTER;
    // Enter and Escape are the control's own, so that a form's buttons must not take them.
    *info = {sizeof *info, nullptr, 0, CTRLINFO_EATS_RETURN | CTRLINFO_EATS_ESCAPE};
    return S_OK;
}

// There is no letter that it could be reached by.
STDMETHODIMP ControlSide::OnMnemonic(MSG* message) { return message ? S_OK : E_POINTER; }

STDMETHODIMP ControlSide::OnAmbientPropertyChange(DISPID which) {
    const Held<IUnknown> meanwhile(&whole());
    const Held<IOleClientSite> site = mPlacement.site();
    mPlacement.ambience().read(site.get(), which);
    return S_OK;
}

STDMETHODIMP ControlSide::FreezeEvents(BOOL freeze) {
    const Held<IUnknown> meanwhile(&whole());
    if (freeze)
        mEvents.freeze();
    else
        mEvents.thaw();
    return S_OK;
}

} // namespace zandor::automation
