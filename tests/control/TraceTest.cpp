#include "control/ShellFixture.h"

#include <algorithm>

using namespace zandor;

namespace {

/// One table, two of its columns selected, and a focus that stays where it is: a table list that
/// takes it would tell more.
class TheTraces : public AControl {
protected:
    TheTraces() {
        table = model->table(u"ORDERS", {u"ID", u"TOTAL", u"NOTE"});
        table->place(150, 150, 2400, 2400);
    }

    void hideTable() { Backstage::lstTable(zandor())(1)->Visible(false); }

    /// The texts of the boxes, each behind its title.
    std::vector<String> told() {
        std::vector<String> result;
        for (const auto& box : stage->boxes) {
            EXPECT_EQ(box.style, 4096) << platform::toUtf8(box.text);
            result.push_back(box.title + u"/" + box.text);
        }
        return result;
    }

    static bool inOrder(const std::vector<String>& all, const std::vector<String>& wanted) {
        auto at = all.begin();
        for (const String& text : wanted) {
            at = std::find(at, all.end(), text);
            if (at == all.end()) return false;
            ++at;
        }
        return true;
    }

    platform::Ref<fake::Model> model = library.newModel();
    platform::Ref<fake::Table> table;
};

} // namespace

TEST_F(TheTraces, TellOfTheBindingUnderTheNameOfTheControlAndThenOfTheProcedure) {
    table->column(u"ID").selected = true;
    table->column(u"NOTE").selected = true;
    zandor().DebugSwitch(1);
    bind(model);
    const auto all = told();
    EXPECT_TRUE(inOrder(all, {u"TalvikDBxZandor.Zandor/SetZandor", u"SetZandor/Select column: ID",
                              u"SetZandor/Column selected: ID", u"SetZandor/Select column: NOTE",
                              u"SetZandor/Column selected: NOTE", u"SetZandor/Table visible.",
                              u"TalvikDBxZandor.Zandor/SetCurrentTable",
                              u"TalvikDBxZandor.Zandor/Looking for Table: ORDERS",
                              u"TalvikDBxZandor.Zandor/Table found.",
                              u"TalvikDBxZandor.Zandor/Table refreshed."}));
    EXPECT_EQ(all.front(), u"TalvikDBxZandor.Zandor/SetZandor");
    EXPECT_EQ(std::count(all.begin(), all.end(), u"SetZandor/Select column: TOTAL"), 0);
    EXPECT_EQ(std::count(all.begin(), all.end(), u"SetZandor/Table visible."), 1);
}

TEST_F(TheTraces, TellOfATableMadeCurrent) {
    bind(model);
    hideTable();
    zandor().DebugSwitch(1);
    forget();
    zandor().SetCurrentTable(u"ORDERS");
    EXPECT_EQ(stage->boxes,
              (std::vector{trace(u"SetCurrentTable"), trace(u"Looking for Table: ORDERS"),
                           trace(u"Table found."), trace(u"Table refreshed."),
                           trace(u"SetSelectedTable")}));
}

TEST_F(TheTraces, TellOfTheSearchBeforeItBegins) {
    zandor().DebugSwitch(1);
    zandor().SetCurrentTable(u"PARTS");
    EXPECT_EQ(stage->boxes,
              (std::vector{trace(u"SetCurrentTable"), trace(u"Looking for Table: PARTS")}));
}

TEST_F(TheTraces, TellOfAColumnFoundInAPlainBoxWithTheWholeLiteral) {
    bind(model);
    zandor().DebugSwitch(1);
    forget();
    zandor().SelectColumnNames(u"ORDERS", u"TOTAL");
    const Stage::Box found{u"Column found., vbSystemModal, FUNCTION_NAME",
                           u"TalvikDBxZandor.Zandor", 0};
    EXPECT_EQ(stage->boxes, (std::vector{trace(u"SelectColumnNames"), found}));
}

TEST_F(TheTraces, TellThatTheControlTerminates) {
    zandor().DebugSwitch(1);
    zandor().Terminate();
    EXPECT_EQ(stage->boxes, std::vector{trace(u"Terminate")});
}

TEST_F(TheTraces, TellThatTheControlIsClosedBeforeItTerminates) {
    zandor().DebugSwitch(1);
    Backstage::UserControl_Terminate(zandor());
    EXPECT_EQ(stage->boxes, (std::vector{trace(u"UserControl_Terminate"), trace(u"Terminate")}));
}

TEST_F(TheTraces, AreOnForAnyNumberButZero) {
    for (const std::int16_t on : {-1, 1, 2, -32768}) {
        zandor().DebugSwitch(on);
        forget();
        zandor().SetCurrentTable(u"PARTS");
        EXPECT_EQ(stage->boxes.size(), 2U) << on;
    }
}

TEST_F(TheTraces, AreNowhereWithTheSwitchAtZeroWhileUnexpectedErrorsStillAre) {
    table->column(u"ID").selected = true;
    bind(model);
    zandor().SetCurrentTable(u"ORDERS");
    zandor().SelectColumnNames(u"ORDERS", u"ID");
    stage->closeTable(1);
    bind(model);
    zandor().Terminate();
    EXPECT_TRUE(stage->boxes.empty());
    zandor().HorizMaxScrollPos(-1);
    EXPECT_EQ(stage->boxes, std::vector{invalidValue(u"P_LET HorizMaxScrollPos")});
}
