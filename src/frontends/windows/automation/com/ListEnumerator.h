#pragma once

#include "frontends/windows/automation/com/Counted.h"

#include <vector>

namespace zandor::automation {

/// Walks a list as it was when the walk began: IEnumConnections, IEnumConnectionPoints.
/// `Item` is what is kept, from which `lend` makes what the caller gets.
template <class Interface, class Raw, class Item, Raw (*lend)(const Item&)>
class ListEnumerator final : public Counted<Interface> {
public:
    /// For who asked.
    static Interface* begin(std::vector<Item> items, std::size_t place = 0) {
        auto* const made = new ListEnumerator(std::move(items), place);
        made->AddRef();
        return made;
    }

    STDMETHODIMP Next(ULONG count, Raw* items, ULONG* fetched) override {
        if (fetched) *fetched = 0;
        if (!items || (!fetched && count != 1)) return E_POINTER;
        ULONG n = 0;
        for (; n < count && mPlace < mItems.size(); ++n) items[n] = lend(mItems[mPlace++]);
        if (fetched) *fetched = n;
        return n == count ? S_OK : S_FALSE;
    }
    STDMETHODIMP Skip(ULONG count) override {
        const std::size_t left = mItems.size() - mPlace;
        mPlace += count < left ? count : left;
        return count <= left ? S_OK : S_FALSE;
    }
    STDMETHODIMP Reset() override {
        mPlace = 0;
        return S_OK;
    }
    STDMETHODIMP Clone(Interface** other) override {
        if (!other) return E_POINTER;
        *other = begin(mItems, mPlace);
        return S_OK;
    }

private:
    ListEnumerator(std::vector<Item> items, std::size_t place)
        : mItems(std::move(items)), mPlace(place) {}

    const std::vector<Item> mItems;
    std::size_t mPlace;
};

} // namespace zandor::automation
