#include "GridStage.h"

#include <Zandor/Questions.h>

namespace gridstage {

namespace {

namespace menuSource = TalvikDBxZandor::menuSource;
using TalvikDBxZandor::HostEntry;
using TalvikDBxZandor::MenuPlace;

/// Remembers what it was asked, says the same to everything, and runs something of the host's
/// first.
class Answers final : public TalvikDBxZandor::Questions {
public:
    bool MayJoin(const TalvikDBxZandor::JoinEnd& left,
                 const TalvikDBxZandor::JoinEnd& right) override {
        return asked(u"join " + left.Table->Name() + u"." + left.Column->Name() + u" to " +
                     right.Table->Name() + u"." + right.Column->Name());
    }
    bool MayRemoveJoin(const Ref<TalvikZandorLib::ZDJoin>& join) override {
        return asked(u"remove join " + join->Key());
    }
    bool MayCloseTable(const Ref<TalvikZandorLib::ZDTable>& table) override {
        return asked(u"close " + table->Name());
    }
    bool MayComeOut(const Ref<TalvikZandorLib::ZDColumn>& column) override {
        return asked(u"come out " + column->Name());
    }
    bool MayRemoveColumn(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition) override {
        return asked(u"remove column " + definition->Key());
    }
    std::vector<HostEntry> MenuEntries(const MenuPlace& place) override {
        if (first) first();
        places.push_back(place);
        return entries;
    }

    bool says = true;
    std::vector<String> questions;
    std::vector<MenuPlace> places;
    std::vector<HostEntry> entries;
    std::function<void()> first;

private:
    bool asked(const String& question) {
        questions.push_back(question);
        if (first) first();
        return says;
    }
};

/// A join of ORDERS and CUSTOMERS and one output column, NAME.
class AHostThatIsAsked : public GridTest {
protected:
    AHostThatIsAsked() {
        model->join(orders, u"CUSTOMER", customers, u"ID");
        model->definition(customers, u"NAME");
        bind();
        control().Ask(host);
    }

    /// What the host is asked about, each in one gesture.
    struct Act {
        String question;
        void (*gesture)(AHostThatIsAsked& test);
        Names events; ///< when it may be done
    };
    static std::vector<Act> acts() {
        return {
            {u"join ORDERS.ID to CUSTOMERS.NAME",
             [](AHostThatIsAsked& test) {
                 test.stage->selectEntries(1, {id});
                 test.stage->dragToEntry(1, id, 2, name);
             },
             {"JoinCreated", "Activate"}},
            {u"join ORDERS.TOTAL to CUSTOMERS.ID",
             [](AHostThatIsAsked& test) {
                 test.copy(1, {total});
                 if (!test.stage->exists("lstTable(2)")) return; // the host has replaced it
                 test.stage->selectEntries(2, {id});
                 test.menuOverEntry(2, id, "mnuTableDefinitionPaste");
             },
             {"Activate"}},
            {u"remove join j1",
             [](AHostThatIsAsked& test) { test.menuOverTheLine("mnuJoinDelete"); },
             {"Activate", "JoinRemoved"}},
            {u"close ORDERS",
             [](AHostThatIsAsked& test) { test.stage->closeTable(1); },
             {"TableDeleted"}},
            {u"come out TOTAL",
             [](AHostThatIsAsked& test) { test.drag(1, {total}, 2); },
             {"ColumnCreated", "Activate"}},
            {u"remove column x1",
             [](AHostThatIsAsked& test) {
                 test.menuOverCell(synonymRow, 1, "mnuColumnDefinitionDelete");
             },
             {"Activate", "ColumnRemoved"}},
        };
    }

    std::shared_ptr<Answers> host = std::make_shared<Answers>();
};

/// Each act on a stage of its own.
class EachAct : public AHostThatIsAsked, public testing::WithParamInterface<std::size_t> {
protected:
    const Act act = acts()[GetParam()];

    std::vector<std::int32_t> counts() const {
        return {model->tableCount(), model->joinCount(), model->definitionCount()};
    }
};

TEST_P(EachAct, HappensWhenTheHostSaysSo) {
    const auto before = counts();
    act.gesture(*this);
    EXPECT_EQ(host->questions, Texts{act.question});
    EXPECT_EQ(events(), act.events);
    EXPECT_NE(counts(), before);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_P(EachAct, DoesNotHappenWhenTheHostRefuses) {
    host->says = false;
    const auto before = counts();
    const Texts cells = fields(3);
    act.gesture(*this);
    EXPECT_EQ(host->questions, Texts{act.question});
    EXPECT_EQ(counts(), before);
    EXPECT_EQ(fields(3), cells);
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_FALSE(stage->exists("linJoin(2)"));
    EXPECT_TRUE(shows("lstTable(1)"));
    for (const std::string& event : events()) EXPECT_EQ(event, "Activate");
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_P(EachAct, DoesNotHappenWhenTheAnswerFails) {
    host->first = [] { throw refusal(); };
    const auto before = counts();
    act.gesture(*this);
    // Over an entry the menu is asked for twice, to copy and to paste.
    ASSERT_FALSE(stage->boxes.empty());
    for (const auto& box : stage->boxes)
        EXPECT_NE(box.text.find(u"The host refuses."), String::npos);
    EXPECT_EQ(counts(), before);
}

TEST_P(EachAct, DoesNotHappenToAModelThatTheHostHasReplaced) {
    host->first = [this] {
        host->first = nullptr;
        control().P_SET_Zandor(library.newModel());
    };
    const auto before = counts();
    act.gesture(*this);
    EXPECT_EQ(counts(), before);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_P(EachAct, IsAskedAboutNoLongerOnceTheHostHasHadEnough) {
    control().Ask(nullptr);
    const auto before = counts();
    act.gesture(*this);
    EXPECT_EQ(host->questions, Texts{});
    EXPECT_NE(counts(), before);
}

INSTANTIATE_TEST_SUITE_P(Of, EachAct, testing::Range<std::size_t>(0, 6));

TEST_F(AHostThatIsAsked, KeepsAJoinThatItPutInThePlaceOfTheOneToBeRemoved) {
    host->first = [this] {
        if (host->questions.empty()) return; // the menu is asked about before
        model->joins.items = {};
        model->join(orders, u"ID", customers, u"NAME");
        control().ShowAnew();
    };
    menuOverTheLine("mnuJoinDelete");
    EXPECT_EQ(model->joinCount(), 1);
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_EQ(events(), Names{"Activate"});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AHostThatIsAsked, KeepsTheColumnThatItShowsInThePlaceOfTheOneToBeRemoved) {
    model->definition(orders, u"TOTAL");
    control().ShowAnew();
    host->first = [this] {
        if (host->questions.empty()) return; // the menu is asked about before
        model->definitions.items.Remove(u"x1");
        control().ShowAnew();
    };
    menuOverCell(synonymRow, 1, "mnuColumnDefinitionDelete");
    EXPECT_EQ(fields(2), (Texts{u"TOTAL", u""}));
    EXPECT_EQ(events(), Names{"Activate"});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AHostThatIsAsked, IsAskedAboutEachOfSeveralColumns) {
    host->first = [this] { host->says = host->questions.back() != u"come out CUSTOMER"; };
    drag(1, {id, customer, total}, 2);
    EXPECT_EQ(host->questions, (Texts{u"come out ID", u"come out CUSTOMER", u"come out TOTAL"}));
    EXPECT_EQ(fields(4), (Texts{u"NAME", u"ORDERS.ID", u"ORDERS.TOTAL", u""}));
}

TEST_F(AHostThatIsAsked, IsAskedAboutTheFieldThatReplacesAnother) {
    stage->comforts().setFlags({.OffersFields = true});
    host->says = false;
    stage->clickField(1);
    stage->pickField(u"ORDERS.TOTAL");
    EXPECT_EQ(host->questions, Texts{u"come out TOTAL"});
    EXPECT_EQ(fields(1), Texts{u"NAME"});
    EXPECT_EQ(events(), Names{});
}

TEST_F(AHostThatIsAsked, IsNotAskedAboutWhatItDoesItself) {
    host->says = false;
    control().P_SET_Zandor(model);
    control().Terminate();
    EXPECT_EQ(host->questions, Texts{});
    EXPECT_FALSE(stage->exists("lstTable(1)"));
}

/// The captions of the menu seen last, of what is visible.
Texts captions(const std::vector<Stage::Entry>& menu) {
    Texts texts;
    for (const auto& entry : menu)
        if (entry.visible) texts.push_back(entry.caption);
    return texts;
}

TEST_F(AHostThatIsAsked, HasItsEntriesBehindTheControlsOwn) {
    menuOverEntry(1, id);
    const Texts own = captions(menu);
    int chosen = 0;
    host->entries = {{u"&Show rows", [&] { ++chosen; }}, {u"Never", {}, false}};
    menuOverEntry(1, id, "mnuHost1");
    Texts expected = own;
    expected.insert(expected.end(), {u"-", u"&Show rows", u"Never"});
    EXPECT_EQ(captions(menu), expected);
    EXPECT_FALSE(menu.back().enabled);
    EXPECT_EQ(chosen, 1);
    // One that is too many is hidden the next time, and none is chosen from before.
    host->entries = {{u"Only", [&] { chosen += 10; }}};
    menuOverEntry(1, id, "mnuHost1");
    expected = own;
    expected.insert(expected.end(), {u"-", u"Only"});
    EXPECT_EQ(captions(menu), expected);
    EXPECT_EQ(chosen, 11);
    host->entries.clear();
    menuOverEntry(1, id);
    EXPECT_EQ(captions(menu), own);
    control().Ask(nullptr);
    menuOverEntry(1, id);
    EXPECT_EQ(captions(menu), own);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AHostThatIsAsked, IsToldWhatTheMenuOpensOver) {
    stage->focus("lstTable(2)");
    stage->selectEntries(2, {name});
    menuOverEntry(2, name);
    const auto at = middleOfTheLine();
    menuOverTheLine();
    stage->pressCanvas(right, 11000, 200);
    stage->releaseCanvas(right, 11000, 200);
    menuOverCell(criteriaRow, 1);
    menuOverCell(criteriaRow, 2);
    ASSERT_EQ(host->places.size(), 5U);

    const MenuPlace& table = host->places[0];
    EXPECT_EQ(table.Source, menuSource::table);
    EXPECT_EQ(table.Table.get(), customers.get());
    EXPECT_EQ(table.Column.get(), customers->columnRef(u"NAME").get());
    EXPECT_FALSE(table.Join || table.Definition);
    const MenuPlace& line = host->places[1];
    EXPECT_EQ(line.Source, menuSource::canvas);
    ASSERT_TRUE(line.Join);
    EXPECT_EQ(line.Join->Key(), u"j1");
    EXPECT_NEAR(line.X, at.X, 15);
    EXPECT_NEAR(line.Y, at.Y, 15);
    const MenuPlace& empty = host->places[2];
    EXPECT_EQ(empty.Source, menuSource::canvas);
    EXPECT_NEAR(empty.X, 11000, 15);
    EXPECT_FALSE(empty.Join || empty.Table);
    const MenuPlace& cell = host->places[3];
    EXPECT_EQ(cell.Source, menuSource::grid);
    EXPECT_EQ(cell.Row, criteriaRow);
    ASSERT_TRUE(cell.Definition);
    EXPECT_EQ(cell.Definition->Key(), u"x1");
    EXPECT_FALSE(host->places[4].Definition);
}

TEST_F(AHostThatIsAsked, IsToldOfNoJoinWhereItsModelNeverTookTheLine) {
    Backstage::mJoinLines(control()).Item(1)->Tag({});
    menuOverTheLine();
    ASSERT_EQ(host->places.size(), 1U);
    EXPECT_FALSE(host->places[0].Join);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AHostThatIsAsked, HearsOfAFailureOfAnEntryOfItsOwn) {
    host->entries = {{u"Fail", [] { throw refusal(); }}};
    menuOverEntry(1, id, "mnuHost1");
    EXPECT_EQ(stage->boxes, Boxes{report(u"mnuHost_Click", refusal())});
}

TEST_F(AHostThatIsAsked, HasAMenuWithoutItsEntriesWhenItFails) {
    host->entries = {{u"One", {}}};
    menuOverEntry(1, id);
    host->first = [] { throw refusal(); };
    menuOverEntry(1, id);
    EXPECT_EQ(stage->boxes, Boxes{report(u"OfferHostEntries", refusal())});
    const Texts shown = captions(menu);
    EXPECT_EQ(std::count(shown.begin(), shown.end(), u"One"), 0);
}

TEST_F(AHostThatIsAsked, MayEndTheControlByAnEntryOfItsOwn) {
    host->entries = {{u"Close", [this] { control().End(); }}};
    menuOverEntry(1, id, "mnuHost1");
    EXPECT_EQ(stage->boxes, Boxes{});
}

} // namespace

} // namespace gridstage
