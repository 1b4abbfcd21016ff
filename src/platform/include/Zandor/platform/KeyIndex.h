#pragma once

#include <Zandor/platform/String.h>

#include <cstddef>
#include <cstdint>
#include <functional>
#include <vector>

namespace zandor::platform {

/// Keys in an order, each once, and the position of each (from 0) found by its hash. Comparing is
/// binary.
class KeyIndex {
public:
    /// What `find` answers where there is no such key.
    static constexpr std::size_t none = static_cast<std::size_t>(-1);

    /// The position of a key, or `none`.
    std::size_t find(const String& key) const {
        if (mSlots.empty()) return none;
        const std::size_t hash = hashOf(key);
        for (std::size_t slot = hash & mask(); mSlots[slot] != 0; slot = (slot + 1) & mask()) {
            const Entry& entry = mEntries[mSlots[slot] - 1];
            if (entry.hash == hash && entry.key == key) return mSlots[slot] - 1;
        }
        return none;
    }

    /// A key that is not there yet, at a position from 0 to the number of keys; those from there on
    /// move up. With std::bad_alloc nothing has changed.
    void insert(std::size_t position, const String& key) {
        if ((mEntries.size() + 1) * 2 > mSlots.size()) {
            std::vector<std::uint32_t> wider(mSlots.empty() ? 8 : mSlots.size() * 2);
            mSlots.swap(wider);
            file(0);
        }
        mEntries.insert(mEntries.begin() + static_cast<std::ptrdiff_t>(position),
                        {key, hashOf(key)});
        if (position + 1 == mEntries.size())
            file(position);
        else
            fileAnew();
    }

    /// The key at a position goes; those behind it move down.
    void erase(std::size_t position) {
        mEntries.erase(mEntries.begin() + static_cast<std::ptrdiff_t>(position));
        fileAnew();
    }

private:
    struct Entry {
        String key;
        std::size_t hash = 0;
    };

    static std::size_t hashOf(const String& key) { return std::hash<String>()(key); }
    std::size_t mask() const { return mSlots.size() - 1; }

    /// Puts the entries from a position on into free slots, of which there always is one.
    void file(std::size_t from) {
        for (std::size_t at = from; at < mEntries.size(); ++at) {
            std::size_t slot = mEntries[at].hash & mask();
            while (mSlots[slot] != 0) slot = (slot + 1) & mask();
            mSlots[slot] = static_cast<std::uint32_t>(at) + 1;
        }
    }
    void fileAnew() {
        mSlots.assign(mSlots.size(), 0);
        file(0);
    }

    std::vector<Entry> mEntries;
    std::vector<std::uint32_t> mSlots; ///< a power of two, at most half of them taken; 0: free
};

} // namespace zandor::platform
