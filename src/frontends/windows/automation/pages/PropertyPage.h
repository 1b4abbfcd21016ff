#pragma once

#include "frontends/windows/automation/com/Counted.h"
#include "frontends/windows/automation/pages/PageWindow.h"

namespace zandor::automation {

/// A page of a form editor's property frame, over the properties of one or several controls. What
/// its user changes is written when it is applied, and kept while the page is not shown.
class PropertyPage final : public Counted<IPropertyPage2> {
public:
    STDMETHODIMP SetPageSite(IPropertyPageSite* site) override;
    STDMETHODIMP Activate(HWND parent, LPCRECT place, BOOL modal) override;
    STDMETHODIMP Deactivate() override;
    STDMETHODIMP GetPageInfo(PROPPAGEINFO* info) override;
    /// E_NOINTERFACE where one of them is no such control: those from before stay.
    STDMETHODIMP SetObjects(ULONG count, IUnknown** objects) override;
    STDMETHODIMP Show(UINT how) override;
    STDMETHODIMP Move(LPCRECT place) override;
    STDMETHODIMP IsPageDirty() override;
    /// E_FAIL where something was refused, which the user has been told in a box.
    STDMETHODIMP Apply() override;
    STDMETHODIMP Help(LPCOLESTR) override { return E_NOTIMPL; }
    STDMETHODIMP TranslateAccelerator(MSG* message) override;
    STDMETHODIMP EditProperty(DISPID member) override;

protected:
    bool inherits(REFIID iid) const override { return iid == IID_IPropertyPage; }

private:
    bool isActive() const { return mWindow && mWindow->handle(); }
    void changed();

    PageValues mValues;
    Held<IPropertyPageSite> mSite;
    std::shared_ptr<PageWindow> mWindow;
};

} // namespace zandor::automation
