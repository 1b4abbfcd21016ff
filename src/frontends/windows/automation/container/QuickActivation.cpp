#include "frontends/windows/automation/container/QuickActivation.h"

#include "frontends/windows/automation/container/status.h"

namespace zandor::automation {

STDMETHODIMP QuickActivation::QuickActivate(QACONTAINER* container, QACONTROL* control) {
    if (!container || !control) return E_POINTER;
    if (container->cbSize < sizeof *container || control->cbSize < sizeof *control)
        return E_INVALIDARG;
    const Held<IUnknown> meanwhile(&whole());
    const ULONG size = control->cbSize;
    *control = {};
    control->cbSize = size;
    control->dwMiscStatus = miscStatus;
    control->dwViewStatus = VIEWSTATUS_OPAQUE;
    // What the site does not say, this call does.
    Ambience& ambience = mPlacement.ambience();
    ambience.setColours(container->colorBack, container->colorFore);
    ambience.setFont(container->pFont);
    ambience.setDesigning(!(container->dwAmbientFlags & QACONTAINER_USERMODE));
    ambience.setDead(container->dwAmbientFlags & QACONTAINER_UIDEAD);
    mPlacement.setSite(container->pClientSite);
    if (container->pAdviseSink) mView.SetAdvise(DVASPECT_CONTENT, 0, container->pAdviseSink);
    if (!container->pUnkEventSink) return S_OK;
    return mEvents.Advise(container->pUnkEventSink, &control->dwEventCookie);
}

STDMETHODIMP QuickActivation::SetContentExtent(LPSIZEL extent) {
    if (!extent) return E_POINTER;
    if (extent->cx < 0 || extent->cy < 0) return E_INVALIDARG;
    const Held<IUnknown> meanwhile(&whole());
    mPlacement.setExtent(*extent);
    return S_OK;
}

STDMETHODIMP QuickActivation::GetContentExtent(LPSIZEL extent) {
    if (!extent) return E_POINTER;
    *extent = mPlacement.extent();
    return S_OK;
}

} // namespace zandor::automation
