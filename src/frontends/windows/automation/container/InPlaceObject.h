#pragma once

#include "frontends/windows/automation/com/Facet.h"
#include "frontends/windows/automation/container/Placement.h"

namespace zandor::automation {

/// The control while it stands in its container's window.
class InPlaceObject final : public FacetOf<IOleInPlaceObject, IOleInPlaceActiveObject> {
public:
    InPlaceObject(IUnknown& whole, Placement& placement) : FacetOf(whole), mPlacement(placement) {}

    void* find(REFIID iid) override;

    // Both of them
    STDMETHODIMP GetWindow(HWND* window) override;
    STDMETHODIMP ContextSensitiveHelp(BOOL) override { return E_NOTIMPL; }

    // In place
    STDMETHODIMP InPlaceDeactivate() override;
    STDMETHODIMP UIDeactivate() override;
    STDMETHODIMP SetObjectRects(LPCRECT place, LPCRECT clip) override;
    STDMETHODIMP ReactivateAndUndo() override { return INPLACE_E_NOTUNDOABLE; }

    // With the keyboard
    STDMETHODIMP TranslateAccelerator(LPMSG message) override;
    STDMETHODIMP OnFrameWindowActivate(BOOL) override { return S_OK; }
    STDMETHODIMP OnDocWindowActivate(BOOL) override { return S_OK; }
    STDMETHODIMP ResizeBorder(LPCRECT, IOleInPlaceUIWindow*, BOOL) override { return S_OK; }
    STDMETHODIMP EnableModeless(BOOL) override { return S_OK; }

private:
    Placement& mPlacement;
};

} // namespace zandor::automation
