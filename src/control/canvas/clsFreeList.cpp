#include <Zandor/control/clsFreeList.h>

#include <Zandor/control/basZandor.h>

#include <limits>

namespace TalvikDBxZandor {

namespace {

/// 32-bit arithmetic as the runtime does it: a result out of range is an overflow.
std::int32_t toLongExact(std::int64_t value) {
    if (value < std::numeric_limits<std::int32_t>::min() ||
        value > std::numeric_limits<std::int32_t>::max())
        throw platform::errors::overflow();
    return static_cast<std::int32_t>(value);
}

} // namespace

template <class Body>
void clsFreeList::Guard(platform::StringView procedure, Body&& body) const {
    basZandor::Guard(mBoxes, ModuleName, procedure, std::forward<Body>(body));
}

std::size_t clsFreeList::Position(std::int64_t Index) const {
    const std::int64_t position = toLongExact(Index - mRangeFrom);
    if (position < 0 || position >= static_cast<std::int64_t>(mInUse.size()))
        throw platform::errors::subscriptOutOfRange();
    return static_cast<std::size_t>(position);
}

bool clsFreeList::CreateList(std::int32_t From, std::int32_t To) {
    bool result = false;
    Guard(u"CreateList", [&] {
        const std::int32_t span = toLongExact(std::int64_t{To} - From);
        if (span < 1) return;
        const std::int32_t count = toLongExact(std::int64_t{span} + 1);
        mInUse.assign(static_cast<std::size_t>(count) + 1, false);
        mRangeFrom = From;
        mRangeTo = To;
        mFreeCount = count;
        mCreated = true;
        result = true;
    });
    return result;
}

platform::Ref<clsFreeList> clsFreeList::CreateFreeList(std::int32_t From, std::int32_t To) const {
    platform::Ref<clsFreeList> result;
    Guard(u"CreateFreeList", [&] {
        auto list = platform::makeRef<clsFreeList>(mBoxes);
        if (list->CreateList(From, To)) result = list;
    });
    return result;
}

bool clsFreeList::GetNextFreeIndex(std::int32_t& Index) {
    bool result = false;
    Guard(u"GetNextFreeIndex", [&] {
        for (std::int64_t i = mRangeFrom; i <= mRangeTo; ++i) {
            const std::size_t position = Position(i);
            if (mInUse[position]) continue;
            mInUse[position] = true;
            mFreeCount = toLongExact(std::int64_t{mFreeCount} - 1);
            Index = static_cast<std::int32_t>(i);
            result = true;
            return;
        }
    });
    return result;
}

bool clsFreeList::FreeIndex(std::int32_t Index) {
    bool result = false;
    Guard(u"FreeIndex", [&] {
        mInUse[Position(Index)] = false;
        mFreeCount = toLongExact(std::int64_t{mFreeCount} + 1);
        result = true;
    });
    return result;
}

bool clsFreeList::IsFree(std::int32_t Index) const {
    bool result = false;
    Guard(u"P_GET IsFree", [&] {
        result = !mCreated || Index < mRangeFrom || Index > mRangeTo || !mInUse[Position(Index)];
    });
    return result;
}

std::int32_t clsFreeList::FreeCount() const {
    std::int32_t result = 0;
    Guard(u"P_GET FreeCount", [&] { result = mFreeCount; });
    return result;
}

std::int32_t clsFreeList::RangeFrom() const {
    std::int32_t result = 0;
    Guard(u"P_GET RangeFrom", [&] { result = mRangeFrom; });
    return result;
}

std::int32_t clsFreeList::RangeTo() const {
    std::int32_t result = 0;
    // Reports under RangeFrom's name, as it always has.
    Guard(u"P_GET RangeFrom", [&] { result = mRangeTo; });
    return result;
}

} // namespace TalvikDBxZandor
