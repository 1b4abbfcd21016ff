#include "CanvasTest.h"

#include <functional>
#include <map>
#include <set>

using namespace zandor;

namespace {

/// Runs a procedure of the canvas once for each member of the model that it uses, with a model
/// that fails in that member.
class OnABrokenModel : public CanvasTest {
protected:
    /// The boxes shown for each member that fails.
    using Expected = std::map<std::string, Texts>;

    void start() {
        stage.reset();
        library.calls->disarm();
        model = library.newModel();
        stage = Stage::open(library);
        control().DebugSwitch(0);
        first = table(u"A", {u"ID", u"NAME"}, 600);
        second = table(u"B", {u"ID"}, 6000);
        bind();
        stage->selectEntries(1, {1, 2});
    }

    void runWithEachMemberBroken(const std::function<void()>& procedure, const Expected& expected) {
        start();
        library.calls->remember(true);
        library.calls->forget();
        procedure();
        const std::set<std::string> used(library.calls->calls().begin(),
                                         library.calls->calls().end());
        library.calls->remember(false);
        EXPECT_EQ(told(), Texts{}) << "with nothing broken";

        std::set<std::string> named;
        for (const auto& [member, boxes] : expected) named.insert(member);
        EXPECT_EQ(used, named);

        for (const auto& [member, boxes] : expected) {
            SCOPED_TRACE(member);
            start();
            model->fail(member, broken());
            procedure();
            EXPECT_EQ(told(), boxes);
            EXPECT_FALSE(library.calls->isArmed(member));
        }
    }

    void runWithEachMemberBroken(const std::string& reportName,
                                 std::initializer_list<const char*> members,
                                 const std::function<void()>& procedure) {
        Expected expected;
        for (const char* member : members) expected[member] = {brokenIn(reportName)};
        runWithEachMemberBroken(procedure, expected);
    }

    Ref<fake::Table> first, second;
};

TEST_F(OnABrokenModel, SelectingATableReportsUnderItsName) {
    runWithEachMemberBroken("SetSelectedTable",
                            {"Zandor.Tables", "Tables.Count", "Tables.Item(position)",
                             "ZDTable.Key", "ZDTable.Selected="},
                            [&] { Back::SetSelectedTable(control(), u"tB"); });
}

TEST_F(OnABrokenModel, ShowingTheSelectedTableReportsUnderTheNameOfTheProcedureThatFailed) {
    const Texts own{brokenIn("ShowSelectedTable")};
    const Texts deeper{brokenIn("SetSelectedTable")};
    runWithEachMemberBroken([&] { Back::ShowSelectedTable(control()); },
                            {{"Zandor.Tables", own},
                             {"Tables.Count", own},
                             {"Tables.Item(position)", own},
                             {"ZDTable.Selected", own},
                             {"ZDTable.Name", own},
                             {"ZDTable.Key", deeper},
                             {"ZDTable.Selected=", deeper}});
}

TEST_F(OnABrokenModel, ClosingATableReportsUnderItsName) {
    runWithEachMemberBroken("lstTable_CloseClick",
                            {"Zandor.Tables", "Tables.Item(key)", "Zandor.DeleteTable"},
                            [&] { Back::lstTable_CloseClick(control(), std::int16_t{1}); });
}

TEST_F(OnABrokenModel, MovingATableReportsUnderItsName) {
    runWithEachMemberBroken("lstTable_Moved",
                            {"Zandor.Tables", "Tables.Item(key)", "ZDTable.Left=", "ZDTable.Top="},
                            [&] { Back::lstTable_Moved(control(), std::int16_t{1}); });
}

TEST_F(OnABrokenModel, ResizingATableReportsUnderItsName) {
    runWithEachMemberBroken(
        "lstTable_Resized",
        {"Zandor.Tables", "Tables.Item(key)", "ZDTable.Width=", "ZDTable.Height="},
        [&] { Back::lstTable_Resized(control(), std::int16_t{1}); });
}

TEST_F(OnABrokenModel, PressingAColumnReportsUnderItsName) {
    runWithEachMemberBroken("lstTable_ColumnMouseDown",
                            {"Zandor.Tables", "Tables.Item(key)", "ZDTable.Columns",
                             "Columns.Item(key)", "ZDColumn.activated="},
                            [&] {
                                Back::lstTable_ColumnMouseDown(control(), std::int16_t{1},
                                                               Ref<ColumnItem>(), std::int16_t{1},
                                                               std::int16_t{0});
                            });
}

TEST_F(OnABrokenModel, CollectingDragRecordsReportsUnderItsName) {
    runWithEachMemberBroken(
        "GetDragColumns",
        {"Zandor.Tables", "Tables.Item(key)", "ZDTable.Columns", "Columns.Item(key)"},
        [&] { Back::GetDragColumns(control(), std::int16_t{1}); });
}

TEST_F(OnABrokenModel, DroppingOnATableReportsUnderTheNameOfTheProcedureThatFailed) {
    const Texts own{brokenIn("lstTable_DragDrop")};
    const Texts deeper{brokenIn("AddNewJoin")};
    Expected expected;
    for (const char* member : {"Zandor.Tables", "Tables.Item(key)", "ZDTable.Columns",
                               "Columns.Item(key)", "Zandor.Joins", "Joins.Item(key)"})
        expected[member] = own;
    for (const char* member : {"Library.NewZDJoin", "ZDJoin.LeftTable=", "ZDJoin.LeftColumn=",
                               "ZDJoin.RightTable=", "ZDJoin.RightColumn=", "ZDJoin.JoinType=",
                               "ZDJoin.CompareOperator=", "Zandor.AddJoin", "ZDJoin.Key"})
        expected[member] = deeper;

    runWithEachMemberBroken(
        [&] {
            auto record = platform::makeRef<TalvikDBxZandor::clsDragColumn>(stage->toolkit());
            record->TableIndex(1);
            record->Table(element(1));
            record->Column(element(1)->ColumnItems().Item(1));
            record->ZDTable(std::shared_ptr<TalvikZandorLib::ZDTable>(first));
            record->ZDColumn(std::shared_ptr<TalvikZandorLib::ZDColumn>(first->columnRef(u"ID")));
            Back::mDragColumns(control()) = {record};
            const auto at = entryPoint(2, 1);
            Back::lstTable_DragDrop(control(), std::int16_t{2}, nullptr, at.X, at.Y);
        },
        expected);
}

TEST_F(OnABrokenModel, ShowingTablesReportsUnderTheNameOfTheBinding) {
    Expected expected;
    for (const char* member : {"Zandor.Tables",
                               "Tables.Count",
                               "Tables.Item(position)",
                               "ZDTable.Name",
                               "ZDTable.Left",
                               "ZDTable.Top",
                               "ZDTable.Width",
                               "ZDTable.Height",
                               "ZDTable.Columns",
                               "ZDTable.Selected",
                               "Columns.Count",
                               "Columns.Item(position)",
                               "ZDColumn.Name",
                               "ZDColumn.Key",
                               "ZDColumn.Marker",
                               "ZDColumn.Selected",
                               "Zandor.Joins",
                               "Joins.Count",
                               "Zandor.ColumnDefinitions",
                               "ColumnDefinitions.Count",
                               "ZDTable.Key"})
        expected[member] = {brokenIn("SetZandor")};
    expected["ZDTable.Selected="] = {brokenIn("SetSelectedTable")};

    runWithEachMemberBroken(
        [&] {
            for (const std::int16_t slot : {1, 2}) Back::RemoveTable(control(), slot);
            Back::SetZandor(control());
        },
        expected);
}

TEST_F(OnABrokenModel, AForeignExceptionIsReportedWithItsText) {
    start();
    model->fail("ZDTable.Left=", std::runtime_error("no connection"));
    Back::lstTable_Moved(control(), std::int16_t{1});
    EXPECT_EQ(told(), Texts{report("lstTable_Moved", 440, "no connection")});
    EXPECT_EQ(events(), Texts{});
}

TEST_F(OnABrokenModel, AModelThatAnswersWithNothingIsReported) {
    start();
    first->columns.items.Remove(u"kID");
    first->columns.items.Add({}, u"kID");
    Back::lstTable_ColumnMouseDown(control(), std::int16_t{1}, Ref<ColumnItem>(), std::int16_t{1},
                                   std::int16_t{0});
    EXPECT_EQ(told(), Texts{notSet("lstTable_ColumnMouseDown")});
    EXPECT_EQ(first->column(u"NAME").activatedValue, -1) << "the list's first entry comes first";
}

} // namespace
