#include "model/reader/sortByName.h"

#include <Zandor/model/Names.h>

#include <QString>

#include <algorithm>
#include <string_view>
#include <utility>

namespace zandor::reader {

namespace {

/// UTF-8, whose bytes are in the order of the characters that they stand for.
auto nameAndSchema(const TableEntry& entry) {
    return std::pair(platform::toUtf8(entry.id.name), platform::toUtf8(entry.id.schema));
}

struct Key {
    std::uint64_t head = 0;  ///< the bytes in which names first differ, which mostly decide
    std::string_view folded; ///< of the whole name
    TableEntry* entry = nullptr;
};

bool operator<(const Key& left, const Key& right) {
    if (left.head != right.head) return left.head < right.head;
    const int compared = left.folded.compare(right.folded);
    return compared != 0 ? compared < 0 : nameAndSchema(*left.entry) < nameAndSchema(*right.entry);
}

/// Behind what all begin with: names often share a prefix.
void writeHeads(std::vector<Key>& keys) {
    std::string_view common = keys.front().folded;
    for (const Key& key : keys)
        common.remove_suffix(
            static_cast<std::size_t>(common.end() - std::ranges::mismatch(common, key.folded).in1));
    for (Key& key : keys)
        for (std::size_t n = 0; n < sizeof key.head; ++n) {
            const std::size_t at = common.size() + n;
            const char byte = at < key.folded.size() ? key.folded[at] : '\0';
            key.head = key.head << 8 | static_cast<unsigned char>(byte);
        }
}

/// Puts each entry where its key stands, in place.
void follow(std::vector<Key>& keys, std::vector<TableEntry>& entries) {
    for (std::size_t n = 0; n < keys.size(); ++n) {
        TableEntry* const first = &entries[n];
        TableEntry* to = first;
        TableEntry held = std::move(*first);
        while (true) {
            TableEntry* const from =
                std::exchange(keys[static_cast<std::size_t>(to - entries.data())].entry, to);
            if (from == first) break;
            *to = std::move(*from);
            to = from;
        }
        *to = std::move(held);
    }
}

} // namespace

void sortByName(std::vector<TableEntry>& entries) {
    if (entries.empty()) return;
    // All at once, and not at every comparison. No name has this character.
    constexpr char16_t end = 0;
    std::size_t size = 0;
    for (const TableEntry& entry : entries) size += entry.id.name.size() + 1;
    String names;
    names.reserve(size);
    for (const TableEntry& entry : entries) (names += entry.id.name) += end;
    const QByteArray folded = QStringView(model::foldedName(names)).toUtf8();

    std::vector<Key> keys;
    keys.reserve(entries.size());
    const char* at = folded.constData();
    for (TableEntry& entry : entries) {
        keys.push_back({.folded = at, .entry = &entry});
        at += keys.back().folded.size() + 1;
    }
    writeHeads(keys);
    std::sort(keys.begin(), keys.end());
    follow(keys, entries);
}

} // namespace zandor::reader
