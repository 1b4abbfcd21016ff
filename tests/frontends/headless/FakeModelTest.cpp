#include "support/FakeModel.h"

#include "frontends/headless/Bench.h"

#include <set>

using namespace zandor;

namespace {

/// Uses every member of a model once; a failure of one does not keep the next from its turn.
std::vector<std::string> failuresOfEveryMember(fake::Library& library, fake::Model& model) {
    std::vector<std::string> failures;
    const auto use = [&failures](const std::string& name, auto&& action) {
        try {
            action();
        } catch (const platform::RuntimeError& error) {
            failures.push_back(name + " " + std::to_string(error.Number));
        }
    };
    auto collection = [&use](const std::string& name, auto& items, const platform::String& key) {
        use(name, [&] { items.Count(); });
        use(name, [&] { items.Item(1); });
        use(name, [&] { items.Item(key); });
    };
    TalvikZandorLib::Zandor& zandor = model;
    auto& table = static_cast<TalvikZandorLib::ZDTable&>(model.tableAt(1));
    auto& join = static_cast<TalvikZandorLib::ZDJoin&>(model.joinAt(1));
    auto& definition = static_cast<TalvikZandorLib::ZDColumnDefinition&>(model.definitionAt(1));
    auto& column = static_cast<TalvikZandorLib::ZDColumn&>(model.tableAt(1).column(u"ID"));
    const auto criterium = model.definitionAt(1).criteria.items.Item(1);

    use("Zandor", [&] { zandor.Tables(); });
    use("Zandor", [&] { zandor.Joins(); });
    use("Zandor", [&] { zandor.ColumnDefinitions(); });
    platform::Ref<TalvikZandorLib::ZDJoin> newJoin;
    platform::Ref<TalvikZandorLib::ZDColumnDefinition> newDefinition;
    use("Library", [&] { library.NewZandor(); });
    use("Library", [&] { newJoin = library.NewZDJoin(); });
    use("Library", [&] { newDefinition = library.NewZDColumnDefinition(); });
    if (newJoin.get()) use("Zandor", [&] { zandor.AddJoin(newJoin); });
    if (newDefinition.get()) use("Zandor", [&] { zandor.AddColumnDefinition(newDefinition); });

    use("ZDColumn", [&] { column.Name(); });
    use("ZDColumn", [&] { column.Key(); });
    use("ZDColumn", [&] { column.Marker(); });
    use("ZDColumn", [&] { column.Selected(); });
    use("ZDColumn", [&] { column.Selected(true); });
    use("ZDColumn", [&] { column.activated(1); });

    use("ZDTable", [&] { table.Name(); });
    use("ZDTable", [&] { table.Key(); });
    use("ZDTable", [&] { table.Left(); });
    use("ZDTable", [&] { table.Left(1); });
    use("ZDTable", [&] { table.Top(); });
    use("ZDTable", [&] { table.Top(1); });
    use("ZDTable", [&] { table.Width(); });
    use("ZDTable", [&] { table.Width(1); });
    use("ZDTable", [&] { table.Height(); });
    use("ZDTable", [&] { table.Height(1); });
    use("ZDTable", [&] { table.Selected(); });
    use("ZDTable", [&] { table.Selected(1); });
    use("ZDTable", [&] { table.Columns(); });

    use("ZDJoin", [&] { join.LeftTable(); });
    use("ZDJoin", [&] { join.LeftTable({}); });
    use("ZDJoin", [&] { join.LeftColumn(); });
    use("ZDJoin", [&] { join.LeftColumn({}); });
    use("ZDJoin", [&] { join.RightTable(); });
    use("ZDJoin", [&] { join.RightTable({}); });
    use("ZDJoin", [&] { join.RightColumn(); });
    use("ZDJoin", [&] { join.RightColumn({}); });
    use("ZDJoin", [&] { join.JoinType(); });
    use("ZDJoin", [&] { join.JoinType(1); });
    use("ZDJoin", [&] { join.CompareOperator(); });
    use("ZDJoin", [&] { join.CompareOperator(1); });
    use("ZDJoin", [&] { join.Key(); });

    use("ZDCriterium", [&] { criterium->Criterium(); });
    use("ZDCriterium", [&] { criterium->Criterium(u"= 2"); });

    use("ZDColumnDefinition", [&] { definition.Column(); });
    use("ZDColumnDefinition", [&] { definition.Column({}); });
    use("ZDColumnDefinition", [&] { definition.Synonym(); });
    use("ZDColumnDefinition", [&] { definition.Synonym(u"s"); });
    use("ZDColumnDefinition", [&] { definition.SortOrder(); });
    use("ZDColumnDefinition", [&] { definition.SortOrder(1); });
    use("ZDColumnDefinition", [&] { definition.Visible(); });
    use("ZDColumnDefinition", [&] { definition.Visible(false); });
    use("ZDColumnDefinition", [&] { definition.Key(); });
    use("ZDColumnDefinition", [&] { definition.Criteria(); });
    use("ZDColumnDefinition", [&] { definition.HasCriterium(u"4"); });
    use("ZDColumnDefinition", [&] { definition.AddCriterium(u"= 3", u"9"); });

    collection("Tables", model.tables, u"tORDERS");
    collection("Columns", model.tableAt(1).columns, u"kID");
    collection("Joins", model.joins, u"j1");
    collection("ColumnDefinitions", model.definitions, u"x1");
    collection("Criteria", model.definitionAt(1).criteria, u"4");
    use("Criteria", [&] { model.definitionAt(1).criteria.Remove(u"4"); });
    use("Joins", [&] { model.joins.Remove(u"j1"); });
    use("ColumnDefinitions", [&] { model.definitions.Remove(u"x1"); });
    use("Zandor", [&] { zandor.DeleteTable(model.tables.items.Item(1)); });
    return failures;
}

platform::Ref<fake::Model> ordersAndItems(fake::Library& library) {
    auto model = library.newModel();
    auto orders = model->table(u"ORDERS", {u"*", u"ID"});
    auto items = model->table(u"ITEMS", {u"*", u"ORDER_ID"});
    model->join(orders, u"ID", items, u"ORDER_ID", 1, 5);
    model->definition(orders, u"ID", {u"> 1", u"< 9"});
    return model;
}

TEST(AFakeModel, ListsEveryMemberThatItHas) {
    fake::Library library;
    auto model = ordersAndItems(library);
    library.calls->remember(true);
    EXPECT_TRUE(failuresOfEveryMember(library, *model).empty());
    const std::set<std::string> used(library.calls->calls().begin(), library.calls->calls().end());
    const std::set<std::string> listed(fake::memberNames().begin(), fake::memberNames().end());
    EXPECT_EQ(used, listed);
    EXPECT_EQ(listed.size(), fake::memberNames().size());
}

TEST(AFakeModel, CanHaveEachOfItsMembersFail) {
    for (const std::string& member : fake::memberNames()) {
        fake::Library library;
        auto model = ordersAndItems(library);
        model->fail(member, platform::RuntimeError{1004, u"refused"});
        EXPECT_EQ(failuresOfEveryMember(library, *model),
                  (std::vector<std::string>{member.substr(0, member.find('.')) + " 1004"}))
            << member;
    }
}

TEST(AFakeModel, RefusesToFailWhatItLacks) {
    fake::Library library;
    auto model = library.newModel();
    EXPECT_THROW(model->fail("ZDTable.Colour", platform::errors::overflow()), std::logic_error);
}

TEST(AFakeModel, IsBuiltWithAFewWords) {
    fake::Library library;
    auto model = ordersAndItems(library);
    EXPECT_EQ(model->tableCount(), 2);
    EXPECT_EQ(model->tableAt(1).key, u"tORDERS");
    EXPECT_EQ(model->tableAt(2).column(u"ORDER_ID").key, u"kORDER_ID");
    EXPECT_EQ(model->joinAt(1).joinType, 1);
    EXPECT_EQ(model->joinAt(1).compareOperator, 5);
    EXPECT_EQ(model->joinAt(1).key, u"j1");
    EXPECT_EQ(model->definitionAt(1).key, u"x1");
    EXPECT_EQ(model->definitionAt(1).criterion(u"5"), u"< 9");
}

TEST(AFakeModel, StoresWhatItIsGivenUnlessItIsToldToCopy) {
    fake::Library library;
    auto model = library.newModel();
    auto join = library.NewZDJoin();
    EXPECT_EQ(model->AddJoin(join).get(), join.get());
    model->storesCopies = true;
    auto copied = library.NewZDColumnDefinition();
    copied->Synonym(u"s");
    auto stored = model->AddColumnDefinition(copied);
    EXPECT_NE(stored.get(), copied.get());
    EXPECT_EQ(stored->Synonym(), u"s");
    EXPECT_EQ(stored->Key(), u"x1");
    EXPECT_EQ(copied->Key(), u"");
}

} // namespace
