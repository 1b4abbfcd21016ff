#pragma once

#include <Zandor/platform/String.h>

#include <cstddef>
#include <cstdint>
#include <string>
#include <vector>

namespace zandor::platform::qt {

/// What the entries of a list say, in one piece and a byte for each letter where that will do: a
/// drawing has thousands of entries, and few of them are ever asked for by themselves.
class EntryTexts {
public:
    int count() const { return static_cast<int>(mEnds.size()); }

    /// By row.
    String text(int row) const;
    String key(int row) const;
    bool reads(int row, StringView text) const;

    void add(StringView key, StringView text);
    void clear() { *this = {}; }
    /// Gives back what there was room for beyond the last entry.
    void squeeze();

private:
    /// Where a text and the key behind it end. What takes two bytes a letter is wide.
    struct Ends {
        std::uint32_t text : 30;
        std::uint32_t textIsWide : 1;
        std::uint32_t keyIsText : 1; ///< and stands there once
        std::uint32_t key : 31;
        std::uint32_t keyIsWide : 1;
    };

    const Ends& ends(int row) const { return mEnds[static_cast<std::size_t>(row)]; }
    std::size_t begin(int row) const { return row == 0 ? 0 : ends(row - 1).key; }
    bool append(StringView text);
    String unpacked(std::size_t from, std::size_t to, bool wide) const;

    std::string mBytes;
    std::vector<Ends> mEnds;
};

} // namespace zandor::platform::qt
