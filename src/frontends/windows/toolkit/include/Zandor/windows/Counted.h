#pragma once

#include <atomic>

#include <windows.h>

#include <unknwn.h>

// Names of ours, which the system takes for two forms of its own.
#undef MessageBox
#undef RegisterWindowMessage
#undef SendMessage

namespace zandor::platform::windows {

/// An object of the system's kind behind one interface, which goes with its last reference. It is
/// made with none.
template <class Interface>
class Counted : public Interface {
public:
    Counted() = default;
    Counted(const Counted&) = delete;
    Counted& operator=(const Counted&) = delete;

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override {
        if (!object) return E_POINTER;
        *object =
            iid == IID_IUnknown || iid == __uuidof(Interface) || inherits(iid) ? this : nullptr;
        if (!*object) return E_NOINTERFACE;
        AddRef();
        return S_OK;
    }
    STDMETHODIMP_(ULONG) AddRef() override { return ++mReferences; }
    STDMETHODIMP_(ULONG) Release() override {
        const ULONG left = --mReferences;
        if (left == 0) delete this;
        return left;
    }

protected:
    virtual ~Counted() = default;
    /// Whether the interface begins with another one of this id, other than IUnknown.
    virtual bool inherits(REFIID) const { return false; }

private:
    std::atomic<ULONG> mReferences = 0;
};

} // namespace zandor::platform::windows
