#include <Zandor/control/ControlArray.h>

#include "RecordingBoxes.h"

#include <gtest/gtest.h>

#include <vector>

using namespace zandor;

using TalvikDBxZandor::ControlArray;

namespace {

struct Element {
    std::int16_t index;
    const Element* pattern;
};

class AControlArray : public testing::Test {
protected:
    AControlArray()
        : elements(life, [this](std::int16_t index, const Element* pattern) {
              if (index == failing) throw platform::errors::outOfMemory();
              return platform::makeRef<Element>(Element{index, pattern});
          }) {}

    template <class Body>
    platform::RuntimeError errorOf(Body&& body) {
        try {
            body();
        } catch (const platform::RuntimeError& error) {
            return error;
        }
        return {};
    }

    std::vector<std::int16_t> indexes() const {
        std::vector<std::int16_t> result;
        for (const auto& [index, element] : elements) result.push_back(index);
        return result;
    }

    RecordingBoxes boxes;
    TalvikDBxZandor::Life life{boxes, {}};
    std::int16_t failing = -1;
    ControlArray<Element> elements;
};

} // namespace

TEST_F(AControlArray, HasElementZeroFromDesignTimeOn) {
    EXPECT_EQ(elements.Count(), 1U);
    EXPECT_EQ(elements(0)->index, 0);
    EXPECT_EQ(elements(0)->pattern, nullptr);
}

TEST_F(AControlArray, HasNoElementWhoseIndexOnlyEndsLikeOne) {
    elements.Load(5);
    for (const std::int32_t index : {65536 + 5, 5 - 65536}) {
        EXPECT_FALSE(elements.Find(index)) << index;
        EXPECT_EQ(elements.Peek(index), nullptr);
        EXPECT_EQ(errorOf([&] { elements(index); }).Number, 340);
    }
}

TEST_F(AControlArray, LoadsItsElementsAfterThePatternOfElementZero) {
    elements.Load(5);
    EXPECT_EQ(elements(5)->index, 5);
    EXPECT_EQ(elements(5)->pattern, elements(0).get());
}

TEST_F(AControlArray, IsWalkedByAscendingIndexWhateverTheOrderOfLoading) {
    for (const std::int16_t index : {9, 2, 5}) elements.Load(index);
    EXPECT_EQ(indexes(), (std::vector<std::int16_t>{0, 2, 5, 9}));
}

TEST_F(AControlArray, IsWalkedOnWhileElementsComeAndGo) {
    elements.Load(2);
    elements.Load(3);
    std::vector<std::int16_t> seen;
    for (const auto& [index, element] : elements) {
        seen.push_back(index);
        if (index != 2) continue;
        elements.Unload(3);
        elements.Load(40);
        EXPECT_EQ(element->index, 2);
    }
    EXPECT_EQ(seen, (std::vector<std::int16_t>{0, 2, 40}));
}

TEST_F(AControlArray, RefusesToLoadAnElementTwice) {
    elements.Load(3);
    const Element* const held = elements(3).get();
    EXPECT_EQ(errorOf([&] { elements.Load(3); }).Number, 360);
    EXPECT_EQ(errorOf([&] { elements.Load(0); }).Number, 360);
    EXPECT_EQ(elements(3).get(), held);
}

TEST_F(AControlArray, RefusesToUnloadTheElementOfDesignTime) {
    EXPECT_EQ(errorOf([&] { elements.Unload(0); }).Number, 362);
    EXPECT_EQ(elements.Count(), 1U);
}

TEST_F(AControlArray, NamesTheElementThatDoesNotExist) {
    const auto expected = platform::String(u"Control array element '7' doesn't exist");
    EXPECT_EQ(errorOf([&] { elements(7); }).Description, expected);
    EXPECT_EQ(errorOf([&] { elements.Unload(7); }).Description, expected);
    EXPECT_EQ(errorOf([&] { elements(-1); }).Number, 340);
    EXPECT_EQ(errorOf([&] { elements.Load(-1); }).Number, 340);
}

TEST_F(AControlArray, DoesNotMistakeALongIndexForAShortOne) {
    EXPECT_EQ(errorOf([&] { elements(65536); }).Description,
              u"Control array element '65536' doesn't exist");
}

TEST_F(AControlArray, CanLoadAnUnloadedElementAgain) {
    elements.Load(3);
    elements.Unload(3);
    EXPECT_EQ(errorOf([&] { elements(3); }).Number, 340);
    elements.Load(3);
    EXPECT_EQ(elements(3)->index, 3);
}

TEST_F(AControlArray, StaysAsItWasWhenAnElementCannotBeMade) {
    failing = 4;
    EXPECT_EQ(errorOf([&] { elements.Load(4); }).Number, 7);
    EXPECT_EQ(indexes(), (std::vector<std::int16_t>{0}));
    failing = -1;
    elements.Load(4);
    EXPECT_EQ(elements.Count(), 2U);
}
