#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/platform/KeyIndex.h>

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
    Ref<T> Item(std::int32_t position) const override { return Peek(position); }

    /// The same without a count of its own, for as long as nothing is added or removed.
    const Ref<T>& Peek(std::int32_t position) const {
        if (position < 1 || position > Count()) throw errors::subscriptOutOfRange();
        return mItems[static_cast<std::size_t>(position) - 1];
    }

    /// Error 5 when no item has the key.
    Ref<T> Item(const String& key) const override { return mItems[checked(key)]; }

    /// Whether an item has the key.
    bool Contains(const String& key) const { return mKeys.find(key) != KeyIndex::none; }

    /// Error 457 when the key is taken; nothing is added then.
    void Add(Ref<T> item, const String& key) { Insert(Count() + 1, std::move(item), key); }

    /// The item then has this 1-based position: error 9 outside 1 to Count + 1, error 457 when the
    /// key is taken; nothing is added then.
    void Insert(std::int32_t position, Ref<T> item, const String& key) {
        if (position < 1 || position > Count() + 1) throw errors::subscriptOutOfRange();
        if (Contains(key)) throw errors::duplicateKey();
        const auto at = static_cast<std::size_t>(position) - 1;
        // Whatever there is no memory for, both are as long as each other.
        if (mItems.size() == mItems.capacity())
            mItems.reserve(std::max<std::size_t>(4, mItems.size() * 2));
        mKeys.insert(at, key);
        mItems.insert(mItems.begin() + static_cast<std::ptrdiff_t>(at), std::move(item));
    }

    /// Error 5 when no item has the key; nothing changes then.
    void Remove(const String& key) override {
        const std::size_t at = checked(key);
        mKeys.erase(at);
        mItems.erase(mItems.begin() + static_cast<std::ptrdiff_t>(at));
    }

private:
    std::size_t checked(const String& key) const {
        const std::size_t at = mKeys.find(key);
        if (at == KeyIndex::none) throw errors::invalidProcedureCall();
        return at;
    }

    std::vector<Ref<T>> mItems;
    KeyIndex mKeys; ///< of the items, in their order
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
