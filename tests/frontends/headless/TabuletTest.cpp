#include "frontends/headless/Bench.h"

#include <cmath>

using namespace zandor;

namespace {

using headless::tabuletRowHeight;
using headless::tabuletTitleHeight;

constexpr std::int16_t left = platform::leftButton;

/// Two table lists that write down what they tell.
struct Tables : Bench {
    std::string log;
    bool dragging = true;
    platform::Ref<TalvikTabulet::Tabulet> first, second;

    Tables() {
        first = table(1, events());
        second = table(2, events());
        second->Left(6000);
    }

    TalvikTabulet::TabuletEvents events() {
        const auto plain = [this](std::string what) {
            return [this, what](std::int16_t index) { log += what + std::to_string(index) + " "; };
        };
        const auto mouse = [this](std::string what) {
            return [this, what](std::int16_t index, const auto& entry, std::int16_t button,
                                std::int16_t) {
                log += what + std::to_string(index) + platform::toUtf8(entry->Text()) +
                       std::to_string(button) + " ";
                if (what == "move" && dragging && button == left)
                    (index == 1 ? first : second)->Drag(1);
            };
        };
        TalvikTabulet::TabuletEvents e;
        e.CloseClick = plain("close");
        e.GotFocus = plain("focus");
        e.Moving = plain("moving");
        e.Moved = plain("moved");
        e.Resized = plain("resized");
        e.Scroll = plain("scroll");
        e.ColumnMouseDown = mouse("down");
        e.ColumnMouseMove = mouse("move");
        e.ColumnMouseUp = mouse("up");
        e.DragOver = [this](std::int16_t index, platform::Control* source, float, float,
                            std::int16_t state) {
            EXPECT_EQ(source, first.get());
            log += "over" + std::to_string(index) + "/" + std::to_string(state) + " ";
        };
        e.DragDrop = [this](std::int16_t index, platform::Control* source, float X, float Y) {
            EXPECT_EQ(source, first.get());
            const auto entry = (index == 1 ? first : second)->ColumnAt(X, Y);
            log += "drop" + std::to_string(index) +
                   (entry.get() ? platform::toUtf8(entry->Text()) : "nothing") + " ";
        };
        return e;
    }

    std::string selected(const std::string& name) {
        std::string texts;
        for (const auto& entry : look<headless::Tabulet>(name).entries())
            if (entry->Selected()) texts += platform::toUtf8(entry->Text());
        return texts;
    }
};

TEST(ATableList, HasAHandleOfItsOwn) {
    Tables t;
    EXPECT_NE(t.first->TableHandle(), 0);
    EXPECT_NE(t.first->TableHandle(), t.second->TableHandle());
    Tables other;
    EXPECT_NE(t.first->TableHandle(), other.first->TableHandle());
}

TEST(AnEntry, HasTheImageOfItsNumberFromTheListThatItsTableListHas) {
    Tables t;
    const auto entry = t.first->ColumnItems().Item(1);
    const auto& seen = t.look<headless::Tabulet>("lstTable(1)").entry(1);
    entry->Image(1);
    EXPECT_EQ(seen.picture(), std::nullopt) << "there is no list yet";

    t.first->Images(t.toolkit.makeImageList({.Name = u"images"}, {platform::Picture::key}));
    EXPECT_EQ(t.look<headless::ImageList>("images").pictures().size(), 1U);
    entry->Image(1);
    EXPECT_EQ(seen.picture(), platform::Picture::key);
    entry->Image(2);
    EXPECT_EQ(seen.picture(), std::nullopt) << "the list has one image";
}

TEST(ATableList, TakesItsFontAndItsImagesFromThePatternAndStartsInvisible) {
    Tables t;
    t.first->Font({u"Segoe UI", 9});
    t.first->Images(t.toolkit.makeImageList({.Name = u"images"}, {platform::Picture::key}));
    const TalvikTabulet::TabuletEvents events;
    auto made = t.toolkit.makeTabulet(
        {.Name = u"lstTable", .FontName = u"MS Sans Serif", .Container = t.canvas.get()}, 3,
        t.first.get(), events);
    EXPECT_EQ(t.look<headless::Tabulet>("lstTable(3)").look().font.Name, u"Segoe UI");
    EXPECT_FALSE(made->Visible());
    made->ColumnItems().Add(u"k", u"ID")->Image(1);
    EXPECT_EQ(t.look<headless::Tabulet>("lstTable(3)").entry(1).picture(), platform::Picture::key);
    auto pattern = t.toolkit.makeTabulet({.Name = u"lstTable", .FontName = u"MS Sans Serif"}, 0,
                                         nullptr, events);
    EXPECT_EQ(t.look<headless::Tabulet>("lstTable(0)").look().font.Name, u"MS Sans Serif");
}

TEST(AnEntry, HasItsEdgePointsAtTheMiddleOfItsRowOnTheCanvas) {
    Tables t;
    const auto entry = t.first->ColumnItems().Item(3);
    const float middle = 500 + tabuletTitleHeight + 2.5F * tabuletRowHeight;
    EXPECT_EQ(entry->LeftEdgePoint().X, 1000);
    EXPECT_EQ(entry->RightEdgePoint().X, 3000);
    EXPECT_EQ(entry->LeftEdgePoint().Y, middle);
    EXPECT_EQ(entry->RightEdgePoint().Y, middle);
}

TEST(AnEntry, KeepsItsEdgePointsWhenItIsScrolledOutOfView) {
    Tables t;
    t.user.scrollList("lstTable(1)", 4);
    EXPECT_EQ(t.log, "scroll1 ");
    EXPECT_EQ(t.first->ColumnItems().Item(1)->LeftEdgePoint().Y,
              500 + tabuletTitleHeight - 2.5F * tabuletRowHeight);
}

TEST(AnEntry, IsNothingOnceItsListHasDroppedIt) {
    Tables t;
    const auto entry = t.first->ColumnItems().Item(1);
    t.first->Terminate();
    EXPECT_EQ(t.first->ColumnItems().Count(), 0);
    EXPECT_EQ(entry->Text(), u"A");
    EXPECT_EQ(errorOf([&] { entry->LeftEdgePoint(); }), 91);
}

TEST(AnEntry, ShowsItsSelectionOnceItIsRefreshed) {
    Tables t;
    const auto entry = t.first->ColumnItems().Item(2);
    const auto& shown = t.look<headless::Tabulet>("lstTable(1)").entry(2);
    entry->Selected(true);
    EXPECT_FALSE(shown.drawnSelected());
    entry->Refresh();
    EXPECT_TRUE(shown.drawnSelected());
}

TEST(AnEntry, ScrollsItsListJustFarEnoughToBeInView) {
    Bench bench;
    auto table = bench.table(1, {}, u'T');
    auto& seen = bench.look<headless::Tabulet>("lstTable(1)");
    const auto rows = static_cast<std::int32_t>(
        std::floor((2000 - tabuletTitleHeight - headless::tabuletBorder) / tabuletRowHeight));
    table->ColumnItems().Item(rows)->EnsureVisible();
    EXPECT_EQ(seen.firstVisible(), 1);
    table->ColumnItems().Item(rows + 1)->EnsureVisible();
    EXPECT_EQ(seen.firstVisible(), 2);
    table->ColumnItems().Item(1)->EnsureVisible();
    EXPECT_EQ(seen.firstVisible(), 1);
}

TEST(TheColumnList, RefusesPositionsThatItLacks) {
    Tables t;
    EXPECT_EQ(errorOf([&] { t.first->ColumnItems().Item(0); }), 9);
    EXPECT_EQ(errorOf([&] { t.first->ColumnItems().Item(5); }), 9);
    EXPECT_EQ(t.first->ColumnItems().Item(4)->Key(), u"kD");
}

TEST(ColumnAt, AnswersInTheListsOwnCoordinates) {
    Tables t;
    EXPECT_EQ(t.first->ColumnAt(10, tabuletTitleHeight)->Text(), u"A");
    EXPECT_EQ(t.first->ColumnAt(10, tabuletTitleHeight + tabuletRowHeight)->Text(), u"B");
    EXPECT_EQ(t.first->ColumnAt(10, tabuletTitleHeight - 1).get(), nullptr);
    EXPECT_EQ(t.first->ColumnAt(10, tabuletTitleHeight + 4 * tabuletRowHeight).get(), nullptr);
    EXPECT_EQ(t.first->ColumnAt(-1, tabuletTitleHeight).get(), nullptr);
    EXPECT_EQ(t.first->ColumnAt(2000, tabuletTitleHeight).get(), nullptr);
    t.user.scrollList("lstTable(1)", 3);
    EXPECT_EQ(t.first->ColumnAt(10, tabuletTitleHeight)->Text(), u"C");
}

TEST(APressOnAnEntry, SelectsItAloneBeforeItIsTold) {
    Tables t;
    t.user.selectEntries("lstTable(1)", {1, 2});
    std::string seen;
    t.tableEvents.front().ColumnMouseDown = [&](auto...) { seen = t.selected("lstTable(1)"); };
    t.user.pressEntry("lstTable(1)", 4, left);
    EXPECT_EQ(seen, "D");
    EXPECT_EQ(t.log, "focus1 ");
}

TEST(APressOnASelectedEntry, KeepsTheSelectionUntilItsRelease) {
    Tables t;
    t.user.selectEntries("lstTable(1)", {1, 2});
    t.user.pressEntry("lstTable(1)", 2, left);
    EXPECT_EQ(t.selected("lstTable(1)"), "AB");
    t.user.releaseEntry("lstTable(1)", 2, left);
    EXPECT_EQ(t.selected("lstTable(1)"), "B");
    EXPECT_EQ(t.log, "focus1 down1B1 up1B1 ");
}

TEST(APressWithCtrl, TurnsTheEntryOver) {
    Tables t;
    t.user.pressEntry("lstTable(1)", 2, left, 2);
    t.user.pressEntry("lstTable(1)", 3, left, 2);
    EXPECT_EQ(t.selected("lstTable(1)"), "BC");
    t.user.pressEntry("lstTable(1)", 2, left, 2);
    EXPECT_EQ(t.selected("lstTable(1)"), "C");
}

TEST(APress, ReachesOnlyEntriesInView) {
    Tables t;
    t.user.scrollList("lstTable(1)", 2);
    EXPECT_THROW(t.user.pressEntry("lstTable(1)", 1, left), std::logic_error);
    EXPECT_EQ(errorOf([&] { t.user.pressEntry("lstTable(1)", 5, left); }), 9);
}

TEST(ADrag, PassesOverTheTablesOnItsWay) {
    Tables t;
    t.user.dragToEntry("lstTable(1)", 2, "lstTable(2)", 3);
    EXPECT_EQ(t.log, "focus1 down1B1 move1B1 over1/0 over1/1 over2/0 over2/2 drop2C ");
    EXPECT_EQ(t.toolkit.dragged(), nullptr);
}

TEST(ADrag, CanEndOnAnEmptyPlaceOfAList) {
    Tables t;
    t.user.dragToEntry("lstTable(1)", 1, "lstTable(2)", 0);
    EXPECT_TRUE(t.log.ends_with("drop2nothing ")) << t.log;
    t.second->Height(tabuletTitleHeight + 2 * tabuletRowHeight);
    EXPECT_EQ(errorOf([&] { t.user.dragToEntry("lstTable(1)", 1, "lstTable(2)", 0); }), 5);
}

TEST(ADrag, ThatNobodyBeganEndsInAReleaseOnItsSource) {
    Tables t;
    t.dragging = false;
    t.user.dragToEntry("lstTable(1)", 2, "lstTable(2)", 3);
    EXPECT_EQ(t.log, "focus1 down1B1 move1B1 up1B1 ");
}

TEST(ADrag, EndsWithItsSource) {
    Tables t;
    t.first->Drag(1);
    EXPECT_EQ(t.toolkit.dragged(), t.first.get());
    t.first = nullptr;
    EXPECT_EQ(t.toolkit.dragged(), nullptr);
}

TEST(Drag, KnowsTheActionThatBeginsOne) {
    Tables t;
    EXPECT_EQ(errorOf([&] { t.first->Drag(7); }), 5);
    EXPECT_EQ(t.toolkit.dragged(), nullptr);
}

TEST(MovingATable, IsToldOnTheWayAndAtTheEnd) {
    Tables t;
    t.user.moveTable("lstTable(1)", 3000, 1500);
    EXPECT_EQ(t.log, "focus1 moving1 moving1 moved1 ");
    EXPECT_EQ(t.first->bounds(), (platform::Bounds{3000, 1500, 2000, 2000}));
}

TEST(ResizingATable, IsToldOnTheWayAndAtTheEnd) {
    Tables t;
    t.user.resizeTable("lstTable(1)", -50, 700);
    EXPECT_EQ(t.log, "focus1 moving1 moving1 resized1 ");
    EXPECT_EQ(t.first->bounds(), (platform::Bounds{1000, 500, -50, 700}));
}

TEST(ClosingATable, MayDestroyItWhileItTells) {
    Tables t;
    t.tableEvents.front().CloseClick = [&](std::int16_t) { t.first = nullptr; };
    t.user.closeTable("lstTable(1)");
    EXPECT_FALSE(t.toolkit.exists("lstTable(1)"));
    EXPECT_TRUE(t.toolkit.exists("lstTable(2)"));
}

TEST(TheCanvas, IsPressedOnlyWhereNoTableCoversIt) {
    Bench bench;
    std::string log;
    auto frame = bench.toolkit.makeFrame(
        {.Name = u"fraOther"},
        {.MouseDown = [&](std::int16_t button, std::int16_t, float X,
                          float) { log += std::to_string(button) + "@" + std::to_string(X); },
         .MouseUp = {}});
    auto table = bench.table(1);
    EXPECT_THROW(bench.user.pressFrame("fraTable", left, 1000, 500), std::logic_error);
    bench.user.pressFrame("fraTable", left, 3000, 500);
    bench.user.pressFrame("fraOther", left, 1000, 500);
    EXPECT_EQ(log, "1@1000.000000");
}

} // namespace
