#pragma once

#include <string>
#include <vector>

namespace zandor::automation::registration {

/// A value in the registry, below Software\Classes. All are texts.
struct Entry {
    std::wstring key;
    std::wstring name; ///< empty: the key's own value
    std::wstring text;
    /// Both word sizes write it, and the last of them takes it away.
    bool shared = false;
};

/// All that there are for a library in this file, parents before what stands below them.
std::vector<Entry> entriesFor(const std::wstring& file);

/// The keys below which each word size has one of its own, for what is shared.
std::vector<std::wstring> platformKeys();

} // namespace zandor::automation::registration
