#include "control_on_headless/MeanwhileTest.h"

namespace gridstage {

namespace {

class AHostInTheMiddle : public MeanwhileTest {
protected:
    void bindAnother() { control().P_SET_Zandor(library.newModel()); }
};

TEST_F(AHostInTheMiddle, IsToldOfNoJoinThatItsOtherModelHasNot) {
    bind();
    when("ZDJoin.Key", [this] { bindAnother(); });
    stage->selectEntries(1, {id});
    stage->dragToEntry(1, id, 2, name);
    EXPECT_EQ(events(), Names{"Activate"});
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AHostInTheMiddle, LearnsTheNameOfATableThatItTookAwayItself) {
    class Showing final : public fake::Model {
    public:
        using Model::Model;
        void DeleteTable(const Ref<TalvikZandorLib::ZDTable>& table) override {
            Model::DeleteTable(table);
            shown->ShowAnew();
        }
        TalvikDBxZandor::Zandor* shown = nullptr;
    };
    const auto showing = zandor::platform::makeRef<Showing>(library.calls);
    showing->shown = &control();
    model = showing;
    addOrders(*model);
    addCustomers(*model);
    bind();
    stage->closeTable(2);
    EXPECT_EQ(control().DeletedTable, u"CUSTOMERS");
    EXPECT_EQ(events(), Names{"TableDeleted"});
    EXPECT_FALSE(stage->exists("lstTable(2)"));
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AHostInTheMiddle, FindsANewTableWhereTheCascadePutsItAndNotWhereAnotherStood) {
    const auto unplaced = [this](const String& name) { return model->table(name, {u"*", u"ID"}); };
    bind();
    const auto first = unplaced(u"FIRST");
    control().ShowAnew();
    Backstage::lstTable(control())(3)->setBounds({6000, 3000, 1500, 1500});
    control().ShowAnew();
    first->place(3000, 3000, 1500, 1500);
    control().ShowAnew();
    stage->closeTable(3);
    unplaced(u"SECOND");
    control().ShowAnew();
    const auto placed = stage->look("lstTable(3)").bounds;
    control().ShowAnew();
    EXPECT_EQ(stage->look("lstTable(3)").bounds, placed);
    EXPECT_NE(placed.Left, 6000);
    EXPECT_EQ(stage->boxes, Boxes{});
}

TEST_F(AHostInTheMiddle, FindsATypedTextInNoOtherCellThoughItShowsTheModelAnother) {
    model->definition(orders, u"ID");
    model->definition(customers, u"NAME");
    const auto typed = [this](const std::function<void()>& deed) {
        bind();
        stage->onEvent = [this, deed] {
            if (stage->raised.back().event == Event::ColumnModified) deed();
        };
        press(left, synonymRow, 1);
        stage->type("txtValue", u"S");
        stage->clickButton("cmdSetTextValue");
        stage->onEvent = nullptr;
        EXPECT_EQ(stage->boxes, Boxes{});
    };
    typed([this] { control().P_SET_Zandor(std::shared_ptr<TalvikZandorLib::Zandor>(model)); });
    EXPECT_EQ(stage->cell(synonymRow, 1), u"S");
    for (const std::int32_t row : {fieldRow, sortRow, visibleRow, criteriaRow, criteriaRow + 1})
        EXPECT_NE(stage->cell(row, 1), u"S") << row;

    typed([this] {
        auto& items = model->definitions.items;
        const auto first = items.Item(1);
        items.Remove(first->Key());
        items.Add(first, first->Key());
        control().ShowAnew();
    });
    EXPECT_EQ(fields(2), (Texts{u"NAME", u"ID"}));
    EXPECT_EQ(stage->cell(synonymRow, 1), u"");
    EXPECT_EQ(stage->cell(synonymRow, 2), u"S");
}

} // namespace

} // namespace gridstage
