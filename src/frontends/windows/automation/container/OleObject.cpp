#include "frontends/windows/automation/container/OleObject.h"

#include "frontends/windows/automation/com/ids.h"
#include "frontends/windows/automation/container/status.h"

#include <cstring>

namespace zandor::automation {

STDMETHODIMP OleObject::SetClientSite(IOleClientSite* site) {
    const Held<IUnknown> meanwhile(&whole());
    mPlacement.setSite(site);
    return S_OK;
}

STDMETHODIMP OleObject::GetClientSite(IOleClientSite** site) {
    if (!site) return E_POINTER;
    *site = mPlacement.site().copy();
    return S_OK;
}

// It opens no window of its own that would bear them.
STDMETHODIMP OleObject::SetHostNames(LPCOLESTR application, LPCOLESTR) {
    return application ? S_OK : E_POINTER;
}

STDMETHODIMP OleObject::Close(DWORD save) {
    if (save > OLECLOSE_PROMPTSAVE) return E_INVALIDARG;
    const Held<IUnknown> meanwhile(&whole());
    // Whether to ask is for a form to say: a control in it has no question of its own.
    if (save != OLECLOSE_NOSAVE && isChanged())
        if (const Held<IOleClientSite> site = mPlacement.site()) {
            const HRESULT saved = site->SaveObject();
            if (FAILED(saved)) return saved;
        }
    mPlacement.deactivate();
    if (const Held<IOleAdviseHolder> advised = mAdvised) advised->SendOnClose();
    return S_OK;
}

bool OleObject::isChanged() const {
    const auto kept = Held<IPersistStreamInit>::of(&whole());
    return kept && kept->IsDirty() == S_OK;
}

STDMETHODIMP OleObject::GetMoniker(DWORD, DWORD, IMoniker** moniker) {
    if (!moniker) return E_POINTER;
    *moniker = nullptr;
    return E_NOTIMPL;
}

STDMETHODIMP OleObject::GetClipboardData(DWORD, IDataObject** data) {
    if (!data) return E_POINTER;
    *data = nullptr;
    return E_NOTIMPL;
}

STDMETHODIMP OleObject::DoVerb(LONG verb, MSG*, IOleClientSite*, LONG index, HWND, LPCRECT) {
    const Held<IUnknown> meanwhile(&whole());
    if (index != 0 && index != -1) return DV_E_LINDEX;
    switch (verb) {
    case OLEIVERB_PRIMARY:
    case OLEIVERB_UIACTIVATE: return show(true);
    case OLEIVERB_SHOW:
    case OLEIVERB_INPLACEACTIVATE: return show(false);
    case OLEIVERB_HIDE: mPlacement.hide(); return S_OK;
    case OLEIVERB_PROPERTIES: return showProperties();
    default: break;
    }
    // It opens in no window of its own, and has nothing that could be undone.
    if (verb < 0) return E_NOTIMPL;
    const HRESULT shown = show(true);
    return FAILED(shown) ? shown : OLEOBJ_S_INVALIDVERB;
}

HRESULT OleObject::show(bool ui) {
    const HRESULT active = mPlacement.activate(ui);
    if (FAILED(active)) return active;
    if (const Held<IOleClientSite> site = mPlacement.site()) site->ShowObject();
    return S_OK;
}

HRESULT OleObject::showProperties() {
    if (const Held<IOleControlSite> site = mPlacement.controlSite();
        site && site->ShowPropertyFrame() == S_OK)
        return S_OK;
    const auto paged = Held<ISpecifyPropertyPages>::of(&whole());
    if (!paged) return E_NOTIMPL;
    CAUUID pages{};
    const HRESULT listed = paged->GetPages(&pages);
    if (FAILED(listed)) return listed;
    IUnknown* self = &whole();
    const HWND own = mPlacement.window();
    const HRESULT shown = OleCreatePropertyFrame(
        mPlacement.isActive() ? GetAncestor(own, GA_ROOT) : nullptr, 0, 0, L"Zandor", 1, &self,
        pages.cElems, pages.pElems, LOCALE_USER_DEFAULT, 0, nullptr);
    CoTaskMemFree(pages.pElems);
    return shown;
}

STDMETHODIMP OleObject::EnumVerbs(IEnumOLEVERB** verbs) {
    if (!verbs) return E_POINTER;
    *verbs = nullptr;
    return OleRegEnumVerbs(ids::control, verbs);
}

STDMETHODIMP OleObject::GetUserClassID(CLSID* id) {
    if (!id) return E_POINTER;
    *id = ids::control;
    return S_OK;
}

STDMETHODIMP OleObject::GetUserType(DWORD, LPOLESTR* name) {
    if (!name) return E_POINTER;
    static constexpr wchar_t title[] = L"Zandor query designer";
    *name = static_cast<LPOLESTR>(CoTaskMemAlloc(sizeof title));
    if (!*name) return E_OUTOFMEMORY;
    std::memcpy(*name, title, sizeof title);
    return S_OK;
}

STDMETHODIMP OleObject::SetExtent(DWORD aspect, SIZEL* extent) {
    if (!extent) return E_POINTER;
    if (aspect != DVASPECT_CONTENT) return DV_E_DVASPECT;
    if (extent->cx < 0 || extent->cy < 0) return E_INVALIDARG;
    const Held<IUnknown> meanwhile(&whole());
    mPlacement.setExtent(*extent);
    return S_OK;
}

STDMETHODIMP OleObject::GetExtent(DWORD aspect, SIZEL* extent) {
    if (!extent) return E_POINTER;
    *extent = {};
    if (aspect != DVASPECT_CONTENT) return DV_E_DVASPECT;
    *extent = mPlacement.extent();
    return S_OK;
}

STDMETHODIMP OleObject::Advise(IAdviseSink* sink, DWORD* cookie) {
    if (!sink || !cookie) return E_POINTER;
    *cookie = 0;
    if (!mAdvised)
        if (const HRESULT made = CreateOleAdviseHolder(mAdvised.slot()); FAILED(made)) return made;
    return mAdvised->Advise(sink, cookie);
}

STDMETHODIMP OleObject::Unadvise(DWORD cookie) {
    return mAdvised ? mAdvised->Unadvise(cookie) : OLE_E_NOCONNECTION;
}

STDMETHODIMP OleObject::EnumAdvise(IEnumSTATDATA** advised) {
    if (!advised) return E_POINTER;
    *advised = nullptr;
    return mAdvised ? mAdvised->EnumAdvise(advised) : S_OK;
}

STDMETHODIMP OleObject::GetMiscStatus(DWORD aspect, DWORD* status) {
    if (!status) return E_POINTER;
    *status = aspect == DVASPECT_CONTENT ? miscStatus : 0;
    return S_OK;
}

} // namespace zandor::automation
