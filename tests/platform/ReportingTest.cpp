#include <Zandor/control/basZandor.h>

#include "RecordingBoxes.h"

#include <gtest/gtest.h>

#include <stdexcept>

using namespace zandor;

namespace basZandor = TalvikDBxZandor::basZandor;
using platform::RuntimeError;

TEST(AnUnexpectedError, IsShownInFourLinesWithAnExclamation) {
    RecordingBoxes boxes;
    basZandor::ReportError(boxes, {91, u"Object variable not set"}, u"TalvikDBxZandor.Zandor",
                           u"P_GET DebugSwitch");
    ASSERT_EQ(boxes.shown.size(), 1U);
    EXPECT_EQ(boxes.shown[0].prompt, u"Module:\tTalvikDBxZandor.Zandor\r\n"
                                     u"Function:\tP_GET DebugSwitch\r\n"
                                     u"Error No:\t91\r\n"
                                     u"Error:\tObject variable not set");
    EXPECT_EQ(boxes.shown[0].title, u"Unexpected Error:");
    EXPECT_EQ(boxes.shown[0].style, 48);
}

TEST(AnUnexpectedError, KeepsTheMinusSignOfItsNumberAndHasNoBlankBeforeIt) {
    RecordingBoxes boxes;
    basZandor::ReportError(boxes, {-2147467259, u"Unspecified error"}, u"M", u"F");
    EXPECT_EQ(boxes.shown.at(0).prompt,
              u"Module:\tM\r\nFunction:\tF\r\nError No:\t-2147467259\r\nError:\tUnspecified error");
}

TEST(AnUnexpectedError, KeepsItsFourLinesWithoutADescription) {
    RecordingBoxes boxes;
    basZandor::ReportError(boxes, {0, {}}, u"", u"");
    EXPECT_EQ(boxes.shown.at(0).prompt, u"Module:\t\r\nFunction:\t\r\nError No:\t0\r\nError:\t");
}

TEST(ADebugMessage, IsShownInThreeLinesWithAnExclamation) {
    RecordingBoxes boxes;
    basZandor::DebugMessage(boxes, u"Left Table Name: ORDERS", u"TalvikDBxZandor.frmJoinDefinition",
                            u"P_SET Join");
    ASSERT_EQ(boxes.shown.size(), 1U);
    EXPECT_EQ(boxes.shown[0].prompt, u"Module:\tTalvikDBxZandor.frmJoinDefinition\r\n"
                                     u"Function:\tP_SET Join\r\n"
                                     u"Message:\tLeft Table Name: ORDERS");
    EXPECT_EQ(boxes.shown[0].title, u"Debug Message:");
    EXPECT_EQ(boxes.shown[0].style, 48);
}

TEST(AGuardedProcedure, ReportsItsErrorOnceUnderItsNameAndSkipsTheRest) {
    RecordingBoxes boxes;
    std::int16_t result = 0;
    bool reachedTheEnd = false;
    basZandor::Guard(boxes, u"TalvikDBxZandor.Zandor", u"P_GET DebugSwitch", [&] {
        result = 5;
        if (result == 5) throw RuntimeError{91, u"D"};
        reachedTheEnd = true;
    });
    EXPECT_EQ(boxes.shown, std::vector{unexpectedError(u"TalvikDBxZandor.Zandor",
                                                       u"P_GET DebugSwitch", u"91", u"D")});
    EXPECT_EQ(result, 5) << "the result stays as it stood";
    EXPECT_FALSE(reachedTheEnd);
}

TEST(AGuardedProcedure, ShowsNoBoxWhenNothingFails) {
    RecordingBoxes boxes;
    bool ran = false;
    basZandor::Guard(boxes, u"M", u"F", [&] { ran = true; });
    EXPECT_TRUE(ran);
    EXPECT_TRUE(boxes.shown.empty());
}

TEST(AGuardedProcedure, ReportsAnythingThatIsThrown) {
    RecordingBoxes boxes;
    basZandor::Guard(boxes, u"M", u"F", [] { throw std::bad_alloc(); });
    basZandor::Guard(boxes, u"M", u"F", [] { throw std::runtime_error("no connection"); });
    basZandor::Guard(boxes, u"M", u"F", [] { throw 1; });
    EXPECT_EQ(boxes.shown, (std::vector{unexpectedError(u"M", u"F", u"7", u"Out of memory"),
                                        unexpectedError(u"M", u"F", u"440", u"no connection"),
                                        unexpectedError(u"M", u"F", u"440", u"Automation error")}));
}

TEST(AGuardedProcedure, DoesNotTellItsCaller) {
    RecordingBoxes boxes;
    bool callerWentOn = false;
    basZandor::Guard(boxes, u"M", u"Outer", [&] {
        basZandor::Guard(boxes, u"M", u"Inner", [] { throw RuntimeError{5, u"D"}; });
        callerWentOn = true;
    });
    EXPECT_TRUE(callerWentOn);
    EXPECT_EQ(boxes.shown, std::vector{unexpectedError(u"M", u"Inner", u"5", u"D")});
}

TEST(AReportThatFails, EndsItsProcedureAllTheSame) {
    struct BrokenBoxes : platform::MessageBoxes {
        void MsgBox(const platform::String&, std::int32_t, const platform::String&) override {
            ++tried;
            throw std::runtime_error("no display");
        }
        int tried = 0;
    } boxes;
    bool callerWentOn = false;
    basZandor::Guard(boxes, u"M", u"Outer", [&] {
        basZandor::Guard(boxes, u"M", u"Inner", [] { throw RuntimeError{5, u"D"}; });
        callerWentOn = true;
    });
    EXPECT_EQ(boxes.tried, 1);
    EXPECT_TRUE(callerWentOn);
}
