#include "Drawing.h"

#include <gmock/gmock.h>

#include <QFile>

using namespace zandor;

using testing::ElementsAre;
using testing::IsEmpty;

namespace {

class AddingToTheDrawing : public Drawing {
protected:
    DatabaseFolder folder;
};

} // namespace

TEST_F(AddingToTheDrawing, PutsATableThereWithItsColumnsAsAStep) {
    openSample();
    add({QStringLiteral("orders")});
    EXPECT_THAT(refused, IsEmpty());
    EXPECT_EQ(added, QStringList(QStringLiteral("orders")));
    EXPECT_EQ(query().Tables().Count(), 1);
    EXPECT_EQ(query().Tables().Item(1)->Columns().Count(), 8);
    ASSERT_EQ(document.steps().count(), 1);
    EXPECT_EQ(document.steps().undoText(), "Add table orders");
    document.undo();
    EXPECT_EQ(query().Tables().Count(), 0);
}

TEST_F(AddingToTheDrawing, JoinsByForeignKeysToWhatIsThere) {
    openSample();
    add({QStringLiteral("order_lines")});
    add({QStringLiteral("orders")});
    add({QStringLiteral("shipment_lines")});
    EXPECT_THAT(joins(), ElementsAre("order_lines.order_id = orders.id",
                                     "shipment_lines.order_id = order_lines.order_id",
                                     "shipment_lines.line_no = order_lines.line_no"));
}

TEST_F(AddingToTheDrawing, TakesSeveralTablesAsOneStep) {
    openSample();
    add({QStringLiteral("orders"), QStringLiteral("customers"), QStringLiteral("contacts")});
    EXPECT_EQ(joins().size(), 3U);
    EXPECT_EQ(document.steps().count(), 1);
    EXPECT_EQ(document.steps().undoText(), "Add 3 tables");
    document.undo();
    EXPECT_EQ(query().Tables().Count(), 0);
    EXPECT_THAT(joins(), IsEmpty());
    document.redo();
    EXPECT_EQ(query().Tables().Count(), 3);
    EXPECT_EQ(joins().size(), 3U);
}

TEST_F(AddingToTheDrawing, GivesATableThatIsThereANameOfItsOwn) {
    openSample();
    add({QStringLiteral("employees")});
    add({QStringLiteral("employees")});
    EXPECT_EQ(added.back(), "employees_1");
    EXPECT_THAT(joins(), ElementsAre("employees.manager_id = employees_1.id"));
}

TEST_F(AddingToTheDrawing, FindsAPlaceThatIsFree) {
    openSample();
    for (const auto& table : database.tables()) adding.add({table.id});
    const auto all = places();
    ASSERT_EQ(all.size(), 16U);
    for (std::size_t n = 0; n < all.size(); ++n)
        for (std::size_t m = 0; m < n; ++m)
            EXPECT_FALSE(all[n].second.intersects(all[m].second))
                << all[n].first << " covers " << all[m].first;
}

TEST_F(AddingToTheDrawing, GoesToTheRightAndLeavesTheEarlierTablesInSight) {
    openSample();
    QRect before;
    for (const char* name : {"customers", "orders", "order_lines", "products"}) {
        add({QString::fromLatin1(name)});
        const QRect now = place(QString::fromLatin1(name));
        EXPECT_EQ(now.top(), 300) << name;
        EXPECT_GT(now.left(), before.right()) << name;
        before = now;
    }
    EXPECT_EQ(place(QStringLiteral("customers")).topLeft(), QPoint(300, 300));
    EXPECT_LE(before.right(), area.width() * 15);
    // All of it is seen without scrolling.
    EXPECT_EQ(area.control().VisibleFrameLeft(), 0);
    EXPECT_EQ(area.control().VisibleFrameTop(), 0);
}

TEST_F(AddingToTheDrawing, ArrangesWhatNobodyHasArrangedByHand) {
    openSample();
    // Neither is joined to the other; what comes third goes between them.
    add({QStringLiteral("customers")});
    add({QStringLiteral("order_lines")});
    add({QStringLiteral("orders")});
    const int middle = place(QStringLiteral("orders")).left();
    const int left = place(QStringLiteral("customers")).left();
    const int right = place(QStringLiteral("order_lines")).left();
    EXPECT_TRUE((left < middle) == (middle < right)) << left << " " << middle << " " << right;
    // A step that brings the earlier places back.
    const auto places = this->places();
    document.undo();
    document.redo();
    EXPECT_EQ(this->places(), places);
    document.undo();
    add({QStringLiteral("orders")});
    EXPECT_EQ(this->places(), places);
}

TEST_F(AddingToTheDrawing, NeverMovesATableOfADrawingThatSomebodyHasArranged) {
    openSample();
    add({QStringLiteral("customers")});
    add({QStringLiteral("order_lines")});
    document.change(QStringLiteral("Move"),
                    [](model::Query& query) { query.tableNamed(u"customers")->Left(9000); });
    const auto before = places();
    for (const char* name : {"orders", "products", "payments", "employees"})
        add({QString::fromLatin1(name)});
    auto now = places();
    now.resize(before.size());
    EXPECT_EQ(now, before);
    // Until somebody lets the designer do it.
    adding.arrange();
    EXPECT_NE(place(QStringLiteral("customers")).left(), 9000);
    document.change(QStringLiteral("Delete"),
                    [](model::Query& query) { query.DeleteTable(query.tableNamed(u"orders")); });
    add({QStringLiteral("orders")});
    EXPECT_NE(place(QStringLiteral("orders")).left(), place(QStringLiteral("order_lines")).left());
}

TEST_F(AddingToTheDrawing, MovesNoTableOfAQueryFromAFileOrAfterADrop) {
    openSample();
    add({QStringLiteral("customers")}, QPoint(9000, 1500));
    add({QStringLiteral("orders")});
    EXPECT_EQ(place(QStringLiteral("customers")).topLeft(), QPoint(9000, 1500));
    const QRect orders = place(QStringLiteral("orders"));
    EXPECT_EQ(orders.top(), 1500); // beside it
    const auto loaded = model::Query::restored(query().record());
    document.setQuery(loaded);
    const auto before = places();
    add({QStringLiteral("order_lines")});
    auto now = places();
    now.resize(before.size());
    EXPECT_EQ(now, before);
}

TEST_F(AddingToTheDrawing, PutsADroppedTableWhereItWasDroppedWhateverIsThere) {
    openSample();
    add({QStringLiteral("orders")}, QPoint(3000, 1500));
    EXPECT_EQ(place(QStringLiteral("orders")).topLeft(), QPoint(3000, 1500));
    add({QStringLiteral("customers")}, QPoint(3300, 1800));
    EXPECT_EQ(place(QStringLiteral("customers")).topLeft(), QPoint(3300, 1800));
    EXPECT_EQ(place(QStringLiteral("orders")).topLeft(), QPoint(3000, 1500));
}

TEST_F(AddingToTheDrawing, KeepsADroppedTableWithinTheCanvas) {
    openSample();
    add({QStringLiteral("orders")}, QPoint(32700, 32700));
    const QRect orders = place(QStringLiteral("orders"));
    EXPECT_EQ(orders.x() + orders.width(), 32767);
    EXPECT_EQ(orders.y() + orders.height(), 32767);
    add({QStringLiteral("customers")}, QPoint(-50, -1));
    EXPECT_EQ(place(QStringLiteral("customers")).topLeft(), QPoint(0, 0));
}

TEST_F(AddingToTheDrawing, SpreadsSeveralDroppedTablesFromThePlace) {
    openSample();
    add({QStringLiteral("orders"), QStringLiteral("customers")}, QPoint(6000, 4500));
    const QRect orders = place(QStringLiteral("orders"));
    const QRect customers = place(QStringLiteral("customers"));
    EXPECT_FALSE(orders.intersects(customers));
    EXPECT_EQ(orders.united(customers).topLeft(), QPoint(6000, 4500));
}

TEST_F(AddingToTheDrawing, RefusesTheSeventeenthTable) {
    openSample();
    for (const auto& table : database.tables()) adding.add({table.id});
    EXPECT_THAT(refused, IsEmpty());
    add({QStringLiteral("orders")});
    EXPECT_THAT(refused, ElementsAre("The drawing takes 16 tables, and has them; delete one "
                                     "first."));
    EXPECT_EQ(query().Tables().Count(), 16);
    EXPECT_EQ(document.steps().count(), 16);
}

TEST_F(AddingToTheDrawing, RefusesAllOfSeveralTablesThatAreTooMany) {
    openSample();
    add({QStringLiteral("orders")});
    std::vector<reader::TableId> all;
    for (const auto& table : database.tables()) all.push_back(table.id);
    adding.add(all);
    EXPECT_THAT(refused, ElementsAre("The drawing takes 16 tables and has 1; choose fewer."));
    EXPECT_EQ(query().Tables().Count(), 1);
}

TEST_F(AddingToTheDrawing, RefusesTheSixtyFifthJoin) {
    QStringList names;
    for (int n = 0; n < 32; ++n) names << QStringLiteral("p%1").arg(n);
    const QString columns = names.join(QStringLiteral(", "));
    const QString child = QStringLiteral("%1, FOREIGN KEY (%1) REFERENCES p (%1)").arg(columns);
    ASSERT_EQ(
        database.open(folder.database(QStringLiteral("a.sqlite"),
                                      {QStringLiteral("CREATE TABLE p (%1)").arg(columns),
                                       QStringLiteral("CREATE TABLE a (%1)").arg(child),
                                       QStringLiteral("CREATE TABLE b (%1)").arg(child),
                                       QStringLiteral("CREATE TABLE c (r REFERENCES p (p0))")})),
        std::nullopt);
    add({QStringLiteral("p")});
    add({QStringLiteral("a")});
    add({QStringLiteral("b")});
    EXPECT_EQ(query().Joins().Count(), 64);
    add({QStringLiteral("c")});
    EXPECT_THAT(refused, ElementsAre("The drawing takes 64 joins, and with this there would be "
                                     "65; delete tables or joins first."));
    EXPECT_EQ(query().Tables().Count(), 3);
    EXPECT_EQ(document.steps().count(), 3);
}

TEST_F(AddingToTheDrawing, SaysWhichJoinsItLeftOut) {
    ASSERT_EQ(
        database.open(folder.database(
            QStringLiteral("a.sqlite"),
            {QStringLiteral("CREATE TABLE towns (id INTEGER PRIMARY KEY)"),
             QStringLiteral("CREATE TABLE trips (\"to\" REFERENCES towns, \"from\" REFERENCES "
                            "towns, via REFERENCES towns)")})),
        std::nullopt);
    QString said;
    QObject::connect(&adding, &designer::TableAdding::noted,
                     [&](const QString& what) { said = what; });
    add({QStringLiteral("towns"), QStringLiteral("trips")});
    EXPECT_THAT(joins(), ElementsAre("trips.from = towns.id"));
    EXPECT_EQ(said,
              "trips and towns are joined by trips.from. Not joined by trips.to, trips.via: draw "
              "those yourself if you need them.");
    // Which are not left out is not spoken of.
    said.clear();
    add({QStringLiteral("towns")});
    EXPECT_EQ(said, "");
}

TEST_F(AddingToTheDrawing, SaysWhatCannotBeReadAndChangesNothing) {
    openSample();
    add({QStringLiteral("orders"), QStringLiteral("gone")});
    EXPECT_THAT(refused, ElementsAre("The table \"gone\" is not in the database; read the list of "
                                     "tables afresh."));
    EXPECT_EQ(query().Tables().Count(), 0);
    EXPECT_EQ(document.steps().count(), 0);
}

TEST_F(AddingToTheDrawing, DoesNothingWithoutADatabaseOrTables) {
    add({QStringLiteral("orders")});
    openSample();
    add({});
    EXPECT_EQ(document.steps().count(), 0);
    EXPECT_THAT(refused, IsEmpty());
}

TEST_F(AddingToTheDrawing, GoesOnWhenTheFileIsDeleted) {
    const QString path =
        folder.database(QStringLiteral("a.sqlite"), {QStringLiteral("CREATE TABLE a (x)")});
    ASSERT_EQ(database.open(path), std::nullopt);
    QFile::remove(path);
    add({QStringLiteral("a")});
    EXPECT_THAT(refused, IsEmpty());
    EXPECT_EQ(query().Tables().Count(), 1);
}
