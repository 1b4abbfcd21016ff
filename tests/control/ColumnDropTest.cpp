#include "GridStage.h"

using namespace zandor;

namespace gridstage {

class ADropOnTheGrid : public GridTest {
protected:
    ADropOnTheGrid() {
        model->definition(customers, u"ID");
        model->definition(customers, u"NAME");
        model->definition(orders, u"TOTAL");
        bind();
    }

    fake::Definition& created(std::size_t event) {
        return dynamic_cast<fake::Definition&>(*stage->raised.at(event).arguments.Definition);
    }
};

TEST_F(ADropOnTheGrid, InsertsTheDraggedColumnsSideBySideInTheirOrder) {
    drag(1, {id, customer, total}, 2);
    EXPECT_EQ(fields(7), (Texts{u"ID", u"ORDERS.ID", u"ORDERS.CUSTOMER", u"ORDERS.TOTAL", u"NAME",
                                u"TOTAL", u""}));
    EXPECT_EQ(events(), (Names{"ColumnCreated", "ColumnCreated", "ColumnCreated", "Activate"}));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(ADropOnTheGrid, HandsOutEachDefinitionAsTheModelStoresIt) {
    model->storesCopies = true;
    drag(1, {id, total}, 1);
    ASSERT_EQ(model->definitionCount(), 5);
    ASSERT_EQ(stage->raised.size(), 3U);
    EXPECT_EQ(&created(0), &model->definitionAt(4));
    EXPECT_EQ(&created(1), &model->definitionAt(5));
    EXPECT_EQ(created(0).column.get(), orders->columnRef(u"ID").get());
    EXPECT_EQ(created(1).column.get(), orders->columnRef(u"TOTAL").get());
}

TEST_F(ADropOnTheGrid, MakesVisibleUnsortedDefinitionsWithoutSynonym) {
    drag(1, {id}, 1);
    EXPECT_TRUE(created(0).visible);
    EXPECT_EQ(created(0).sortOrder, 0);
    EXPECT_EQ(created(0).synonym, u"");
    EXPECT_EQ(stage->cell(visibleRow, 1), u"Visible");
    EXPECT_EQ(stage->cell(synonymRow, 1), u"");
    EXPECT_EQ(stage->cell(sortRow, 1), u"");
}

TEST_F(ADropOnTheGrid, SaysEverythingOfANewDefinitionItselfAndLeavesNothingToTheLibrary) {
    Names calls;
    library.calls->onPass = [&](const std::string& call) {
        if (call.starts_with("ZDColumnDefinition.") && call.ends_with("=")) calls.push_back(call);
    };
    drag(1, {id}, 1);
    library.calls->onPass = nullptr;
    EXPECT_EQ(calls, (Names{"ZDColumnDefinition.Column=", "ZDColumnDefinition.Visible=",
                            "ZDColumnDefinition.SortOrder=", "ZDColumnDefinition.Synonym="}));
}

TEST_F(ADropOnTheGrid, MakesAColumnAsWideAsItsFieldAnd120Twips) {
    drag(1, {customer}, 2);
    EXPECT_EQ(grid().ColWidth(2), stage->toolkit().TextWidth(u"ORDERS.CUSTOMER") + 120);
}

TEST_F(ADropOnTheGrid, TiesEachColumnToItsDefinition) {
    drag(1, {id, total}, 2);
    for (std::int32_t col = 1; col <= 5; ++col)
        EXPECT_EQ(grid().ColData(col), (std::vector{1, 4, 5, 2, 3})[std::size_t(col) - 1]);
}

TEST_F(ADropOnTheGrid, InsertsAtTheFirstColumnOnTheLabels) {
    drag(1, {id}, 0);
    EXPECT_EQ(fields(2), (Texts{u"ORDERS.ID", u"ID"}));
}

TEST_F(ADropOnTheGrid, TakesNoNoticeOfTheRow) {
    stage->selectEntries(1, {id});
    stage->dragToCell(1, id, fieldRow, 2);
    EXPECT_EQ(fields(3), (Texts{u"ID", u"ORDERS.ID", u"NAME"}));
}

TEST_F(ADropOnTheGrid, OfAllColumnsInsertsTheAsterisk) {
    drag(1, {allColumns}, 1);
    EXPECT_EQ(fields(1), Texts{u"ORDERS.*"});
    EXPECT_EQ(events(), (Names{"ColumnCreated", "Activate"}));
}

TEST_F(ADropOnTheGrid, ForgetsTheDraggedColumns) {
    drag(1, {id}, 1);
    EXPECT_TRUE(Backstage::mDragColumns(control()).empty());
}

TEST_F(ADropOnTheGrid, WithoutDraggedColumnsDoesNothing) {
    Backstage::sprColumn_DragDrop(control(), nullptr, 3000.0F, 300.0F);
    EXPECT_EQ(fields(4), (Texts{u"ID", u"NAME", u"TOTAL", u""}));
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(ADropOnTheGrid, OverwritesTheFieldAndTheVisibilityOfATakenLastColumn) {
    const std::int32_t last = grid().Cols() - 1;
    grid().TextMatrix(fieldRow, last, u"OLD");
    grid().TextMatrix(synonymRow, last, u"Old synonym");
    grid().TextMatrix(visibleRow, last, u"Invisible");
    grid().ColData(last, 1);
    drag(1, {id}, 2);
    EXPECT_EQ(stage->cell(fieldRow, 2), u"ORDERS.ID");
    EXPECT_EQ(stage->cell(visibleRow, 2), u"Visible");
    EXPECT_EQ(stage->cell(synonymRow, 2), u"Old synonym");
    EXPECT_EQ(stage->cell(fieldRow, last), u"");
    EXPECT_EQ(grid().ColData(2), 4);
    EXPECT_EQ(grid().Cols() - 1, last);
}

TEST_F(ADropOnTheGrid, OnTheLastColumnMovesNothing) {
    const std::int32_t last = grid().Cols() - 1;
    stage->scrollGrid(1, last);
    drag(1, {id}, last);
    EXPECT_EQ(stage->cell(fieldRow, last), u"ORDERS.ID");
    EXPECT_EQ(fields(4), (Texts{u"ID", u"NAME", u"TOTAL", u""}));
    EXPECT_EQ(events(), (Names{"ColumnCreated", "Activate"}));
}

TEST_F(ADropOnTheGrid, BeyondTheLastColumnReportsWhatTheGridRefusesAndKeepsTheDefinition) {
    const std::int32_t last = grid().Cols() - 1;
    stage->scrollGrid(1, last);
    drag(1, {id, total}, last);
    EXPECT_EQ(stage->cell(fieldRow, last), u"ORDERS.ID");
    EXPECT_EQ(events(), Names{"ColumnCreated"});
    EXPECT_EQ(model->definitionCount(), 5);
    EXPECT_EQ(stage->boxes,
              (Boxes{report(u"InsertColumnDefinition", platform::errors::invalidCol()),
                     report(u"AddNewAndCriterium", platform::errors::invalidCol()),
                     report(u"sprColumn_DragDrop", platform::errors::invalidCol())}));
}

// A definition that cannot be looked up: the column stays opened, the definition stays in the
// model, and neither it nor the drop is told of.
TEST_F(ADropOnTheGrid, EndsWithAReportWhenTheNewDefinitionCannotBeFound) {
    model->fail("ColumnDefinitions.Item(key)", refusal());
    drag(1, {id, total}, 2);
    EXPECT_EQ(stage->boxes, Boxes{report(u"sprColumn_DragDrop", refusal())});
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(fields(4), (Texts{u"ID", u"ORDERS.ID", u"NAME", u"TOTAL"}));
    EXPECT_EQ(model->definitionCount(), 4);
    EXPECT_EQ(Backstage::mDragColumns(control()).size(), 2U);
}

TEST_F(ADropOnTheGrid, ReportsAModelThatRefusesTheDefinitionAndLeavesTheColumnUntied) {
    model->fail("Zandor.AddColumnDefinition", refusal());
    drag(1, {id}, 2);
    EXPECT_EQ(stage->boxes,
              (Boxes{report(u"AddNewAndCriterium", refusal()),
                     report(u"sprColumn_DragDrop", platform::errors::invalidProcedureCall())}));
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->cell(fieldRow, 2), u"ORDERS.ID");
    EXPECT_EQ(grid().ColData(2), 0);
    EXPECT_EQ(model->definitionCount(), 3);
}

/// Makes definitions under a key of the test's choosing.
class NamingModel final : public TalvikZandorLib::Zandor {
public:
    NamingModel(Ref<fake::Model> model, String key)
        : mModel(std::move(model)), mKey(std::move(key)) {}
    TalvikZandorLib::Collection<TalvikZandorLib::ZDTable>& Tables() override {
        return mModel->Tables();
    }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDJoin>& Joins() override {
        return mModel->Joins();
    }
    TalvikZandorLib::EditableCollection<TalvikZandorLib::ZDColumnDefinition>&
    ColumnDefinitions() override {
        return mModel->ColumnDefinitions();
    }
    Ref<TalvikZandorLib::ZDJoin> AddJoin(const Ref<TalvikZandorLib::ZDJoin>& join) override {
        return mModel->AddJoin(join);
    }
    Ref<TalvikZandorLib::ZDColumnDefinition>
    AddColumnDefinition(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition) override {
        dynamic_cast<fake::Definition&>(*definition).key = mKey;
        mModel->definitions.items.Add(definition, mKey);
        return definition;
    }
    void DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) override {
        mModel->DeleteTable(table);
    }

private:
    Ref<fake::Model> mModel;
    String mKey;
};

class TheKeyOfADefinition : public GridTest {
protected:
    std::int32_t storedFor(const String& key) {
        control().P_SET_Zandor(
            Ref<TalvikZandorLib::Zandor>(std::make_shared<NamingModel>(model, key)));
        forget();
        grid().ColData(1, 99);
        Backstage::AddNewAndCriterium(control(),
                                      Ref<TalvikZandorLib::ZDColumn>(orders->columnRef(u"ID")), 1);
        return grid().ColData(1);
    }
};

TEST_F(TheKeyOfADefinition, IsStoredAsItsNumber) { EXPECT_EQ(storedFor(u"x7"), 7); }
TEST_F(TheKeyOfADefinition, IsStoredAsZeroWithoutDigits) { EXPECT_EQ(storedFor(u"x"), 0); }
TEST_F(TheKeyOfADefinition, IsStoredAsZeroWhenEmpty) { EXPECT_EQ(storedFor(u""), 0); }
TEST_F(TheKeyOfADefinition, IsStoredAsZeroWhenAnotherLetterComesFirst) {
    EXPECT_EQ(storedFor(u"xy12"), 0);
}
TEST_F(TheKeyOfADefinition, IsStoredByItsLeadingDigits) { EXPECT_EQ(storedFor(u"x12y3"), 12); }

TEST_F(TheKeyOfADefinition, IsAnOverflowBeyond32BitsAndLeavesTheColumn) {
    EXPECT_EQ(storedFor(u"x2147483648"), 99);
    EXPECT_EQ(stage->boxes, Boxes{report(u"AddNewAndCriterium", platform::errors::overflow())});
}

TEST_F(TheKeyOfADefinition, RaisesNoEventOfItsOwn) {
    storedFor(u"x7");
    EXPECT_EQ(events(), Names{});
    EXPECT_EQ(stage->boxes, Boxes{});
}

} // namespace gridstage
