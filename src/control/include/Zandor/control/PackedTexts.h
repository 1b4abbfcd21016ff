#pragma once

#include <Zandor/platform/String.h>

#include <array>
#include <cstddef>
#include <cstdint>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// A few short texts in one piece: there is a record of them for each join of a drawing, and a
/// text of its own takes as much room as three of their words.
template <std::size_t count>
class PackedTexts {
public:
    PackedTexts() { mAll.reserve(most); }

    /// Until the next change.
    platform::StringView operator[](std::size_t n) const {
        const std::size_t from = n == 0 ? 0 : mEnds[n - 1];
        return platform::StringView(mAll).substr(from, mEnds[n] - from);
    }

    /// All stay as they were when there is no memory for it, which short ones need none of.
    void set(std::size_t n, platform::StringView value) {
        const std::size_t from = n == 0 ? 0 : mEnds[n - 1];
        const std::size_t before = mEnds[n] - from;
        mAll.replace(from, before, value);
        for (; n < count; ++n)
            mEnds[n] = static_cast<std::uint32_t>(mEnds[n] + value.size() - before);
    }

private:
    static constexpr std::size_t most = 39; ///< code units of a usual join

    platform::String mAll;
    std::array<std::uint32_t, count> mEnds{};
};

} // namespace TalvikDBxZandor
