#include "GridStage.h"

#include "support/Sample.h"

#include <algorithm>
#include <random>
#include <set>

using namespace zandor;

namespace gridstage {

/// What is shown of a model that its host has changed, once the host asks for it.
class ShowingAnew : public GridTest {
protected:
    ShowingAnew() {
        join = model->join(orders, u"CUSTOMER", customers, u"ID");
        model->definition(orders, u"ID", {u"> 1"});
        model->definition(customers, u"NAME");
        model->definition(orders, u"TOTAL");
        bind();
    }

    void showAnew() {
        forget();
        control().ShowAnew();
        EXPECT_EQ(stage->boxes, Boxes{});
        EXPECT_EQ(events(), Names{});
    }

    Stage::Seen table(std::int16_t slot) {
        return stage->look("lstTable(" + std::to_string(slot) + ")");
    }
    bool shown(std::int16_t slot) {
        return stage->exists("lstTable(" + std::to_string(slot) + ")");
    }
    TalvikTabulet::Tabulet& element(std::int16_t slot) {
        return *Backstage::lstTable(control())(slot);
    }
    /// How far down the first entry of a list is, which says how far the list is scrolled.
    float firstEntry(std::int16_t slot) {
        return element(slot).ColumnItems().Item(1)->LeftEdgePoint().Y;
    }

    Texts column(std::int32_t col) {
        Texts texts;
        for (std::int32_t row = 0; row < grid().Rows(); ++row)
            texts.push_back(stage->cell(row, col));
        while (!texts.empty() && texts.back().empty()) texts.pop_back();
        return texts;
    }

    platform::KeyedCollection<TalvikZandorLib::ZDColumnDefinition>& definitions() {
        return model->definitions.items;
    }

    Ref<fake::Join> join;
};

TEST_F(ShowingAnew, ChangesNothingWhereNothingHasChanged) {
    stage->scrollBarTo("hsbTable", 300);
    stage->scrollBarTo("vsbTable", 150);
    stage->scrollGrid(2, 2);
    stage->selectEntries(1, {id, total});
    stage->selectEntries(2, {name});
    const std::int32_t topRow = grid().TopRow(); // 2, where not all rows are seen at once
    showAnew();
    EXPECT_EQ(stage->look("hsbTable").value, 300);
    EXPECT_EQ(stage->look("vsbTable").value, 150);
    EXPECT_EQ(grid().TopRow(), topRow);
    EXPECT_EQ(grid().LeftCol(), 2);
    EXPECT_EQ(table(1).selected, (Texts{u"ID", u"TOTAL"}));
    EXPECT_EQ(table(2).selected, Texts{u"NAME"});
    EXPECT_EQ(table(1).bounds, (platform::Bounds{300, 300, 2400, 2400}));
    EXPECT_EQ(fields(4), (Texts{u"ID", u"NAME", u"TOTAL", u""}));
    EXPECT_EQ(column(1), (Texts{u"ID", u"", u"", u"Visible", u"> 1"}));
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_EQ(stage->transcript, std::vector<std::string>{});
}

TEST_F(ShowingAnew, ShowsNoTracesWhateverComes) {
    control().DebugSwitch(1);
    customers->column(u"NAME").selected = true;
    model->tables.items.Remove(orders->key);
    model->table(u"ITEMS", {u"*", u"ID"});
    showAnew();
    EXPECT_EQ(table(1).text, u"ITEMS");
    control().SetCurrentTable(u"ITEMS");
    EXPECT_FALSE(stage->boxes.empty()) << "afterwards all is traced as before";
}

TEST_F(ShowingAnew, TakesAwayATableThatHasGoneAndLeavesTheOthersWhereTheyAre) {
    model->tables.items.Remove(orders->key);
    model->joins.items.Remove(join->key);
    definitions().Remove(u"x1");
    definitions().Remove(u"x3");
    showAnew();
    EXPECT_FALSE(shown(1));
    EXPECT_EQ(table(2).text, u"CUSTOMERS");
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_EQ(fields(2), (Texts{u"NAME", u""}));
    EXPECT_EQ(grid().ColData(1), 2);
    EXPECT_EQ(Backstage::mActiveTableIndex(control()), 2);
}

TEST_F(ShowingAnew, HasNoCurrentTableOnceAllHaveGone) {
    definitions() = {};
    model->joins.items = {};
    model->tables.items = {};
    control().ShowAnew();
    EXPECT_FALSE(shown(1) || shown(2));
    EXPECT_EQ(Backstage::mActiveTableIndex(control()), 0);
    EXPECT_FALSE(stage->look("hsbTable").enabled);
    EXPECT_EQ(fields(1), Texts{u""});
    const auto items = model->table(u"ITEMS", {u"*"});
    control().ShowAnew();
    EXPECT_EQ(Backstage::mActiveTableIndex(control()), 1);
    EXPECT_TRUE(stage->look("hsbTable").enabled);
}

TEST_F(ShowingAnew, AddsATableThatHasComeInAFreeSlot) {
    const std::int16_t before = Backstage::mActiveTableIndex(control());
    const auto items = model->table(u"ITEMS", {u"*", u"ID"});
    items->place(300, 4500, 1800, 1500);
    items->column(u"ID").marker = true;
    showAnew();
    EXPECT_EQ(table(3).text, u"ITEMS");
    EXPECT_EQ(table(3).bounds, (platform::Bounds{300, 4500, 1800, 1500}));
    EXPECT_EQ(table(3).items, (Texts{u"*", u"ID"}));
    EXPECT_EQ(table(3).keys, Texts{u"ID"});
    EXPECT_TRUE(table(3).visible);
    EXPECT_EQ(Backstage::mActiveTableIndex(control()), before) << "the current table stays";
}

TEST_F(ShowingAnew, DoesNotPlaceANewTableOnAnother) {
    model->table(u"FIRST", {u"*"});
    showAnew();
    model->table(u"SECOND", {u"*"});
    showAnew();
    EXPECT_EQ(table(3).bounds, (platform::Bounds{120, 120, 2000, 2000}));
    EXPECT_EQ(table(4).bounds, (platform::Bounds{360, 360, 2000, 2000}));
}

TEST_F(ShowingAnew, GivesARenamedTableItsTitleAndKeepsItsJoins) {
    customers->name = u"PEOPLE";
    showAnew();
    EXPECT_EQ(table(2).text, u"PEOPLE");
    EXPECT_TRUE(stage->exists("linJoin(1)"));
    stage->closeTable(2);
    EXPECT_FALSE(stage->exists("linJoin(1)")) << "its join goes with it under the new name";
}

TEST_F(ShowingAnew, MovesATableWhereTheModelWantsItWithItsLines) {
    const auto before = stage->look("linJoin(1)");
    customers->place(7500, 1500, 3000, 1500);
    showAnew();
    EXPECT_EQ(table(2).bounds, (platform::Bounds{7500, 1500, 3000, 1500}));
    EXPECT_EQ(stage->look("linJoin(1)").X2, before.X2 + 1500);
}

TEST_F(ShowingAnew, LeavesATableWhereItsUserPutItIfTheModelHasNoPlaceForIt) {
    stage->moveTable(2, 4500, 900);
    stage->resizeTable(2, 3000, 1800);
    customers->place(-1, -1, 0, 0);
    showAnew();
    EXPECT_EQ(table(2).bounds, (platform::Bounds{4500, 900, 3000, 1800}));
}

TEST_F(ShowingAnew, PutsATableBackOfWhichTheModelHadAPlaceMeanwhile) {
    model->table(u"ITEMS", {u"*"});
    showAnew();
    showAnew();
    const auto before = table(3).bounds;
    stage->moveTable(3, 4500, 900);
    stage->resizeTable(3, 3000, 1800);
    const auto placed = table(3).bounds; // to whole pixels, on a screen
    EXPECT_NE(placed, before);
    showAnew();
    EXPECT_EQ(table(3).bounds, placed);
    model->tableAt(3).place(-1, -1, 0, 0);
    showAnew();
    EXPECT_EQ(table(3).bounds, before);
}

TEST_F(ShowingAnew, AddsNewColumnsToAListWithoutTouchingTheOthers) {
    for (int n = 0; n < 20; ++n) orders->addColumn(u"C" + platform::decimal(n));
    showAnew();
    ASSERT_EQ(table(1).items.size(), 24U);
    stage->scrollList(1, 6);
    stage->selectEntries(1, {8, 9});
    const float scrolled = firstEntry(1);
    orders->addColumn(u"LAST");
    showAnew();
    EXPECT_EQ(table(1).items.back(), u"LAST");
    EXPECT_EQ(table(1).selected, (Texts{u"C3", u"C4"}));
    EXPECT_EQ(firstEntry(1), scrolled);
}

TEST_F(ShowingAnew, KeepsWhatIsSelectedInAListOfOtherColumns) {
    stage->selectEntries(1, {id, total});
    orders->columns.items.Remove(u"kCUSTOMER");
    orders->addColumn(u"PLACE");
    model->joins.items.Remove(join->key);
    showAnew();
    EXPECT_EQ(table(1).items, (Texts{u"*", u"ID", u"TOTAL", u"PLACE"}));
    EXPECT_EQ(table(1).selected, (Texts{u"ID", u"TOTAL"}));
}

TEST_F(ShowingAnew, DrawsTheJoinsThatTheModelHas) {
    model->joins.items.Remove(join->key);
    showAnew();
    EXPECT_FALSE(stage->exists("linJoin(1)"));
    EXPECT_FALSE(stage->exists("shpJoin(1)"));
    const auto other = model->join(orders, u"ID", customers, u"ID", 1, 2);
    showAnew();
    ASSERT_TRUE(stage->exists("linJoin(1)"));
    EXPECT_TRUE(stage->look("linJoin(1)").visible);
    const auto record = Backstage::mJoinLines(control()).Item(1);
    EXPECT_EQ(record->LeftColumnName(), u"ID");
    EXPECT_EQ(record->CompareOperator(), 2);
    EXPECT_EQ(record->Tag(), platform::Variant(other->key));
}

TEST_F(ShowingAnew, DrawsAJoinOfAnotherTypeOrBetweenOtherColumns) {
    join->joinType = 1;
    showAnew();
    EXPECT_EQ(stage->look("shpJoin(1)").shape, platform::shapeCircle);
    const auto before = stage->look("linJoin(1)");
    join->joinType = 0;
    join->leftColumn = std::shared_ptr<TalvikZandorLib::ZDColumn>(orders->columnRef(u"TOTAL"));
    showAnew();
    EXPECT_EQ(stage->look("shpJoin(1)").shape, platform::shapeSquare);
    EXPECT_GT(stage->look("linJoin(1)").Y1, before.Y1);
}

TEST_F(ShowingAnew, RemovesALineOfWhichTheModelKnowsNothing) {
    model->fail("Zandor.AddJoin", refusal());
    stage->selectEntries(1, {total});
    stage->dragToEntry(1, total, 2, name);
    model->calls->disarm();
    ASSERT_FALSE(model->joinCount() > 1);
    showAnew();
    EXPECT_EQ(Backstage::mJoinLines(control()).Count(), 1);
}

TEST_F(ShowingAnew, LeavesJoinsOutWhoseTablesAreNotShown) {
    for (int n = 3; n <= 18; ++n) model->table(u"T" + platform::decimal(n), {u"*", u"ID"});
    const Ref<fake::Table> last =
        std::dynamic_pointer_cast<fake::Table>(model->tables.items.Item(18));
    model->join(orders, u"ID", last, u"ID");
    showAnew();
    EXPECT_TRUE(shown(16));
    EXPECT_EQ(Backstage::mJoinLines(control()).Count(), 1);
    model->tables.items.Remove(customers->key);
    model->joins.items.Remove(join->key);
    model->tables.items.Remove(u"tT3");
    showAnew();
    EXPECT_EQ(Backstage::mJoinLines(control()).Count(), 1) << "there is room for it now";
}

TEST_F(ShowingAnew, ShowsWhatDefinitionsSayNow) {
    auto& first = model->definitionAt(1);
    first.synonym = u"Number";
    first.sortOrder = 2;
    first.visible = false;
    first.addCriterion(u"< 9", u"5");
    showAnew();
    EXPECT_EQ(column(1), (Texts{u"ID", u"Number", u"Descending", u"Not Visible", u"> 1", u"< 9"}));
    first.synonym = {};
    first.sortOrder = 0;
    first.visible = true;
    first.criteria.items = {};
    showAnew();
    EXPECT_EQ(column(1), (Texts{u"ID", u"", u"", u"Visible"}));
}

TEST_F(ShowingAnew, ShowsTextsThatTheEditorsUnderstand) {
    model->definitionAt(1).visible = false;
    showAnew();
    press(left, visibleRow, 1);
    EXPECT_EQ(stage->look("cobVisibility").listIndex, 1);
}

TEST_F(ShowingAnew, PutsTheColumnsIntoTheOrderOfTheModelWithTheirWidths) {
    grid().ColWidth(1, 2400);
    grid().ColWidth(3, 3000);
    const auto all = definitions();
    definitions() = {};
    for (const std::int32_t n : {3, 1, 2}) definitions().Add(all.Item(n), all.Item(n)->Key());
    showAnew();
    EXPECT_EQ(fields(4), (Texts{u"TOTAL", u"ID", u"NAME", u""}));
    EXPECT_EQ(grid().ColWidth(1), 3000);
    EXPECT_EQ(grid().ColWidth(2), 2400);
    EXPECT_EQ(stage->cell(criteriaRow, 2), u"> 1");
    EXPECT_EQ(grid().ColData(1), 3);
}

TEST_F(ShowingAnew, TakesAwayGhostsAndBringsBackWhatHadVanished) {
    // Columns of the model of before, texts in a blank column, and one taken away with a table
    // whose name begins with that of another.
    grid().TextMatrix(fieldRow, 5, u"GHOST");
    grid().TextMatrix(criteriaRow, 200, u"> 1");
    const auto ordersOld = model->table(u"ORDERS_OLD", {u"*", u"ID"});
    model->definition(ordersOld, u"ID");
    Backstage::RemoveColumn(control(), 2);
    showAnew();
    EXPECT_EQ(fields(6), (Texts{u"ID", u"NAME", u"TOTAL", u"ID", u"", u""}));
    EXPECT_EQ(stage->cell(criteriaRow, 200), u"");
    for (std::int32_t col = 1; col <= 5; ++col) EXPECT_EQ(grid().ColData(col), col == 5 ? 0 : col);
}

TEST_F(ShowingAnew, ClosesTheGapsThatADropLeft) {
    drag(1, {customer}, 9);
    ASSERT_EQ(stage->cell(fieldRow, 9), u"ORDERS.CUSTOMER");
    showAnew();
    EXPECT_EQ(fields(9), (Texts{u"ID", u"NAME", u"TOTAL", u"CUSTOMER", u"", u"", u"", u"", u""}));
}

TEST_F(ShowingAnew, FitsAColumnToItsFieldOnlyWhenThatIsAnother) {
    grid().ColWidth(1, 2400);
    grid().ColWidth(2, 2400);
    customers->column(u"NAME").name = u"FAMILY NAME";
    showAnew();
    EXPECT_EQ(grid().ColWidth(1), 2400);
    EXPECT_EQ(grid().ColWidth(2), stage->toolkit().TextWidth(u"FAMILY NAME") + 120);
}

TEST_F(ShowingAnew, ShowsAsManyDefinitionsAsThereAreColumns) {
    for (int n = 0; n < 300; ++n) model->definition(orders, u"ID");
    showAnew();
    EXPECT_EQ(grid().ColData(255), 255);
    definitions().Remove(u"x1");
    showAnew();
    EXPECT_EQ(grid().ColData(1), 2);
    EXPECT_EQ(grid().ColData(255), 256);
}

TEST_F(ShowingAnew, ShowsDefinitionsThatCannotBeTiedToTheirColumns) {
    model->definitionAt(1).key = u"first";
    model->definitionAt(3).key = u"x007";
    bind();
    for (int n = 0; n < 2; ++n) {
        showAnew();
        EXPECT_EQ(fields(4), (Texts{u"ID", u"NAME", u"TOTAL", u""}));
        EXPECT_EQ(grid().ColData(1), 0);
        EXPECT_EQ(grid().ColData(2), 2);
        EXPECT_EQ(stage->cell(criteriaRow, 1), u"> 1");
    }
}

TEST_F(ShowingAnew, MarksADefinitionThatHasLostItsColumn) {
    model->definitionAt(2).column = {};
    showAnew();
    EXPECT_EQ(fields(3), (Texts{u"ID", u"?", u"TOTAL"}));
    menuOverCell(synonymRow, 2, "mnuColumnDefinitionDelete");
    EXPECT_EQ(fields(3), (Texts{u"ID", u"TOTAL", u""}));
}

TEST_F(ShowingAnew, KeepsTheCurrentCellOnItsDefinition) {
    grid().Row(criteriaRow);
    grid().Col(3);
    definitions().Remove(u"x1");
    showAnew();
    EXPECT_EQ(grid().Col(), 2);
    EXPECT_EQ(grid().Row(), criteriaRow);
    definitions().Remove(u"x3");
    showAnew();
    EXPECT_EQ(grid().Col(), 2) << "where it was";
}

TEST_F(ShowingAnew, KeepsAnOpenEditorWithItsTextOverItsCell) {
    press(left, criteriaRow, 3);
    stage->type("txtValue", u"> 5");
    const float before = stage->look("fraValue").bounds.Left;
    definitions().Remove(u"x1");
    model->definitionAt(1).synonym = u"Somebody";
    showAnew();
    ASSERT_TRUE(shows("fraValue"));
    EXPECT_EQ(stage->look("txtValue").text, u"> 5");
    EXPECT_LT(stage->look("fraValue").bounds.Left, before);
    stage->clickButton("cmdSetTextValue");
    EXPECT_EQ(model->definitionAt(2).criterion(u"4"), u"> 5");
    EXPECT_EQ(stage->cell(criteriaRow, 2), u"> 5");
    EXPECT_FALSE(model->definitionAt(1).criteria.items.Contains(u"4"));
}

TEST_F(ShowingAnew, ClosesAnEditorWhoseDefinitionHasGone) {
    for (const std::int32_t row : {synonymRow, sortRow, visibleRow}) {
        const auto added = model->definition(orders, u"ID");
        showAnew();
        press(left, row, 4);
        definitions().Remove(added->key);
        showAnew();
        EXPECT_FALSE(shows("fraValue") || shows("fraSortOrder") || shows("fraVisibility"));
    }
}

TEST_F(ShowingAnew, ClosesAnEditorOverABlankColumnThatIsNoneAnyMore) {
    press(left, criteriaRow, 4);
    showAnew();
    EXPECT_TRUE(shows("fraValue"));
    model->definition(orders, u"ID");
    showAnew();
    EXPECT_FALSE(shows("fraValue"));
}

TEST_F(ShowingAnew, ShowsTheMenuEntriesThatTheHostWants) {
    control().LNGMnuDelColVis = false;
    showAnew();
    menuOverCell(synonymRow, 1);
    for (const auto& entry : menu)
        EXPECT_EQ(entry.visible, entry.name != u"mnuColumnDefinitionDelete");
}

TEST_F(ShowingAnew, ChangesNothingWhenTheModelFails) {
    for (const char* member :
         {"Zandor.Tables", "ZDTable.Name", "Columns.Item(position)", "ZDColumn.Marker",
          "ZDJoin.RightColumn", "ZDJoin.Key", "ZDColumnDefinition.Column", "ZDColumnDefinition.Key",
          "ZDCriterium.Criterium"}) {
        forget();
        customers->name = u"PEOPLE";
        model->definitionAt(1).synonym = u"Number";
        model->fail(member, refusal());
        control().ShowAnew();
        model->calls->disarm();
        EXPECT_EQ(stage->boxes, Boxes{report(u"ShowAnew", refusal())}) << member;
        EXPECT_EQ(table(2).text, u"CUSTOMERS") << member;
        EXPECT_EQ(stage->cell(synonymRow, 1), u"") << member;
    }
}

TEST_F(ShowingAnew, IsEmptyBeforeAModelWasBound) {
    const auto fresh = Stage::open(library);
    fresh->control().ShowAnew();
    EXPECT_EQ(fresh->boxes, Boxes{});
    EXPECT_FALSE(fresh->exists("lstTable(1)"));
}

/// Whatever a host does to its model, showing it anew leads to what a new control would show.
class ShowingAnewAtRandom : public ShowingAnew {
protected:
    int upTo(int most) { return std::uniform_int_distribution(0, most)(random); }

    Ref<fake::Table> anyTable() {
        return std::dynamic_pointer_cast<fake::Table>(
            model->tables.items.Item(1 + upTo(model->tableCount() - 1)));
    }
    String anyColumn(const fake::Table& from) {
        return from.columns.items.Item(1 + upTo(from.columns.items.Count() - 1))->Name();
    }

    void remove(const Ref<fake::Table>& gone) {
        for (std::int32_t n = model->joinCount(); n >= 1; --n) {
            const auto& each = model->joinAt(n);
            if (each.leftTable == gone || each.rightTable == gone)
                model->joins.items.Remove(each.key);
        }
        for (std::int32_t n = model->definitionCount(); n >= 1; --n)
            if (model->definitionAt(n).synonym.starts_with(gone->key + u"."))
                definitions().Remove(model->definitionAt(n).key);
        model->tables.items.Remove(gone->key);
    }

    void define(const Ref<fake::Table>& from) {
        const auto added = model->definition(from, anyColumn(*from));
        added->synonym = from->key + u"." + platform::decimal(upTo(9));
    }

    void change() {
        const auto table = anyTable();
        switch (upTo(9)) {
        case 0:
            if (model->tableCount() < 20)
                model->table(u"T" + platform::decimal(++tables), {u"*", u"A", u"B", u"C"})
                    ->place(static_cast<float>(upTo(9000)), static_cast<float>(upTo(9000)), 1800,
                            1500);
            return;
        case 1:
            if (model->tableCount() > 2) remove(table);
            return;
        case 2: table->name = u"T" + platform::decimal(++tables); return;
        case 3: table->place(static_cast<float>(upTo(9000)), 600, 2400, 1500); return;
        case 4: {
            const auto other = anyTable();
            model->join(table, anyColumn(*table), other, anyColumn(*other),
                        static_cast<std::int16_t>(upTo(3)));
            return;
        }
        case 5:
            if (model->joinCount() != 0)
                model->joins.items.Remove(model->joinAt(1 + upTo(model->joinCount() - 1)).key);
            return;
        case 6:
        case 7: define(table); return;
        case 8:
            if (model->definitionCount() != 0) {
                auto& changed = model->definitionAt(1 + upTo(model->definitionCount() - 1));
                changed.sortOrder = static_cast<std::int16_t>(upTo(2));
                changed.visible = upTo(1) == 0;
                changed.criteria.items = {};
                for (int n = upTo(3); n > 0; --n)
                    changed.addCriterion(u"> " + platform::decimal(n), platform::decimal(8 - n));
            }
            return;
        default:
            if (model->definitionCount() == 0) return;
            if (upTo(1) == 0)
                definitions().Remove(
                    model->definitionAt(1 + upTo(model->definitionCount() - 1)).key);
            else { // another order
                const auto all = definitions();
                definitions() = {};
                for (std::int32_t n = all.Count(); n >= 1; --n)
                    definitions().Insert(1 + upTo(definitions().Count()), all.Item(n),
                                         all.Item(n)->Key());
            }
        }
    }

    /// Tables, joins and cells as text, whatever slots they stand in.
    static std::string textOf(Stage& stage) {
        auto& control = stage.control();
        std::multiset<std::string> lines;
        for (const auto& [index, table] : Backstage::lstTable(control)) {
            if (index == 0) continue;
            const auto seen = stage.look("lstTable(" + std::to_string(index) + ")");
            std::string line = platform::toUtf8(table->Tag() + u" " + seen.text + u":");
            for (const auto& item : seen.items) line += platform::toUtf8(u" " + item);
            line += ' ' + std::to_string(seen.bounds.Left) + ' ' + std::to_string(seen.bounds.Top) +
                    ' ' + std::to_string(seen.bounds.Width) + ' ' +
                    std::to_string(seen.bounds.Height) + (seen.visible ? "" : " hidden");
            lines.insert(line);
        }
        for (const auto& record : platform::Each(
                 static_cast<const TalvikZandorLib::Collection<TalvikDBxZandor::clsJoinLine>&>(
                     Backstage::mJoinLines(control)))) {
            const auto line = stage.look("linJoin(" + std::to_string(record->Index()) + ")");
            lines.insert(
                platform::toUtf8(std::get<String>(record->Tag()) + u" " + record->LeftTableName() +
                                 u"." + record->LeftColumnName() + u" " + record->RightTableName() +
                                 u"." + record->RightColumnName()) +
                ' ' + std::to_string(record->JoinType()) + ' ' + std::to_string(line.X1) + ' ' +
                std::to_string(line.Y1) + ' ' + std::to_string(line.X2) + ' ' +
                std::to_string(line.Y2));
        }
        std::string text;
        for (const auto& line : lines) text += line + '\n';
        const auto& grid = *Backstage::sprColumn(control);
        for (std::int32_t col = 1; col < grid.Cols(); ++col) {
            text += std::to_string(grid.ColData(col));
            for (std::int32_t row = 0; row < grid.Rows(); ++row)
                text += '|' + platform::toUtf8(stage.cell(row, col));
            if (grid.ColData(col) != 0) text += ' ' + std::to_string(grid.ColWidth(col));
            text += '\n';
        }
        return text;
    }

    std::mt19937 random;
    int tables = 0;
};

TEST_F(ShowingAnewAtRandom, LeadsToWhatANewControlShows) {
    const auto seed = std::random_device()();
    random.seed(seed);
    SCOPED_TRACE("seed " + std::to_string(seed));
    const int rounds = std::max(3, 60 / sampleStep());
    for (int round = 0; round < rounds; ++round) {
        for (int n = upTo(6); n >= 0; --n) change();
        showAnew();
        const auto fresh = Stage::open(library);
        fresh->control().DebugSwitch(0);
        fresh->control().OnlyJoin(false);
        // Not bound, which would have its own way with joins that have lost their tables.
        Backstage::mModel(fresh->control()) = std::shared_ptr<TalvikZandorLib::Zandor>(model);
        fresh->control().ShowAnew();
        ASSERT_EQ(textOf(*stage), textOf(*fresh));
    }
}

} // namespace gridstage
