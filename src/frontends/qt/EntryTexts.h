#pragma once

#include <Zandor/platform/String.h>

#include <cstddef>
#include <vector>

namespace zandor::platform::qt {

/// What the entries of a list say, in one piece: a drawing has thousands of entries, and few of
/// them are ever asked for by themselves.
class EntryTexts {
public:
    int count() const { return static_cast<int>(mEnds.size()); }

    /// By row; until the next change.
    StringView text(int row) const {
        const std::size_t from = begin(row);
        return StringView(mAll).substr(from, end(row).text - from);
    }
    StringView key(int row) const {
        const End& ends = end(row);
        return ends.keyIsText ? text(row)
                              : StringView(mAll).substr(ends.text, ends.key - ends.text);
    }

    void add(StringView key, StringView text) {
        // What an attempt that failed has left goes.
        mAll.resize(begin(count()));
        mAll += text;
        const auto textEnd = static_cast<std::uint32_t>(mAll.size());
        const bool same = key == text;
        if (!same) mAll += key;
        mEnds.push_back({textEnd, static_cast<std::uint32_t>(mAll.size()) & 0x7FFFFFFFU, same});
    }

    void clear() { *this = {}; }

    /// Gives back what there was room for beyond the last entry.
    void squeeze() {
        mAll.shrink_to_fit();
        mEnds.shrink_to_fit();
    }

private:
    struct End {
        std::uint32_t text;
        std::uint32_t key : 31;
        std::uint32_t keyIsText : 1;
    };

    const End& end(int row) const { return mEnds[static_cast<std::size_t>(row)]; }
    std::size_t begin(int row) const { return row == 0 ? 0 : end(row - 1).key; }

    String mAll; ///< each text with its key behind it
    std::vector<End> mEnds;
};

} // namespace zandor::platform::qt
