#include "CanvasTest.h"

#include <algorithm>
#include <functional>

using namespace zandor;

namespace {

/// One table of four columns.
class PressingColumns : public CanvasTest {
protected:
    PressingColumns() {
        pressed = table(u"A", {u"ID", u"NAME", u"CITY", u"ZIP"}, 600);
        bind();
    }

    void press(std::int16_t button = 1) {
        Back::lstTable_ColumnMouseDown(control(), std::int16_t{1}, Ref<ColumnItem>(), button,
                                       std::int16_t{0});
    }
    std::vector<int> activated() {
        std::vector<int> values;
        for (const char16_t* name : {u"ID", u"NAME", u"CITY", u"ZIP"})
            values.push_back(pressed->column(name).activatedValue);
        return values;
    }

    Ref<fake::Table> pressed;
};

TEST_F(PressingColumns, CopiesTheSelectionIntoTheModelAsOnesAndZeros) {
    stage->selectEntries(1, {1, 3});
    stage->pressEntry(1, 3, 1);
    EXPECT_EQ(activated(), (std::vector<int>{1, 0, 1, 0}));
    EXPECT_EQ(told(), Texts{});
    EXPECT_EQ(events(), Texts{});
}

TEST_F(PressingColumns, CopiesTheSelectionThatTheReleaseLeaves) {
    stage->selectEntries(1, {1, 3, 4});
    control().DebugSwitch(1);
    stage->pressEntry(1, 3, 1);
    EXPECT_EQ(activated(), (std::vector<int>{1, 0, 1, 1}));
    forget();
    stage->releaseEntry(1, 3, 1);
    control().DebugSwitch(0);
    EXPECT_EQ(selectedIn(1), std::vector<String>{u"CITY"});
    EXPECT_EQ(activated(), (std::vector<int>{0, 0, 1, 0}));
    EXPECT_EQ(stage->transcript, Texts{}) << "no trace";
}

TEST_F(PressingColumns, SaysNothingOfAReleaseThatLeavesTheSelectionAsItWas) {
    stage->pressEntry(1, 2, 1);
    pressed->column(u"NAME").activatedValue = 7;
    stage->releaseEntry(1, 2, 1);
    EXPECT_EQ(pressed->column(u"NAME").activatedValue, 7);
}

TEST_F(PressingColumns, DeselectsAllOnAnEmptyPlaceOfTheList) {
    stage->selectEntries(1, {1, 3});
    stage->pressEntry(1, 1, 1);
    stage->releaseEntry(1, 1, 1);
    stage->pressEntry(1, 0, 1);
    EXPECT_EQ(selectedIn(1), std::vector<String>{});
    EXPECT_EQ(activated(), (std::vector<int>{0, 0, 0, 0}));
    stage->moveOverEntry(1, 2, 1);
    EXPECT_EQ(Back::mDragTableIndex(control()), 0) << "nothing was picked up";
    stage->releaseEntry(1, 0, 1);
    EXPECT_EQ(stage->transcript, Texts{});
}

TEST_F(PressingColumns, ReportsASelectionThatCannotBeCopied) {
    stage->selectEntries(1, {1, 3});
    stage->pressEntry(1, 3, 1);
    pressed->columns.items.Remove(u"kNAME");
    stage->releaseEntry(1, 3, 1);
    EXPECT_EQ(told(), Texts{noKey("lstTable_SelectionChanged")});
    EXPECT_EQ(pressed->column(u"ID").activatedValue, 0) << "those before it are copied";
}

TEST_F(PressingColumns, CopiesTheSelectionForEveryButton) {
    for (const std::int16_t button : {1, 2, 4, 3}) {
        stage->selectEntries(1, {2});
        pressed->column(u"NAME").activatedValue = -1;
        press(button);
        EXPECT_EQ(activated(), (std::vector<int>{0, 1, 0, 0})) << button;
    }
}

TEST_F(PressingColumns, LooksTheModelTableUpOnceForEachEntry) {
    library.calls->remember(true);
    press();
    const auto& calls = library.calls->calls();
    EXPECT_EQ(std::count(calls.begin(), calls.end(), "Tables.Item(key)"), 4);
}

TEST_F(PressingColumns, LooksNothingUpInAListWithoutEntries) {
    element(1)->Terminate();
    model->tables.items.Remove(u"tA");
    library.calls->remember(true);
    press();
    EXPECT_EQ(library.calls->calls(), Texts{});
    EXPECT_EQ(told(), Texts{});
}

TEST_F(PressingColumns, TracesEachSelectedColumnUnderItsName) {
    stage->selectEntries(1, {2, 4});
    control().DebugSwitch(1);
    press();
    control().DebugSwitch(0);

    const std::string name = "lstTable_ColumnMouseDown";
    EXPECT_EQ(told(), (Texts{trace(name), trace("Selected column found: NAME", name),
                             trace("Tabulet Column selected: NAME", name),
                             trace("Selected column found: ZIP", name),
                             trace("Tabulet Column selected: ZIP", name)}));
}

TEST_F(PressingColumns, ReadsTheTracedNameFromTheModelColumn) {
    stage->selectEntries(1, {2});
    pressed->column(u"NAME").name = u"RENAMED";
    control().DebugSwitch(1);
    press();
    control().DebugSwitch(0);

    const std::string name = "lstTable_ColumnMouseDown";
    EXPECT_EQ(told(), (Texts{trace(name), trace("Selected column found: NAME", name),
                             trace("Tabulet Column selected: RENAMED", name)}));
}

TEST_F(PressingColumns, LeavesTheColumnsBeforeAMissingOneCopied) {
    stage->selectEntries(1, {1, 2, 3, 4});
    const auto lost = pressed->columnRef(u"CITY");
    pressed->columns.items.Remove(u"kCITY");
    press();

    EXPECT_EQ(told(), Texts{noKey("lstTable_ColumnMouseDown")});
    EXPECT_EQ(pressed->column(u"ID").activatedValue, 1);
    EXPECT_EQ(pressed->column(u"NAME").activatedValue, 1);
    EXPECT_EQ(lost->activatedValue, -1);
    EXPECT_EQ(pressed->column(u"ZIP").activatedValue, -1);
}

TEST_F(PressingColumns, ReportsATableThatTheModelLacks) {
    model->tables.items.Remove(u"tA");
    press();
    EXPECT_EQ(told(), Texts{noKey("lstTable_ColumnMouseDown")});
    EXPECT_EQ(activated(), (std::vector<int>{-1, -1, -1, -1}));
}

TEST_F(PressingColumns, ReportsASlotWithoutATable) {
    Back::lstTable_ColumnMouseDown(control(), std::int16_t{3}, Ref<ColumnItem>(), std::int16_t{1},
                                   std::int16_t{0});
    EXPECT_EQ(told(), Texts{noElement("lstTable_ColumnMouseDown", 3)});
}

TEST_F(PressingColumns, OpensTheMenuOfATableAtTheOriginWhenTheRightButtonIsReleased) {
    std::vector<String> enabled;
    stage->onMenu = [&](const std::vector<Stage::Entry>& entries) {
        for (const auto& entry : entries)
            if (entry.enabled && !entry.name.ends_with(u"Sep")) enabled.push_back(entry.name);
        return String();
    };
    Back::mPopupX(control()) = Back::mPopupY(control()) = 99;

    stage->pressEntry(1, 1, 2);
    stage->releaseEntry(1, 1, 2);
    EXPECT_EQ(enabled,
              (std::vector<String>{u"mnuTableDefinitionCopy", u"mnuTableDefinitionDelete"}));
    EXPECT_EQ(Back::mPopupX(control()), 0);
    EXPECT_EQ(Back::mPopupY(control()), 0);
    EXPECT_EQ(events(), Texts{"Activate"});
}

TEST_F(PressingColumns, OpensTheMenuForTheRightButtonAlone) {
    for (const std::int16_t button : {1, 3, 4, 6})
        Back::lstTable_ColumnMouseUp(control(), std::int16_t{1}, Ref<ColumnItem>(), button,
                                     std::int16_t{0});
    EXPECT_EQ(stage->transcript, Texts{});
}

/// A host's column that does something when it is told of its selection.
class BusyColumn final : public TalvikZandorLib::ZDColumn {
public:
    using String = platform::String;

    String Name() const override { return u"BUSY"; }
    String Key() const override { return u"kBUSY"; }
    bool Marker() const override { return false; }
    bool Selected() const override { return false; }
    void Selected(bool) override {}
    void activated(std::int16_t) override {
        if (whenActivated) whenActivated();
    }

    std::function<void()> whenActivated;
};

TEST_F(PressingColumns, EndsWellWhenTheHostShowsAnotherModelWhileItIsTold) {
    const auto busy = platform::makeRef<BusyColumn>();
    pressed->columns.items.Add(std::shared_ptr<TalvikZandorLib::ZDColumn>(busy), u"kBUSY");
    const auto last = pressed->addColumn(u"LAST");
    bind();
    const auto other = library.newModel();
    other->table(u"OTHER", {u"ID"});
    busy->whenActivated = [&] {
        control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(other));
    };

    press();
    EXPECT_EQ(told(), Texts{});
    EXPECT_EQ(look(1).text, u"OTHER");
    EXPECT_EQ(last->activatedValue, -1);
}

} // namespace
