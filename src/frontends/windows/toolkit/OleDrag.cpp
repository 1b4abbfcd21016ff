#include "frontends/windows/toolkit/OleDrag.h"

#include "frontends/windows/toolkit/DragPicture.h"
#include "frontends/windows/toolkit/Surroundings.h"

#include <Zandor/windows/Counted.h>

#include <cstring>

#include <ole2.h>
#include <shlobj.h>

namespace zandor::platform::windows {

namespace {

using Microsoft::WRL::ComPtr;

/// Whose a drag is, in every process.
struct Identity {
    DWORD process;
    const Drags* drags;
    friend bool operator==(const Identity&, const Identity&) = default;
};

FORMATETC identityFormat() {
    static const UINT number = RegisterClipboardFormatW(L"TalvikZandorColumns");
    return {static_cast<CLIPFORMAT>(number), nullptr, DVASPECT_CONTENT, -1, TYMED_HGLOBAL};
}

class Carried final : public Counted<IDataObject> {
public:
    explicit Carried(const Drags& drags) : mIdentity{GetCurrentProcessId(), &drags} {}

    STDMETHODIMP GetData(FORMATETC* format, STGMEDIUM* medium) override {
        if (!medium) return E_POINTER;
        *medium = {};
        if (const HRESULT code = QueryGetData(format); FAILED(code)) return code;
        const HGLOBAL memory = GlobalAlloc(GMEM_MOVEABLE, sizeof mIdentity);
        if (!memory) return E_OUTOFMEMORY;
        std::memcpy(GlobalLock(memory), &mIdentity, sizeof mIdentity);
        GlobalUnlock(memory);
        medium->tymed = TYMED_HGLOBAL;
        medium->hGlobal = memory;
        return S_OK;
    }
    STDMETHODIMP QueryGetData(FORMATETC* format) override {
        if (!format) return E_POINTER;
        return format->cfFormat == identityFormat().cfFormat && format->tymed & TYMED_HGLOBAL
                   ? S_OK
                   : DV_E_FORMATETC;
    }
    STDMETHODIMP EnumFormatEtc(DWORD direction, IEnumFORMATETC** formats) override {
        if (!formats) return E_POINTER;
        *formats = nullptr;
        if (direction != DATADIR_GET) return E_NOTIMPL;
        const FORMATETC only = identityFormat();
        return SHCreateStdEnumFmtEtc(1, &only, formats);
    }
    STDMETHODIMP GetDataHere(FORMATETC*, STGMEDIUM*) override { return DV_E_FORMATETC; }
    STDMETHODIMP GetCanonicalFormatEtc(FORMATETC*, FORMATETC* same) override {
        if (!same) return E_POINTER;
        same->ptd = nullptr;
        return DATA_S_SAMEFORMATETC;
    }
    STDMETHODIMP SetData(FORMATETC*, STGMEDIUM*, BOOL) override { return E_NOTIMPL; }
    STDMETHODIMP DAdvise(FORMATETC*, DWORD, IAdviseSink*, DWORD*) override {
        return OLE_E_ADVISENOTSUPPORTED;
    }
    STDMETHODIMP DUnadvise(DWORD) override { return OLE_E_ADVISENOTSUPPORTED; }
    STDMETHODIMP EnumDAdvise(IEnumSTATDATA**) override { return OLE_E_ADVISENOTSUPPORTED; }

private:
    const Identity mIdentity;
};

bool isOf(const Drags& drags, IDataObject* data) {
    FORMATETC format = identityFormat();
    STGMEDIUM medium{};
    if (!data || FAILED(data->GetData(&format, &medium))) return false;
    Identity found{};
    if (medium.tymed == TYMED_HGLOBAL && GlobalSize(medium.hGlobal) >= sizeof found) {
        std::memcpy(&found, GlobalLock(medium.hGlobal), sizeof found);
        GlobalUnlock(medium.hGlobal);
    }
    ReleaseStgMedium(&medium);
    return found == Identity{GetCurrentProcessId(), &drags};
}

/// The system may hold it for longer than the drag runs.
class Target final : public Counted<IDropTarget> {
public:
    explicit Target(Drags& drags) : mSurroundings(drags.surroundings().weak_from_this()) {}

    STDMETHODIMP DragEnter(IDataObject* data, DWORD, POINTL at, DWORD* effect) override {
        const auto around = mSurroundings.lock();
        mOurs = around && isOf(around->drags, data);
        return over(at, effect);
    }
    STDMETHODIMP DragOver(DWORD, POINTL at, DWORD* effect) override { return over(at, effect); }
    STDMETHODIMP DragLeave() override {
        const auto around = mSurroundings.lock();
        if (mOurs && around) around->drags.left();
        mOurs = false;
        return S_OK;
    }
    STDMETHODIMP Drop(IDataObject* data, DWORD, POINTL at, DWORD* effect) override {
        const auto around = mSurroundings.lock();
        mOurs = around && isOf(around->drags, data);
        if (mOurs) around->drags.letGo({at.x, at.y});
        if (effect) *effect = mOurs ? DROPEFFECT_COPY : DROPEFFECT_NONE;
        mOurs = false;
        return S_OK;
    }

private:
    HRESULT over(POINTL at, DWORD* effect) {
        if (!effect) return E_POINTER;
        const auto around = mSurroundings.lock();
        const bool taken = mOurs && around && around->drags.moved({at.x, at.y});
        // Whether a drop counts there, the cursor says; it comes to the control either way.
        *effect = taken ? DROPEFFECT_COPY : DROPEFFECT_NONE;
        return S_OK;
    }

    const std::weak_ptr<Surroundings> mSurroundings;
    bool mOurs = false;
};

class Source final : public Counted<IDropSource> {
public:
    Source(const Drags& drags, DragPicture& picture) : mDrags(drags), mPicture(picture) {}

    STDMETHODIMP QueryContinueDrag(BOOL escape, DWORD keys) override {
        if (escape || keys & MK_RBUTTON || !mDrags.isRunning()) return DRAGDROP_S_CANCEL;
        return keys & MK_LBUTTON ? S_OK : DRAGDROP_S_DROP;
    }
    STDMETHODIMP GiveFeedback(DWORD) override {
        mPicture.follow();
        mDrags.showCursor();
        return S_OK;
    }

private:
    const Drags& mDrags;
    DragPicture& mPicture;
};

} // namespace

void carryByOle(Drags& drags) {
    // A host may have no more than the rest of the system's objects at work.
    if (FAILED(OleInitialize(nullptr))) return;
    const HWND window = drags.surroundings().surfaceHandle();
    RegisterDragDrop(window, targetFor(drags).Get());
    // Before the window goes, if the drag does not outlive it.
    drags.onEnd = [window] { RevokeDragDrop(window); };
    const auto picture = DragPicture::of(drags);
    const ComPtr<IDropSource> source(new Source(drags, *picture));
    DWORD effect = DROPEFFECT_NONE;
    DoDragDrop(carriedBy(drags).Get(), source.Get(), DROPEFFECT_COPY, &effect);
    picture->end();
    if (const auto end = std::exchange(drags.onEnd, {})) end();
    OleUninitialize();
}

ComPtr<IDataObject> carriedBy(const Drags& drags) { return new Carried(drags); }

ComPtr<IDropTarget> targetFor(Drags& drags) { return new Target(drags); }

} // namespace zandor::platform::windows
