#include "frontends/headless/Bench.h"

namespace {

TEST(TheFocus, FiresGotFocusOnlyWhenItReallyMoves) {
    Bench bench;
    int got = 0;
    auto table = bench.table(1);
    bench.tableEvents.back().GotFocus = [&](std::int16_t) { ++got; };
    table->SetFocus();
    table->SetFocus();
    EXPECT_EQ(got, 1);
    EXPECT_TRUE(bench.look<headless::Tabulet>("lstTable(1)").focused());
}

TEST(TheFocus, IsHeldByOneControlAtATime) {
    Bench bench;
    auto text = bench.toolkit.makeTextBox({.Name = u"txtValue"}, {});
    auto combo = bench.toolkit.makeComboBox({.Name = u"cobSortOrder"}, {}, {});
    text->SetFocus();
    combo->SetFocus();
    EXPECT_FALSE(bench.look<headless::TextBox>("txtValue").focused());
    EXPECT_TRUE(bench.look<headless::ComboBox>("cobSortOrder").focused());
}

TEST(TheFocus, IsRefusedByWhatIsDisabledOrStandsInSomethingInvisible) {
    Bench bench;
    auto frame = bench.toolkit.makeFrame({.Name = u"fraValue"}, {});
    auto text = bench.toolkit.makeTextBox({.Name = u"txtValue", .Container = frame.get()}, {});
    auto combo = bench.toolkit.makeComboBox({.Name = u"cobSortOrder"}, {}, {});
    frame->Visible(false);
    EXPECT_EQ(errorOf([&] { text->SetFocus(); }), 5);
    combo->Enabled(false);
    EXPECT_EQ(errorOf([&] { combo->SetFocus(); }), 5);
    EXPECT_EQ(bench.toolkit.focus(), nullptr);
}

TEST(TheFocus, LeavesAControlThatIsHiddenWithItsContainer) {
    Bench bench;
    auto frame = bench.toolkit.makeFrame({.Name = u"fraValue"}, {});
    auto text = bench.toolkit.makeTextBox({.Name = u"txtValue", .Container = frame.get()}, {});
    text->SetFocus();
    frame->Visible(false);
    EXPECT_EQ(bench.toolkit.focus(), nullptr);
}

TEST(TheFocus, LeavesAControlThatIsDestroyed) {
    Bench bench;
    auto text = bench.toolkit.makeTextBox({.Name = u"txtValue"}, {});
    text->SetFocus();
    text.reset();
    EXPECT_EQ(bench.toolkit.focus(), nullptr);
}

TEST(TheFocus, IsGivenByTheUsersClickBeforeTheClickItself) {
    Bench bench;
    std::string order;
    auto home = bench.toolkit.makeCommandButton(
        {.Name = u"cmdHome"},
        {.Click = [&] { order += "click "; }, .GotFocus = [&] { order += "focus "; }});
    bench.user.clickButton("cmdHome");
    bench.user.clickButton("cmdHome");
    EXPECT_EQ(order, "focus click click ");
}

TEST(ADisabledButton, TakesAClickWithoutEffect) {
    Bench bench;
    int clicks = 0;
    auto home = bench.toolkit.makeCommandButton({.Name = u"cmdHome"},
                                                {.Click = [&] { ++clicks; }, .GotFocus = {}});
    home->Enabled(false);
    bench.user.clickButton("cmdHome");
    EXPECT_EQ(clicks, 0);
}

TEST(TheUser, CannotTouchWhatIsNotShown) {
    Bench bench;
    auto frame = bench.toolkit.makeFrame({.Name = u"fraValue"}, {});
    auto set = bench.toolkit.makeCommandButton({.Name = u"cmdSet", .Container = frame.get()}, {});
    frame->Visible(false);
    EXPECT_THROW(bench.user.clickButton("cmdSet"), std::logic_error);
    EXPECT_THROW(bench.user.clickButton("cmdNone"), std::logic_error);
    EXPECT_THROW(bench.user.clickButton("fraValue"), std::logic_error);
}

TEST(ZOrder, BringsAFrameBeforeItsSiblings) {
    Bench bench;
    auto second = bench.toolkit.makeFrame({.Name = u"fraValue"}, {});
    auto third = bench.toolkit.makeFrame({.Name = u"fraSortOrder"}, {});
    second->ZOrder();
    std::vector<std::string> order;
    for (const auto* child : bench.toolkit.surface().children()) order.push_back(child->name());
    EXPECT_EQ(order, (std::vector<std::string>{"fraTable", "fraSortOrder", "fraValue"}));
}

} // namespace
