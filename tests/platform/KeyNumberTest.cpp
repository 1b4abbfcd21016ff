#include <Zandor/control/KeyNumber.h>

#include <Zandor/platform/RuntimeError.h>

#include <gtest/gtest.h>

using namespace zandor;

using TalvikDBxZandor::isKeyOfNumber;
using TalvikDBxZandor::keyOfNumber;
using TalvikDBxZandor::numberOfKey;

TEST(TheNumberOfAKey, IsItsLeadingDigitsAfterTheFirstCharacter) {
    EXPECT_EQ(numberOfKey(u"x7"), 7);
    EXPECT_EQ(numberOfKey(u"K0042rest9"), 42);
    EXPECT_EQ(numberOfKey(u"77"), 7);
}

TEST(TheNumberOfAKey, IsZeroWithoutDigits) {
    for (const platform::StringView key : {u"", u"x", u"xy7", u"x-7", u"x 7"})
        EXPECT_EQ(numberOfKey(key), 0) << platform::toUtf8(key);
}

TEST(TheNumberOfAKey, OverflowsBeyondThirtyTwoBits) {
    EXPECT_EQ(numberOfKey(u"x2147483647"), 2147483647);
    EXPECT_THROW(numberOfKey(u"x2147483648"), platform::RuntimeError);
    EXPECT_THROW(numberOfKey(u"x" + platform::String(400, u'9')), platform::RuntimeError);
}

TEST(AKeyOfANumber, LeadsBackToItself) {
    for (const std::int32_t number : {0, 1, 10, 2147483647}) {
        EXPECT_TRUE(isKeyOfNumber(keyOfNumber(number))) << number;
        EXPECT_EQ(numberOfKey(keyOfNumber(number)), number);
    }
}

TEST(AKeyOfAnotherForm, IsNotTakenForOneOfANumber) {
    for (const platform::StringView key :
         {u"", u"x", u"7", u"X7", u"y7", u"x7 ", u"x007", u"x+7", u"x-7", u"x7a", u"x2147483648",
          u"x99999999999999999999"})
        EXPECT_FALSE(isKeyOfNumber(key)) << platform::toUtf8(key);
}
