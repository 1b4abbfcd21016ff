#pragma once

#include "frontends/windows/automation/com/Module.h"

#include <model.h>

#include <atomic>

namespace zandor::automation {

/// Walks a collection by its numbers. What comes and goes meanwhile comes and goes.
class Enumerator final : public IEnumVARIANT {
public:
    /// From the item at a position on.
    static Held<IUnknown> over(_ZDCollection* items, LONG position = 1);

    STDMETHODIMP QueryInterface(REFIID iid, void** object) override;
    STDMETHODIMP_(ULONG) AddRef() override;
    STDMETHODIMP_(ULONG) Release() override;
    STDMETHODIMP Next(ULONG count, VARIANT* values, ULONG* fetched) override;
    STDMETHODIMP Skip(ULONG count) override;
    STDMETHODIMP Reset() override;
    STDMETHODIMP Clone(IEnumVARIANT** other) override;

private:
    Enumerator(_ZDCollection* items, LONG position) : mItems(items), mPosition(position) {}

    const Keeping mKeeping;
    std::atomic<ULONG> mReferences = 0;
    const Held<_ZDCollection> mItems;
    LONG mPosition;
};

} // namespace zandor::automation
