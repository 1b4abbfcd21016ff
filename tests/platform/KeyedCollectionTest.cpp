#include <Zandor/platform/KeyedCollection.h>

#include "platform/errorNumber.h"

#include <gtest/gtest.h>

#include <random>

using namespace zandor;

using platform::Each;
using platform::KeyedCollection;
using platform::makeRef;

namespace {

class AKeyedCollection : public testing::Test {
protected:
    AKeyedCollection() {
        items.Add(makeRef<int>(30), u"c");
        items.Add(makeRef<int>(10), u"a");
        items.Add(makeRef<int>(20), u"b");
    }

    std::vector<int> walked() const {
        std::vector<int> result;
        for (const auto& item : Each<int>(items)) result.push_back(*item);
        return result;
    }

    KeyedCollection<int> items;
};

} // namespace

TEST_F(AKeyedCollection, KeepsTheOrderOfAdding) { EXPECT_EQ(walked(), (std::vector{30, 10, 20})); }

TEST_F(AKeyedCollection, CountsItsPositionsFromOne) {
    EXPECT_EQ(items.Count(), 3);
    EXPECT_EQ(*items.Item(1), 30);
    EXPECT_EQ(*items.Item(3), 20);
}

TEST_F(AKeyedCollection, RefusesAPositionOutsideItsCount) {
    for (const std::int32_t position : {-1, 0, 4})
        EXPECT_EQ(errorNumber([&] { items.Item(position); }), 9) << position;
}

TEST_F(AKeyedCollection, FindsByKeyToTheCase) {
    EXPECT_EQ(*items.Item(u"a"), 10);
    EXPECT_TRUE(items.Contains(u"a"));
    EXPECT_FALSE(items.Contains(u"A"));
    EXPECT_EQ(errorNumber([&] { items.Item(u"A"); }), 5);
}

TEST_F(AKeyedCollection, TakesAnItemAtAnyPositionUpToBehindTheLast) {
    items.Insert(1, makeRef<int>(1), u"x");
    items.Insert(5, makeRef<int>(9), u"y");
    EXPECT_EQ(walked(), (std::vector{1, 30, 10, 20, 9}));
    EXPECT_EQ(*items.Item(u"x"), 1);
    for (const std::int32_t position : {0, 7})
        EXPECT_EQ(errorNumber([&] { items.Insert(position, makeRef<int>(5), u"z"); }), 9);
    EXPECT_EQ(errorNumber([&] { items.Insert(1, makeRef<int>(5), u"y"); }), 457);
    EXPECT_EQ(items.Count(), 5);
}

TEST_F(AKeyedCollection, RefusesAKeyThatIsTakenAndStaysAsItWas) {
    EXPECT_EQ(errorNumber([&] { items.Add(makeRef<int>(99), u"a"); }), 457);
    EXPECT_EQ(walked(), (std::vector{30, 10, 20}));
}

TEST_F(AKeyedCollection, ClosesTheGapOfARemovedItem) {
    items.Remove(u"a");
    EXPECT_EQ(walked(), (std::vector{30, 20}));
    EXPECT_EQ(*items.Item(2), 20);
    items.Add(makeRef<int>(11), u"a");
    EXPECT_EQ(walked(), (std::vector{30, 20, 11}));
}

TEST_F(AKeyedCollection, RefusesToRemoveAKeyItLacks) {
    EXPECT_EQ(errorNumber([&] { items.Remove(u"d"); }), 5);
    EXPECT_EQ(items.Count(), 3);
}

TEST_F(AKeyedCollection, HasTheItemsBeforeAFailureUsedWhenAWalkFails) {
    struct Failing : KeyedCollection<int> {
        using KeyedCollection::Item;
        platform::Ref<int> Item(std::int32_t position) const override {
            if (position == 3) throw platform::errors::outOfMemory();
            return KeyedCollection::Item(position);
        }
    } failing;
    for (const char16_t* key : {u"a", u"b", u"c"}) failing.Add(makeRef<int>(1), key);
    int used = 0;
    EXPECT_EQ(errorNumber([&] {
                  for (const auto& item : Each<int>(failing)) used += *item;
              }),
              7);
    EXPECT_EQ(used, 2);
}

TEST(AnEmptyCollection, IsWalkedInNoStep) {
    const KeyedCollection<int> none;
    for (const auto& item : Each<int>(none)) FAIL() << *item;
    EXPECT_EQ(none.Count(), 0);
}

TEST(AKeyedCollectionOfMany, FindsEachByItsKeyWhateverCameAndWent) {
    std::mt19937 dice{7};
    KeyedCollection<int> items;
    std::vector<int> expected;
    for (int step = 0; step < 3000; ++step) {
        const auto count = static_cast<std::uint32_t>(expected.size());
        if (count > 0 && dice() % 3 == 0) {
            const auto at = static_cast<std::ptrdiff_t>(dice() % count);
            items.Remove(platform::decimal(expected[static_cast<std::size_t>(at)]));
            expected.erase(expected.begin() + at);
        } else {
            const auto at = static_cast<std::ptrdiff_t>(dice() % (count + 1));
            items.Insert(static_cast<std::int32_t>(at) + 1, makeRef<int>(step),
                         platform::decimal(step));
            expected.insert(expected.begin() + at, step);
        }
    }
    ASSERT_GT(expected.size(), 500U);
    std::int32_t position = 0;
    for (const int value : expected) {
        EXPECT_EQ(*items.Item(++position), value);
        EXPECT_EQ(*items.Item(platform::decimal(value)), value);
    }
    EXPECT_EQ(items.Count(), position);
    EXPECT_FALSE(items.Contains(u"3000"));
}
