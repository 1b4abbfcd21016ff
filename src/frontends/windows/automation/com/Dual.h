#pragma once

#include "frontends/windows/automation/com/Failure.h"
#include "frontends/windows/automation/com/Module.h"

#include <atomic>

namespace zandor::automation {

/// An object behind a dual interface, and others beside it: counted, found by the interfaces'
/// ids, and leaving words for its failures. It is made with no reference. What is late-bound goes
/// by the type library, unless the class says otherwise.
template <class Interface, class... Others>
class Dual : public Interface, public ISupportErrorInfo, public Others... {
public:
    Dual() = default;
    Dual(const Dual&) = delete;
    Dual& operator=(const Dual&) = delete;
    virtual ~Dual() = default;

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
        if (!object) return E_POINTER;
        *object = find(iid);
        if (!*object) return E_NOINTERFACE;
        AddRef();
        return S_OK;
    }
    STDMETHODIMP_(ULONG) AddRef() override { return ++mCount; }
    STDMETHODIMP_(ULONG) Release() override {
        const ULONG left = --mCount;
        if (left == 0) {
            // Whoever asks for it while it ends does not end it again.
            mCount = 1;
            delete this;
        }
        return left;
    }

    STDMETHODIMP GetTypeInfoCount(UINT* count) override {
        return answer([&] { placeOf(count) = 1; });
    }
    STDMETHODIMP GetTypeInfo(UINT number, LCID, ITypeInfo** info) override {
        if (!info) return E_POINTER;
        *info = nullptr;
        if (number != 0) return DISP_E_BADINDEX;
        return answer([&] { *info = module::typeInfo(__uuidof(Interface)).detach(); });
    }
    STDMETHODIMP GetIDsOfNames(REFIID, LPOLESTR* names, UINT count, LCID,
                               DISPID* numbers) override {
        if (!names || !numbers) return E_POINTER;
        Held<ITypeInfo> info;
        const HRESULT found = describe(info);
        return FAILED(found) ? found : info->GetIDsOfNames(names, count, numbers);
    }
    STDMETHODIMP Invoke(DISPID member, REFIID iid, LCID, WORD flags, DISPPARAMS* arguments,
                        VARIANT* result, EXCEPINFO* failure, UINT* wrong) override {
        if (iid != IID_NULL) return DISP_E_UNKNOWNINTERFACE;
        if (!arguments) return E_POINTER;
        Held<ITypeInfo> info;
        const HRESULT found = describe(info);
        if (FAILED(found)) return found;
        const Held<IUnknown> meanwhile(static_cast<Interface*>(this));
        // Hosts differ in which of the two they ask for a value by.
        constexpr WORD reads = DISPATCH_METHOD | DISPATCH_PROPERTYGET;
        if (flags & reads) flags |= reads;
        return info->Invoke(static_cast<Interface*>(this), member, flags, arguments, result,
                            failure, wrong);
    }

    STDMETHODIMP InterfaceSupportsErrorInfo(REFIID iid) override {
        return iid == __uuidof(Interface) || iid == IID_IDispatch ? S_OK : S_FALSE;
    }

protected:
    /// What else it is, without counting.
    virtual void* findMore(REFIID) { return nullptr; }

private:
    HRESULT describe(Held<ITypeInfo>& info) noexcept {
        return answer([&] { info = module::typeInfo(__uuidof(Interface)); });
    }

    template <class Other>
    static bool take(void*& found, Dual* self, REFIID iid) {
        if (iid != __uuidof(Other)) return false;
        found = static_cast<Other*>(self);
        return true;
    }

    void* find(REFIID iid) {
        if (iid == IID_IUnknown || iid == IID_IDispatch || iid == __uuidof(Interface))
            return static_cast<Interface*>(this);
        void* found = nullptr;
        if (take<ISupportErrorInfo>(found, this, iid) || (take<Others>(found, this, iid) || ...))
            return found;
        return findMore(iid);
    }

    const Keeping mKeeping;
    std::atomic<ULONG> mCount = 0;
};

} // namespace zandor::automation
