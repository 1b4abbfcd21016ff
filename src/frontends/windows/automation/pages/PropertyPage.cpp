#include "frontends/windows/automation/pages/PropertyPage.h"

#include "frontends/windows/automation/com/Failure.h"

#include <control.h>
#include <cstring>

namespace zandor::automation {

STDMETHODIMP PropertyPage::SetPageSite(IPropertyPageSite* site) {
    if (site && mSite) return E_UNEXPECTED;
    mSite = site;
    return S_OK;
}

STDMETHODIMP PropertyPage::Activate(HWND parent, LPCRECT place, BOOL) {
    if (!place) return E_POINTER;
    if (!IsWindow(parent)) return E_INVALIDARG;
    if (isActive()) return E_UNEXPECTED;
    return answer([&] {
        mWindow = PageWindow::open(parent, mValues, [this] { changed(); });
        mWindow->move(*place);
    });
}

STDMETHODIMP PropertyPage::Deactivate() {
    if (!mWindow) return E_UNEXPECTED;
    const auto going = std::exchange(mWindow, nullptr);
    if (going->handle()) DestroyWindow(going->handle());
    return S_OK;
}

STDMETHODIMP PropertyPage::GetPageInfo(PROPPAGEINFO* info) {
    if (!info) return E_POINTER;
    if (info->cb < sizeof *info) return E_INVALIDARG;
    const ULONG size = info->cb;
    *info = {};
    info->cb = size;
    static constexpr wchar_t title[] = L"Zandor";
    info->pszTitle = static_cast<LPOLESTR>(CoTaskMemAlloc(sizeof title));
    if (!info->pszTitle) return E_OUTOFMEMORY;
    std::memcpy(info->pszTitle, title, sizeof title);
    info->size = PageWindow::wanted();
    return S_OK;
}

STDMETHODIMP PropertyPage::SetObjects(ULONG count, IUnknown** objects) {
    if (count > 0 && !objects) return E_POINTER;
    const Held<IUnknown> meanwhile(this);
    std::vector<Held<IDispatch>> found;
    for (ULONG n = 0; n < count; ++n) {
        if (!objects[n]) return E_POINTER;
        const auto control = Held<_Zandor>::of(objects[n]);
        if (!control) return E_NOINTERFACE;
        found.emplace_back(control.get());
    }
    return answer([&] {
        mValues.setObjects(std::move(found));
        if (isActive()) mWindow->refresh();
    });
}

STDMETHODIMP PropertyPage::Show(UINT how) {
    if (!isActive()) return E_UNEXPECTED;
    if (how != SW_SHOW && how != SW_SHOWNORMAL && how != SW_HIDE) return E_INVALIDARG;
    ShowWindow(mWindow->handle(), static_cast<int>(how));
    return S_OK;
}

STDMETHODIMP PropertyPage::Move(LPCRECT place) {
    if (!place) return E_POINTER;
    if (!isActive()) return E_UNEXPECTED;
    mWindow->move(*place);
    return S_OK;
}

STDMETHODIMP PropertyPage::IsPageDirty() { return mValues.isDirty() ? S_OK : S_FALSE; }

STDMETHODIMP PropertyPage::Apply() {
    if (!mValues.hasObjects()) return E_UNEXPECTED;
    const Held<IUnknown> meanwhile(this);
    std::optional<PageValues::Refusal> refused;
    const HRESULT applied = answer([&] { refused = mValues.apply(); });
    if (FAILED(applied)) return applied;
    if (refused) {
        if (const auto window = mWindow) window->refuse(*refused);
        return E_FAIL;
    }
    if (isActive()) mWindow->refresh();
    return S_OK;
}

STDMETHODIMP PropertyPage::TranslateAccelerator(MSG* message) {
    if (!message) return E_POINTER;
    if (!isActive()) return E_UNEXPECTED;
    const Held<IUnknown> meanwhile(this);
    const Held<IPropertyPageSite> site = mSite;
    if (site && mWindow->isLeftBy(*message) && site->TranslateAccelerator(message) == S_OK)
        return S_OK;
    const auto window = mWindow;
    return window && window->handle() && window->take(*message) ? S_OK : S_FALSE;
}

STDMETHODIMP PropertyPage::EditProperty(DISPID member) {
    const auto row = PageValues::rowOf(member);
    if (!row) return E_INVALIDARG;
    if (!isActive()) return E_UNEXPECTED;
    mWindow->edit(*row);
    return S_OK;
}

void PropertyPage::changed() {
    const Held<IUnknown> meanwhile(this);
    if (const Held<IPropertyPageSite> site = mSite)
        site->OnStatusChange(PROPPAGESTATUS_DIRTY | PROPPAGESTATUS_VALIDATE);
}

} // namespace zandor::automation
