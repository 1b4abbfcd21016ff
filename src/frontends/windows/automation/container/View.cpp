#include "frontends/windows/automation/container/View.h"

namespace zandor::automation {

namespace {

/// A picture in memory whose points can be had one by one, for devices that copy none from another.
class Picture {
public:
    explicit Picture(SIZE size) : mSize(size), mDc(CreateCompatibleDC(nullptr)) {
        mInfo.bmiHeader.biSize = sizeof mInfo.bmiHeader;
        mInfo.bmiHeader.biWidth = size.cx;
        mInfo.bmiHeader.biHeight = -size.cy; // the first row is the upper one
        mInfo.bmiHeader.biPlanes = 1;
        mInfo.bmiHeader.biBitCount = 32;
        mBitmap = CreateDIBSection(nullptr, &mInfo, DIB_RGB_COLORS, &mPoints, nullptr, 0);
        if (mBitmap) mBefore = SelectObject(mDc, mBitmap);
    }
    Picture(const Picture&) = delete;
    Picture& operator=(const Picture&) = delete;
    ~Picture() {
        if (mBitmap) {
            SelectObject(mDc, mBefore);
            DeleteObject(mBitmap);
        }
        DeleteDC(mDc);
    }

    explicit operator bool() const { return mBitmap != nullptr; }
    HDC dc() const { return mDc; }

    bool copyTo(HDC target, const RECTL& place) const {
        GdiFlush();
        const int before = SetStretchBltMode(target, HALFTONE);
        const int rows = StretchDIBits(target, place.left, place.top, place.right - place.left,
                                       place.bottom - place.top, 0, 0, mSize.cx, mSize.cy, mPoints,
                                       &mInfo, DIB_RGB_COLORS, SRCCOPY);
        SetStretchBltMode(target, before);
        return rows != 0 && rows != static_cast<int>(GDI_ERROR);
    }

private:
    SIZE mSize;
    HDC mDc;
    BITMAPINFO mInfo{};
    void* mPoints = nullptr;
    HBITMAP mBitmap = nullptr;
    HGDIOBJ mBefore = nullptr;
};

} // namespace

void* View::find(REFIID iid) {
    if (iid == IID_IViewObject) return static_cast<IViewObject2*>(this);
    return FacetOf::find(iid);
}

void View::changed() {
    const Held<IAdviseSink> sink = mSink;
    if (!sink) return;
    if (mFlags & ADVF_ONLYONCE) mSink = {};
    sink->OnViewChange(DVASPECT_CONTENT, -1);
}

STDMETHODIMP View::Draw(DWORD aspect, LONG index, void*, DVTARGETDEVICE*, HDC, HDC target,
                        LPCRECTL place, LPCRECTL, BOOL(STDMETHODCALLTYPE* goOn)(ULONG_PTR),
                        ULONG_PTR argument) {
    if (!place) return E_POINTER;
    if (!target) return E_INVALIDARG;
    if (aspect != DVASPECT_CONTENT) return DV_E_DVASPECT;
    if (index != -1) return DV_E_LINDEX;
    const Held<IUnknown> meanwhile(&whole());
    if (goOn && !goOn(argument)) return E_ABORT;
    const SIZE size = mPlacement.pixels();
    if (size.cx <= 0 || size.cy <= 0) return S_OK;
    const Picture picture(size);
    if (!picture) return E_OUTOFMEMORY;
    mHouse.shown().print(picture.dc());
    return picture.copyTo(target, *place) ? S_OK : E_FAIL;
}

STDMETHODIMP View::GetColorSet(DWORD, LONG, void*, DVTARGETDEVICE*, HDC, LOGPALETTE** colours) {
    if (!colours) return E_POINTER;
    *colours = nullptr;
    return S_FALSE; // whatever the device has
}

STDMETHODIMP View::SetAdvise(DWORD aspects, DWORD flags, IAdviseSink* sink) {
    if (sink && aspects != DVASPECT_CONTENT) return DV_E_DVASPECT;
    const Held<IUnknown> meanwhile(&whole());
    mSink = sink;
    mAspects = sink ? aspects : 0;
    mFlags = sink ? flags : 0;
    if (flags & ADVF_PRIMEFIRST) changed();
    return S_OK;
}

STDMETHODIMP View::GetAdvise(DWORD* aspects, DWORD* flags, IAdviseSink** sink) {
    if (aspects) *aspects = mAspects;
    if (flags) *flags = mFlags;
    if (sink) *sink = mSink.copy();
    return S_OK;
}

STDMETHODIMP View::GetExtent(DWORD aspect, LONG index, DVTARGETDEVICE*, SIZEL* extent) {
    if (!extent) return E_POINTER;
    *extent = {};
    if (aspect != DVASPECT_CONTENT) return DV_E_DVASPECT;
    if (index != -1) return DV_E_LINDEX;
    *extent = mPlacement.extent();
    return S_OK;
}

} // namespace zandor::automation
