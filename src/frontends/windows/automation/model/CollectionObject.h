#pragma once

#include "frontends/windows/automation/com/Dual.h"
#include "frontends/windows/automation/com/Value.h"
#include "frontends/windows/automation/model/Enumerator.h"
#include "frontends/windows/automation/model/members.h"

#include <model.h>

#include <functional>
#include <memory>

namespace zandor::automation {

/// A collection of the model: its items by number from 1 and by key, and one after another.
template <class T>
class CollectionObject final : public Dual<_ZDCollection> {
public:
    using Items = TalvikZandorLib::Collection<T>;
    /// Takes the item of a key out.
    using Remover = std::function<void(const platform::String& key)>;

    /// `items` lives as long as what it belongs to is held. Without a remover nothing can be taken
    /// out: error 438.
    CollectionObject(std::shared_ptr<Items> items, Remover remover)
        : mItems(std::move(items)), mRemover(std::move(remover)) {}

    STDMETHODIMP Item(VARIANT Index, IDispatch** item) override {
        return answer([&] { give(item, find(Index)); });
    }
    STDMETHODIMP get_Count(LONG* value) override {
        return answer([&] { give(value, mItems->Count()); });
    }
    STDMETHODIMP Remove(VARIANT Index) override {
        return answer([&] {
            if (!mRemover) throw platform::errors::unsupportedMember();
            mRemover(isKey(Index) ? stringOf(Index) : keyAt(longOf(Index)));
        });
    }
    STDMETHODIMP get__NewEnum(IUnknown** enumerator) override {
        return answer([&] { placeOf(enumerator) = Enumerator::over(this).detach(); });
    }

private:
    static bool isKey(const VARIANT& index) {
        const VARIANT* const value = index.vt == (VT_BYREF | VT_VARIANT) ? index.pvarVal : &index;
        return (value->vt & ~VT_BYREF) == VT_BSTR;
    }

    platform::Ref<T> find(const VARIANT& index) const {
        return isKey(index) ? mItems->Item(stringOf(index)) : mItems->Item(longOf(index));
    }

    platform::String keyAt(std::int32_t position) const {
        const auto item = mItems->Item(position);
        if constexpr (requires { item->Key(); })
            return item->Key();
        else // a criterion, whose key is its row
            return platform::decimal(position + rowsBeforeCriteria);
    }

    static constexpr std::int32_t rowsBeforeCriteria = 3;

    const std::shared_ptr<Items> mItems;
    const Remover mRemover;
};

/// A collection that a model's object has; the object stays for as long as the collection is held.
template <class T, class Owner, class Items>
Held<IDispatch> collectionOf(const platform::Ref<Owner>& owner, Items& items,
                             typename CollectionObject<T>::Remover remover = {}) {
    const std::shared_ptr<TalvikZandorLib::Collection<T>> held(owner, &items);
    return Held<IDispatch>(new CollectionObject<T>(held, std::move(remover)));
}

/// The same, from which a host may take items out.
template <class T, class Owner>
Held<IDispatch> editableCollectionOf(const platform::Ref<Owner>& owner,
                                     TalvikZandorLib::EditableCollection<T>& items) {
    return collectionOf<T>(owner, items,
                           [owner, &items](const platform::String& key) { items.Remove(key); });
}

} // namespace zandor::automation
