#include "Drawing.h"

#include <gmock/gmock.h>

#include <QFile>

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
    QStringList parent;
    QStringList references;
    for (int n = 0; n < 32; ++n) {
        parent << QStringLiteral("p%1").arg(n);
        references << QStringLiteral("r%1 REFERENCES p (p%1)").arg(n);
    }
    const QString child = references.join(QStringLiteral(", "));
    ASSERT_EQ(database.open(folder.database(
                  QStringLiteral("a.sqlite"),
                  {QStringLiteral("CREATE TABLE p (%1)").arg(parent.join(QStringLiteral(", "))),
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
