#include <Zandor/platform/Numbers.h>

#include "platform/errorNumber.h"

#include <gtest/gtest.h>

#include <cfenv>
#include <cmath>
#include <limits>

using namespace zandor;

using platform::single;
using platform::toInteger;
using platform::toLong;

namespace {

constexpr double notANumber = std::numeric_limits<double>::quiet_NaN();
constexpr double infinity = std::numeric_limits<double>::infinity();

} // namespace

TEST(ConversionToSixteenBits, RoundsToTheNearest) {
    EXPECT_EQ(toInteger(2.49), 2);
    EXPECT_EQ(toInteger(2.51), 3);
    EXPECT_EQ(toInteger(-2.49), -2);
    EXPECT_EQ(toInteger(-2.51), -3);
}

TEST(ConversionToSixteenBits, RoundsHalvesToEven) {
    EXPECT_EQ(toInteger(0.5), 0);
    EXPECT_EQ(toInteger(1.5), 2);
    EXPECT_EQ(toInteger(2.5), 2);
    EXPECT_EQ(toInteger(3.5), 4);
    EXPECT_EQ(toInteger(-0.5), 0);
    EXPECT_EQ(toInteger(-1.5), -2);
    EXPECT_EQ(toInteger(-2.5), -2);
}

TEST(ConversionToSixteenBits, DoesNotFollowTheRoundingModeOfTheThread) {
    const int mode = std::fegetround();
    std::fesetround(FE_UPWARD);
    const auto up = toInteger(2.5);
    std::fesetround(FE_DOWNWARD);
    const auto down = toInteger(3.5);
    std::fesetround(mode);
    EXPECT_EQ(up, 2);
    EXPECT_EQ(down, 4);
}

TEST(ConversionToSixteenBits, ReachesBothEndsOfItsRange) {
    EXPECT_EQ(toInteger(32767.49), 32767);
    EXPECT_EQ(toInteger(-32768.5), -32768);
}

TEST(ConversionToSixteenBits, OverflowsOutsideItsRange) {
    for (const double value :
         {32767.5, 32768.0, -32768.51, -32769.0, 1e300, infinity, -infinity, notANumber})
        EXPECT_EQ(errorNumber([&] { toInteger(value); }), 6) << value;
}

TEST(ConversionToThirtyTwoBits, RoundsHalvesToEven) {
    EXPECT_EQ(toLong(65536.5), 65536);
    EXPECT_EQ(toLong(65537.5), 65538);
}

TEST(ConversionToThirtyTwoBits, ReachesBothEndsOfItsRange) {
    EXPECT_EQ(toLong(2147483647.25), 2147483647);
    EXPECT_EQ(toLong(-2147483648.5), std::numeric_limits<std::int32_t>::min());
}

TEST(ConversionToThirtyTwoBits, OverflowsOutsideItsRange) {
    for (const double value : {2147483647.5, 2147483648.0, -2147483649.0, infinity, notANumber})
        EXPECT_EQ(errorNumber([&] { toLong(value); }), 6) << value;
}

TEST(SinglePrecision, RoundsOnce) {
    EXPECT_EQ(single(0.1), 0.1F);
    EXPECT_NE(static_cast<double>(single(0.1)), 0.1);
    EXPECT_EQ(single(16777217.0), 16777216.0F);
}

TEST(SinglePrecision, OverflowsWhereNoFiniteSingleIsNear) {
    EXPECT_EQ(single(std::numeric_limits<float>::max()), std::numeric_limits<float>::max());
    for (const double value : {1e39, -1e39, infinity, notANumber})
        EXPECT_EQ(errorNumber([&] { single(value); }), 6) << value;
}
