#pragma once

#include "frontends/windows/automation/com/system.h"

namespace zandor::automation {

/// One of the things that an object is beside its main interface: a part of it, and counted with
/// it.
class Facet {
public:
    Facet() = default;
    Facet(const Facet&) = delete;
    Facet& operator=(const Facet&) = delete;
    virtual ~Facet() = default;

    /// An interface of its own, without counting; nullptr where it is none.
    virtual void* find(REFIID iid) = 0;
};

/// A facet behind these interfaces. What they inherit, other than IUnknown, the class itself finds.
template <class... Interfaces>
class FacetOf : public Facet, public Interfaces... {
public:
    explicit FacetOf(IUnknown& whole) : mWhole(whole) {}

    STDMETHODIMP QueryInterface(REFIID iid, void** object) final {
        return mWhole.QueryInterface(iid, object);
    }
    STDMETHODIMP_(ULONG) AddRef() final { return mWhole.AddRef(); }
    STDMETHODIMP_(ULONG) Release() final { return mWhole.Release(); }

    void* find(REFIID iid) override {
        void* found = nullptr;
        (take<Interfaces>(found, iid) || ...);
        return found;
    }

protected:
    IUnknown& whole() const { return mWhole; }

private:
    template <class Interface>
    bool take(void*& found, REFIID iid) {
        if (iid != __uuidof(Interface)) return false;
        found = static_cast<Interface*>(this);
        return true;
    }

    IUnknown& mWhole;
};

} // namespace zandor::automation
