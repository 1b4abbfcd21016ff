#include "frontends/headless/Bench.h"

using namespace zandor;

namespace {

TEST(AWindowMessage, HasOneNumberForAName) {
    Bench bench;
    const auto first = bench.toolkit.RegisterWindowMessage(u"ONE");
    EXPECT_GT(first, 0U);
    EXPECT_EQ(bench.toolkit.RegisterWindowMessage(u"ONE"), first);
    EXPECT_NE(bench.toolkit.RegisterWindowMessage(u"TWO"), first);
    bench.toolkit.registrationFails = true;
    EXPECT_EQ(bench.toolkit.RegisterWindowMessage(u"ONE"), 0U);
}

TEST(AWindowMessage, IsKeptUnderItsName) {
    Bench bench;
    bench.toolkit.RegisterWindowMessage(u"ONE");
    const auto two = bench.toolkit.RegisterWindowMessage(u"TWO");
    std::int32_t scratch = 0;
    bench.toolkit.SendMessage(two, 1, &scratch);
    ASSERT_EQ(bench.toolkit.messages().size(), 1U);
    EXPECT_EQ(bench.toolkit.messages()[0].name, u"TWO");
    EXPECT_EQ(bench.toolkit.messages()[0].wParam, 1U);
    EXPECT_TRUE(bench.toolkit.messages()[0].hasLParam);
    EXPECT_FALSE(bench.toolkit.messages()[0].menuOpen);
}

TEST(TheSurroundings, CanBeTold) {
    Bench bench;
    EXPECT_EQ(bench.toolkit.AmbientFont(), (platform::Font{u"Segoe UI", 9}));
    EXPECT_EQ(bench.toolkit.ControlFont(), (platform::Font{u"Comic Sans MS", 8.25F}));
    EXPECT_EQ(bench.toolkit.TextWidth(u"ORDERS"), 540);
    int resized = 0;
    bench.toolkit.onResize = [&] { ++resized; };
    bench.user.resizeControl(12000, 9000);
    EXPECT_EQ(resized, 1);
    EXPECT_EQ(bench.toolkit.ScaleWidth(), 12000);
    EXPECT_EQ(bench.toolkit.ScaleHeight(), 9000);
}

TEST(AControl, TakesItsContainersFontUnlessItHasItsOwn) {
    Bench bench;
    auto frame = bench.toolkit.makeFrame({.Name = u"fra", .FontName = u"Arial"}, {});
    auto label = bench.toolkit.makeLabel({.Name = u"lbl", .Container = frame.get()});
    auto grid = bench.toolkit.makeGrid({.Name = u"spr"}, 2, 2, {});
    EXPECT_EQ(bench.look<headless::Label>("lbl").look().font.Name, u"Arial");
    EXPECT_EQ(bench.look<headless::Grid>("spr").look().font.Name, u"Comic Sans MS");
}

TEST(AName, BelongsToTheControlThatLives) {
    Bench bench;
    auto line = bench.toolkit.makeLine({.Name = u"linJoin", .Container = bench.canvas.get()}, 4);
    EXPECT_TRUE(bench.toolkit.exists("linJoin(4)"));
    EXPECT_FALSE(bench.look<headless::Line>("linJoin(4)").shown());
    line = nullptr;
    EXPECT_FALSE(bench.toolkit.exists("linJoin(4)"));
    EXPECT_TRUE(bench.toolkit.surface().children().size() == 1);
}

TEST(AFault, StrikesTheNamedCallOnceAndLeavesItUndone) {
    Bench bench;
    auto grid = bench.toolkit.makeGrid({.Name = u"spr"}, 2, 2, {});
    bench.toolkit.faults.failNext("spr.TextMatrix=", platform::errors::overflow());
    EXPECT_EQ(grid->TextMatrix(1, 1), u"");
    EXPECT_EQ(errorOf([&] { grid->TextMatrix(1, 1, u"x"); }), 6);
    EXPECT_EQ(grid->TextMatrix(1, 1), u"");
    grid->TextMatrix(1, 1, u"x");
    EXPECT_EQ(grid->TextMatrix(1, 1), u"x");
}

TEST(AFault, StrikesTheNthCall) {
    Bench bench;
    bench.toolkit.faults.failNext("TextWidth", platform::errors::outOfMemory(), 3);
    bench.toolkit.TextWidth(u"");
    bench.toolkit.TextWidth(u"");
    EXPECT_EQ(errorOf([&] { bench.toolkit.TextWidth(u""); }), 7);
    EXPECT_FALSE(bench.toolkit.faults.isArmed("TextWidth"));
}

TEST(AFault, CanBeAnyException) {
    Bench bench;
    bench.toolkit.faults.failNext("MsgBox", std::runtime_error("no screen"));
    EXPECT_THROW(bench.toolkit.MsgBox(u"", 0, u""), std::runtime_error);
    EXPECT_TRUE(bench.toolkit.boxes().empty());
}

TEST(AFault, StrikesAnyElementOfAControlArrayByTheArraysName) {
    Bench bench;
    auto one = bench.table(1);
    auto two = bench.table(2);
    bench.toolkit.faults.failNext("lstTable.ZOrder", platform::errors::invalidProcedureCall());
    EXPECT_EQ(errorOf([&] { two->ZOrder(); }), 5);
    bench.toolkit.faults.failNext("lstTable(1).setBounds", platform::errors::overflow());
    two->Left(5);
    EXPECT_EQ(errorOf([&] { one->Left(5); }), 6);
    EXPECT_EQ(one->Left(), 1000);
}

TEST(Calls, CanBeRemembered) {
    Bench bench;
    bench.toolkit.TextWidth(u"");
    bench.toolkit.faults.remember(true);
    bench.canvas->ZOrder();
    bench.toolkit.ScaleWidth();
    EXPECT_EQ(bench.toolkit.faults.calls(),
              (std::vector<std::string>{"fraTable.ZOrder", "ScaleWidth"}));
}

} // namespace
