#pragma once

#include "frontends/windows/automation/com/Counted.h"

#include <model.h>

namespace zandor::automation {

/// Walks a collection by its numbers. What comes and goes meanwhile comes and goes.
class Enumerator final : public Counted<IEnumVARIANT> {
public:
    /// From the item at a position on.
    static Held<IUnknown> over(_ZDCollection* items, LONG position = 1);

    STDMETHODIMP Next(ULONG count, VARIANT* values, ULONG* fetched) override;
    STDMETHODIMP Skip(ULONG count) override;
    STDMETHODIMP Reset() override;
    STDMETHODIMP Clone(IEnumVARIANT** other) override;

private:
    Enumerator(_ZDCollection* items, LONG position) : mItems(items), mPosition(position) {}

    const Held<_ZDCollection> mItems;
    LONG mPosition;
};

} // namespace zandor::automation
