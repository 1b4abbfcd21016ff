#include "frontends/headless/Bench.h"

using namespace zandor;

namespace {

TEST(TheFocus, LeavesWhatIsDisabled) {
    Bench bench;
    const auto combo = bench.toolkit.makeComboBox({.Name = u"cob"}, {}, {});
    combo->SetFocus();
    combo->Enabled(false);
    EXPECT_EQ(bench.toolkit.focus(), nullptr);
}

TEST(AScrollBar, HasPagesOfSomething) {
    Bench bench;
    const auto bar =
        bench.toolkit.makeScrollBar({.Name = u"hsb"}, platform::Orientation::horizontal, {});
    EXPECT_EQ(errorOf([&] { bar->LargeChange(0); }), 380);
    bar->LargeChange(1);
    EXPECT_EQ(bench.look<headless::ScrollBar>("hsb").largeChange(), 1);
}

TEST(ATableList, HasNoEntryOnItsBorderNorBelowIt) {
    Bench bench;
    const auto table = bench.table(1, {}, u'Z');
    EXPECT_TRUE(table->ColumnAt(1000, 2000 - headless::tabuletBorder - 1));
    EXPECT_FALSE(table->ColumnAt(1000, 2000 - headless::tabuletBorder));
    EXPECT_FALSE(table->ColumnAt(1000, 2100));
}

TEST(ATableList, BeginsAtItsTopAgainOnceItWasEmptied) {
    Bench bench;
    const auto table = bench.table(1);
    bench.user.scrollList("lstTable(1)", 3);
    table->Terminate();
    table->ColumnItems().Add(u"k", u"A");
    EXPECT_EQ(bench.look<headless::Tabulet>("lstTable(1)").firstVisible(), 1);
}

TEST(ATableThatIsHeld, StaysInTheHandWhenItIsUnlocked) {
    Bench bench;
    const auto table = bench.table(1);
    bench.user.onHeld = [&] { table->Locked(false); };
    bench.user.moveTable("lstTable(1)", 3000, 2500);
    EXPECT_EQ(table->bounds(), (platform::Bounds{3000, 2500, 2000, 2000}));
}

TEST(ADrag, EndsWithItsOwnTableOnly) {
    Bench bench;
    const auto first = bench.table(1);
    const auto second = bench.table(2);
    first->Drag(1);
    second->Unload();
    EXPECT_EQ(bench.toolkit.dragged(), first.get());
    first->Unload();
    EXPECT_EQ(bench.toolkit.dragged(), nullptr);
}

TEST(AMenu, IsKnownToBeOpenWhileItIsAndNotOpenedByAClosedWindow) {
    Bench bench;
    const auto menu = bench.toolkit.makePopupMenu({.Name = u"mnu"}, {});
    const auto number = bench.toolkit.RegisterWindowMessage(u"ONE");
    int opened = 0;
    bench.toolkit.onMenu = [&](const headless::PopupMenu&) {
        ++opened;
        bench.toolkit.SendMessage(number, 0, nullptr);
        return std::string();
    };
    menu->PopupMenuAtMouse();
    ASSERT_EQ(bench.toolkit.messages().size(), 1U);
    EXPECT_TRUE(bench.toolkit.messages()[0].menuOpen);
    bench.toolkit.close();
    menu->PopupMenuAtMouse();
    EXPECT_EQ(opened, 1);
}

} // namespace
