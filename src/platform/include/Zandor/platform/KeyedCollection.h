#pragma once

#include <Zandor/TalvikZandorLib.h>

#include <algorithm>
#include <vector>

namespace zandor::platform {

/// Items in the order of their adding, each under a key of its own.
template <class T>
class KeyedCollection : public TalvikZandorLib::EditableCollection<T> {
public:
    std::int32_t Count() const override { return static_cast<std::int32_t>(mItems.size()); }

    Ref<T> Item(std::int32_t position) const override {
        if (position < 1 || position > Count()) throw errors::subscriptOutOfRange();
        return mItems[static_cast<std::size_t>(position) - 1].item;
    }

    Ref<T> Item(const String& key) const override {
        const auto at = find(key);
        if (at == mItems.end()) throw errors::invalidProcedureCall();
        return at->item;
    }

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
    explicit Each(const TalvikZandorLib::Collection<T>& collection) : mCollection(collection) {}

    struct End {};

    class Iterator {
    public:
        explicit Iterator(const TalvikZandorLib::Collection<T>& collection)
            : mCollection(collection) {}
        Ref<T> operator*() const { return mCollection.Item(mPosition); }
        Iterator& operator++() {
            ++mPosition;
            return *this;
        }
        bool operator!=(End) const { return mPosition <= mCollection.Count(); }

    private:
        const TalvikZandorLib::Collection<T>& mCollection;
        std::int32_t mPosition = 1;
    };

    Iterator begin() const { return Iterator(mCollection); }
    End end() const { return {}; }

private:
    const TalvikZandorLib::Collection<T>& mCollection;
};

} // namespace zandor::platform
