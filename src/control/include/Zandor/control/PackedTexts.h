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
    /// Until the next change.
    platform::StringView operator[](std::size_t n) const {
        const std::size_t from = n == 0 ? 0 : mEnds[n - 1];
        return platform::StringView(mAll).substr(from, mEnds[n] - from);
    }

    /// All stay as they were when there is no memory for it.
    void set(std::size_t n, platform::StringView value) {
        const std::size_t from = n == 0 ? 0 : mEnds[n - 1];
        const std::size_t before = mEnds[n] - from;
        platform::String all;
        all.reserve(mAll.size() - before + value.size());
        all.append(mAll, 0, from).append(value).append(mAll, mEnds[n]);
        mAll.swap(all);
        for (; n < count; ++n)
            mEnds[n] = static_cast<std::uint32_t>(mEnds[n] + value.size() - before);
    }

private:
    platform::String mAll;
    std::array<std::uint32_t, count> mEnds{};
};

} // namespace TalvikDBxZandor
