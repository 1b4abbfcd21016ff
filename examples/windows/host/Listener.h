#pragma once

#include "calls.h"

#include <ocidl.h>

#include <functional>
#include <string>

#include <control.h>

/// Hears the control's events, which come under their numbers.
class Listener final : public IDispatch {
public:
    using Heard = std::function<void(const std::wstring& event)>;

    /// From now on; `heard` is called with the event's name.
    Listener(IUnknown* control, Heard heard) : mHeard(std::move(heard)) {
        const auto points = as<IConnectionPointContainer>(control);
        check(points->FindConnectionPoint(__uuidof(__Zandor), &mPoint), "Finding the events");
        check(mPoint->Advise(this, &mCookie), "Listening");
    }
    Listener(const Listener&) = delete;
    Listener& operator=(const Listener&) = delete;
    ~Listener() { mPoint->Unadvise(mCookie); }

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
        const bool ours = iid == IID_IUnknown || iid == IID_IDispatch || iid == __uuidof(__Zandor);
        *object = ours ? this : nullptr;
        return ours ? S_OK : E_NOINTERFACE;
    }
    STDMETHODIMP_(ULONG) AddRef() override { return 2; }
    STDMETHODIMP_(ULONG) Release() override { return 1; }
    STDMETHODIMP GetTypeInfoCount(UINT* count) override {
        *count = 0;
        return S_OK;
    }
    STDMETHODIMP GetTypeInfo(UINT, LCID, ITypeInfo**) override { return E_NOTIMPL; }
    STDMETHODIMP GetIDsOfNames(REFIID, LPOLESTR*, UINT, LCID, DISPID*) override {
        return E_NOTIMPL;
    }
    STDMETHODIMP Invoke(DISPID number, REFIID, LCID, WORD, DISPPARAMS*, VARIANT*, EXCEPINFO*,
                        UINT*) override {
        static constexpr const wchar_t* names[] = {
            L"TableDeleted",  L"TableMoved", L"Activate",    L"ColumnCreated", L"ColumnModified",
            L"ColumnRemoved", L"Error",      L"JoinCreated", L"JoinModified",  L"JoinRemoved"};
        const DISPID place = -120 - number;
        if (place < 0 || place > 9) return DISP_E_MEMBERNOTFOUND;
        mHeard(names[place]);
        return S_OK;
    }

private:
    const Heard mHeard;
    ComPtr<IConnectionPoint> mPoint;
    DWORD mCookie = 0;
};
