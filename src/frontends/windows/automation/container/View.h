#pragma once

#include "frontends/windows/automation/com/Facet.h"
#include "frontends/windows/automation/container/Placement.h"

namespace zandor::automation {

/// Pictures of the control, for designers and printers, whether it is shown or not.
class View final : public FacetOf<IViewObject2> {
public:
    View(IUnknown& whole, House& house, Placement& placement)
        : FacetOf(whole), mHouse(house), mPlacement(placement) {}

    /// A picture would be another one now.
    void changed();

    void* find(REFIID iid) override;

    STDMETHODIMP Draw(DWORD aspect, LONG index, void* more, DVTARGETDEVICE* device, HDC reference,
                      HDC target, LPCRECTL place, LPCRECTL metafile,
                      BOOL(STDMETHODCALLTYPE* goOn)(ULONG_PTR), ULONG_PTR argument) override;
    STDMETHODIMP GetColorSet(DWORD, LONG, void*, DVTARGETDEVICE*, HDC, LOGPALETTE**) override;
    STDMETHODIMP Freeze(DWORD, LONG, void*, DWORD*) override { return E_NOTIMPL; }
    STDMETHODIMP Unfreeze(DWORD) override { return E_NOTIMPL; }
    STDMETHODIMP SetAdvise(DWORD aspects, DWORD flags, IAdviseSink* sink) override;
    STDMETHODIMP GetAdvise(DWORD* aspects, DWORD* flags, IAdviseSink** sink) override;
    STDMETHODIMP GetExtent(DWORD aspect, LONG index, DVTARGETDEVICE*, SIZEL* extent) override;

private:
    House& mHouse;
    Placement& mPlacement;
    Held<IAdviseSink> mSink;
    DWORD mAspects = 0;
    DWORD mFlags = 0;
};

} // namespace zandor::automation
