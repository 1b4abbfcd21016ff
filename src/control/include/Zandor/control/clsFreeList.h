#pragma once

#include <Zandor/platform/Toolkit.h>
#include <Zandor/platform/export.h>

#include <vector>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// Hands out the lowest free index of a fixed range and takes indexes back. Every failure is
/// reported in a box; the member then returns its result as it stood and changes no count.
class ZANDOR_CONTROL_EXPORT clsFreeList {
public:
    // The module name lacks the "DBx" of its siblings; reports have always read so.
    static constexpr platform::StringView ModuleName = u"TalvikZandor.clsFreeList";

    explicit clsFreeList(platform::MessageBoxes& boxes) : mBoxes(boxes) {}

    /// Makes every index of From to To free. False, and nothing changed, for a range of fewer than
    /// two indexes.
    bool CreateList(std::int32_t From, std::int32_t To);

    /// A new list over From to To, or nothing where CreateList refuses the range. Does not touch
    /// the list it is called on.
    platform::Ref<clsFreeList> CreateFreeList(std::int32_t From, std::int32_t To) const;

    /// Takes the lowest free index. False, and Index unchanged, when none is free.
    bool GetNextFreeIndex(std::int32_t& Index);

    /// Gives an index back, without asking whether it was in use: freeing it twice counts twice.
    /// Error 9 outside RangeFrom to RangeTo + 1 and on a list never created.
    bool FreeIndex(std::int32_t Index);

    /// An index outside the range, and any index of a list never created, reads as free.
    bool IsFree(std::int32_t Index) const;

    std::int32_t FreeCount() const;
    std::int32_t RangeFrom() const;
    std::int32_t RangeTo() const;

private:
    template <class Body>
    void Guard(platform::StringView procedure, Body&& body) const;
    std::size_t Position(std::int64_t Index) const;

    platform::MessageBoxes& mBoxes;
    std::int32_t mRangeFrom = 0;
    std::int32_t mRangeTo = 0;
    std::int32_t mFreeCount = 0;
    std::vector<bool> mInUse; ///< one position more than the range; the last is never handed out
    bool mCreated = false;
};

} // namespace TalvikDBxZandor
