#include "frontends/headless/Bench.h"

using namespace zandor;

namespace {

struct Bar {
    Bench bench;
    int changes = 0;
    std::unique_ptr<platform::ScrollBar> bar =
        bench.toolkit.makeScrollBar({.Name = u"hsbTable"}, platform::Orientation::horizontal,
                                    {.Change = [this] { ++changes; }, .GotFocus = {}});
};

TEST(AScrollBar, FiresChangeOnARealChangeOnlyWhoeverMakesIt) {
    Bar b;
    b.bar->Max(100);
    b.bar->Value(0);
    EXPECT_EQ(b.changes, 0);
    b.bar->Value(40);
    b.bar->Value(40);
    EXPECT_EQ(b.changes, 1);
    b.bench.user.scrollBarTo("hsbTable", 60);
    EXPECT_EQ(b.changes, 2);
    EXPECT_EQ(b.bar->Value(), 60);
}

TEST(AScrollBar, RefusesAValueOutsideItsRange) {
    Bar b;
    b.bar->Max(100);
    b.bar->Value(50);
    EXPECT_EQ(errorOf([&] { b.bar->Value(101); }), 380);
    EXPECT_EQ(errorOf([&] { b.bar->Value(-1); }), 380);
    EXPECT_EQ(errorOf([&] { b.bar->Max(-1); }), 380);
    EXPECT_EQ(b.bar->Value(), 50);
    EXPECT_EQ(b.bar->Max(), 100);
}

TEST(AScrollBar, MovesItsValueDownWithItsMax) {
    Bar b;
    b.bar->Max(100);
    b.bar->Value(80);
    b.changes = 0;
    b.bar->Max(90);
    EXPECT_EQ(b.changes, 0);
    b.bar->Max(30);
    EXPECT_EQ(b.bar->Value(), 30);
    EXPECT_EQ(b.changes, 1);
}

TEST(AScrollBar, HoldsTheUserAtTheEndsOfItsRange) {
    Bar b;
    b.bar->Max(100);
    b.bench.user.scrollBarTo("hsbTable", 5000);
    EXPECT_EQ(b.bar->Value(), 100);
    b.bar->Enabled(false);
    b.bench.user.scrollBarTo("hsbTable", 0);
    EXPECT_EQ(b.bar->Value(), 100);
}

TEST(AScrollBar, HasAThicknessOfItsOwn) {
    Bar b;
    EXPECT_EQ(b.bar->Height(), headless::scrollBarThickness);
    EXPECT_EQ(b.bar->Width(), 0);
}

TEST(AComboBox, RefusesAPositionOutsideItsListAndKeepsTheChoice) {
    Bench bench;
    auto combo = bench.toolkit.makeComboBox({.Name = u"cob"}, {u"None", u"Up"}, {});
    EXPECT_EQ(combo->ListIndex(), -1);
    combo->ListIndex(1);
    EXPECT_EQ(combo->Text(), u"Up");
    EXPECT_EQ(errorOf([&] { combo->ListIndex(2); }), 380);
    EXPECT_EQ(errorOf([&] { combo->ListIndex(-2); }), 380);
    EXPECT_EQ(combo->ListIndex(), 1);
    combo->ListIndex(-1);
    EXPECT_EQ(combo->Text(), u"");
}

TEST(AComboBox, ChoosesNothingOnceItIsCleared) {
    Bench bench;
    auto combo = bench.toolkit.makeComboBox({.Name = u"cob"}, {u"None", u"Up"}, {});
    combo->ListIndex(0);
    combo->Clear();
    EXPECT_EQ(combo->ListIndex(), -1);
    EXPECT_EQ(errorOf([&] { combo->ListIndex(0); }), 380);
    combo->AddItem(u"Down");
    bench.user.choose("cob", 0);
    EXPECT_EQ(combo->Text(), u"Down");
}

TEST(AComboBox, IsNotChosenFromWhileItIsDisabled) {
    Bench bench;
    auto combo = bench.toolkit.makeComboBox({.Name = u"cob"}, {u"None", u"Up"}, {});
    combo->Enabled(false);
    bench.user.choose("cob", 1);
    EXPECT_EQ(combo->ListIndex(), -1);
}

struct Editors {
    Bench bench;
    std::string log;
    std::unique_ptr<platform::Frame> outer = bench.toolkit.makeFrame({.Name = u"fraA"}, {});
    std::unique_ptr<platform::Frame> inner =
        bench.toolkit.makeFrame({.Name = u"fraA2", .Container = outer.get()}, {});
    std::unique_ptr<platform::TextBox> text = bench.toolkit.makeTextBox(
        {.Name = u"txtA", .Container = inner.get()},
        [this](std::int16_t code, std::int16_t) { log += "key" + std::to_string(code) + " "; });
    std::unique_ptr<platform::CommandButton> setA = bench.toolkit.makeCommandButton(
        {.Name = u"cmdA", .Container = outer.get()},
        {.Click = [this] { log += "A "; }, .GotFocus = [this] { log += "focusA "; }});
    std::unique_ptr<platform::Frame> other = bench.toolkit.makeFrame({.Name = u"fraB"}, {});
    std::unique_ptr<platform::CommandButton> setB =
        bench.toolkit.makeCommandButton({.Name = u"cmdB", .Container = other.get()},
                                        {.Click = [this] { log += "B "; }, .GotFocus = {}});
};

TEST(EnterInAnInput, PressesTheDefaultButtonAndLeavesTheFocus) {
    Editors e;
    e.setA->Default(true);
    e.bench.user.key("txtA", 13);
    EXPECT_EQ(e.log, "A ");
    EXPECT_TRUE(e.bench.look<headless::TextBox>("txtA").focused());
}

TEST(EnterInAnInput, ReachesTheInputWhenNoDefaultButtonIsShown) {
    Editors e;
    e.setB->Default(true);
    e.other->Visible(false);
    e.bench.user.key("txtA", 13);
    EXPECT_EQ(e.log, "key13 ");
}

TEST(ADefaultButton, EndsTheOneBefore) {
    Editors e;
    e.setA->Default(true);
    e.setB->Default(true);
    EXPECT_FALSE(e.bench.look<headless::CommandButton>("cmdA").isDefault());
    e.bench.user.key("txtA", 13);
    EXPECT_EQ(e.log, "B ");
}

TEST(OtherKeys, ReachTheInput) {
    Editors e;
    e.setA->Default(true);
    e.bench.user.key("txtA", platform::keyEscape);
    e.bench.user.type("txtA", u"> 5");
    EXPECT_EQ(e.log, "key27 ");
    EXPECT_EQ(e.text->Text(), u"> 5");
}

TEST(EveryKindOfControl, HasASizeFromDesignTimeOn) {
    Editors e;
    auto label = e.bench.toolkit.makeLabel({.Name = u"lbl"});
    auto combo = e.bench.toolkit.makeComboBox({.Name = u"cob"}, {}, {});
    for (const platform::Control* control : std::initializer_list<const platform::Control*>{
             e.outer.get(), e.text.get(), e.setA.get(), label.get(), combo.get()}) {
        EXPECT_GT(control->Width(), 0);
        EXPECT_GT(control->Height(), 0);
    }
}

} // namespace
