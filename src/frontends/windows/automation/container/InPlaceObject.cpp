#include "frontends/windows/automation/container/InPlaceObject.h"

namespace zandor::automation {

namespace {

/// A key that goes down, or a letter with Alt.
bool isPressed(const MSG& message) {
    return message.message == WM_KEYDOWN || message.message == WM_SYSKEYDOWN ||
           message.message == WM_SYSCHAR;
}

} // namespace

void* InPlaceObject::find(REFIID iid) {
    if (iid == IID_IOleWindow) return static_cast<IOleInPlaceObject*>(this);
    return FacetOf::find(iid);
}

STDMETHODIMP InPlaceObject::GetWindow(HWND* window) {
    if (!window) return E_POINTER;
    *window = mPlacement.isActive() ? mPlacement.window() : nullptr;
    return *window ? S_OK : E_FAIL;
}

STDMETHODIMP InPlaceObject::InPlaceDeactivate() {
    const Held<IUnknown> meanwhile(&whole());
    mPlacement.deactivate();
    return S_OK;
}

STDMETHODIMP InPlaceObject::UIDeactivate() {
    const Held<IUnknown> meanwhile(&whole());
    mPlacement.deactivateUi();
    return S_OK;
}

STDMETHODIMP InPlaceObject::SetObjectRects(LPCRECT place, LPCRECT clip) {
    if (!place || !clip) return E_POINTER;
    if (!mPlacement.isActive()) return E_UNEXPECTED;
    const Held<IUnknown> meanwhile(&whole());
    mPlacement.setRects(*place, *clip);
    return S_OK;
}

STDMETHODIMP InPlaceObject::TranslateAccelerator(LPMSG message) {
    if (!message) return E_POINTER;
    const Held<IUnknown> meanwhile(&whole());
    if (!mPlacement.isActive()) return S_FALSE;
    if (mPlacement.hasUseFor(*message)) {
        TranslateMessage(message);
        DispatchMessageW(message);
        return S_OK;
    }
    if (!isPressed(*message)) return S_FALSE;
    return mPlacement.offerToContainer(*message) ? S_OK : S_FALSE;
}

} // namespace zandor::automation
