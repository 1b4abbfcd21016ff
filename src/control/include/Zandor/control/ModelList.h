#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/control/Reached.h>

namespace TalvikDBxZandor {

/// A collection of the query model together with the object that it belongs to. Each item is
/// fetched when its turn comes, so that a collection that fails half-way has had the items before
/// the failure used; before each call of it the control is asked whether it is still there.
template <class Owner, class Collection>
class ModelList {
public:
    using Element = typename decltype(std::declval<const Collection&>().Item(1))::element_type;

    ModelList(const Life& life, const Held<Owner>& owner, Collection& (Owner::*collection)())
        : mLife(life), mOwner(owner), mCollection(((*owner).*collection)()) {}

    std::int32_t Count() const { return checked().Count(); }
    /// By 1-based position, error 9 outside 1 to Count, or by key, error 5 when no item has it.
    template <class Key>
    Held<Element> Item(const Key& key) const {
        return {mLife, checked().Item(key)};
    }
    void Remove(const platform::String& key) const { checked().Remove(key); }

    struct End {};
    class Iterator {
    public:
        explicit Iterator(const ModelList& list) : mList(list) {}
        Held<Element> operator*() const { return mList.Item(mPosition); }
        Iterator& operator++() {
            ++mPosition;
            return *this;
        }
        bool operator!=(End) const { return mPosition <= mList.Count(); }

    private:
        const ModelList& mList;
        std::int32_t mPosition = 1;
    };
    Iterator begin() const { return Iterator(*this); }
    End end() const { return {}; }

private:
    Collection& checked() const {
        mLife.check();
        return mCollection;
    }

    const Life& mLife;
    const Held<Owner> mOwner;
    Collection& mCollection;
};

} // namespace TalvikDBxZandor
