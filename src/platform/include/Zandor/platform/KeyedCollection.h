#pragma once

#include <Zandor/TalvikZandorLib.h>

#include <algorithm>
#include <vector>

namespace zandor::platform {

/// Items in the order of their adding, each under a key of its own.
template <class T>
class KeyedCollection : public TalvikZandorLib::EditableCollection<T> {
public:
    /// How many items there are.
    std::int32_t Count() const override { return static_cast<std::int32_t>(mItems.size()); }

    /// Position from 1; error 9 outside 1 to Count.
    Ref<T> Item(std::int32_t position) const override {
        if (position < 1 || position > Count()) throw errors::subscriptOutOfRange();
        return mItems[static_cast<std::size_t>(position) - 1].item;
    }

    /// Error 5 when no item has the key.
    Ref<T> Item(const String& key) const override {
        const auto at = find(key);
        if (at == mItems.end()) throw errors::invalidProcedureCall();
        return at->item;
    }

    /// Whether an item has the key.
    bool Contains(const String& key) const { return find(key) != mItems.end(); }

    /// Error 457 when the key is taken; nothing is added then.
    void Add(Ref<T> item, const String& key) {
        if (Contains(key)) throw errors::duplicateKey();
        mItems.push_back({key, std::move(item)});
    }

    /// The item then has this 1-based position: error 9 outside 1 to Count + 1, error 457 when the
    /// key is taken; nothing is added then.
    void Insert(std::int32_t position, Ref<T> item, const String& key) {
        if (position < 1 || position > Count() + 1) throw errors::subscriptOutOfRange();
        if (Contains(key)) throw errors::duplicateKey();
        mItems.insert(mItems.begin() + (position - 1), {key, std::move(item)});
    }

    /// Error 5 when no item has the key; nothing changes then.
    void Remove(const String& key) override {
        const auto at = find(key);
        if (at == mItems.end()) throw errors::invalidProcedureCall();
        mItems.erase(at);
    }

private:
    struct Keyed {
        String key;
        Ref<T> item;
    };

    auto find(const String& key) const {
        return std::find_if(mItems.begin(), mItems.end(),
                            [&key](const Keyed& keyed) { return keyed.key == key; });
    }

    std::vector<Keyed> mItems;
};

/// Walks a collection in its order. Each item is fetched when its turn comes, so that a collection
/// that fails half-way has had the items before the failure used.
template <class T>
class Each {
public:
    /// The collection outlives the walk.
    explicit Each(const TalvikZandorLib::Collection<T>& collection) : mCollection(collection) {}

    struct End {};

    /// Stands at a position.
    class Iterator {
    public:
        /// At position 1.
        explicit Iterator(const TalvikZandorLib::Collection<T>& collection)
            : mCollection(collection) {}
        /// The item, fetched from the collection.
        Ref<T> operator*() const { return mCollection.Item(mPosition); }
        /// The next position.
        Iterator& operator++() {
            ++mPosition;
            return *this;
        }
        /// Whether the collection goes on; asked anew each time.
        bool operator!=(End) const { return mPosition <= mCollection.Count(); }

    private:
        const TalvikZandorLib::Collection<T>& mCollection;
        std::int32_t mPosition = 1;
    };

    /// For a range-based loop.
    Iterator begin() const { return Iterator(mCollection); }
    /// For a range-based loop.
    End end() const { return {}; }

private:
    const TalvikZandorLib::Collection<T>& mCollection;
};

} // namespace zandor::platform
