#include <Zandor/reader/Connection.h>
#include <Zandor/reader/addTables.h>

#include <QFile>
#include <QSqlQuery>
#include <QVariant>

#include <gtest/gtest.h>

#include <map>

using namespace zandor;

namespace {

class TheSampleDatabase : public testing::Test {
protected:
    void SetUp() override {
        auto opened = reader::openSqlite(QString::fromUtf8(SAMPLE_DATABASE));
        ASSERT_TRUE(opened) << opened.error().toStdString();
        mConnection = std::make_unique<reader::Connection>(std::move(*opened));
        mReader = reader::makeSqliteReader(mConnection->database());
    }

    std::int64_t number(const QString& statement) const {
        QSqlQuery query(mConnection->database());
        EXPECT_TRUE(query.exec(statement) && query.next()) << statement.toStdString();
        return query.value(0).toLongLong();
    }

    std::unique_ptr<reader::Connection> mConnection;
    std::unique_ptr<reader::DatabaseReader> mReader;
};

} // namespace

TEST_F(TheSampleDatabase, HasTheSameRowsInEveryBuild) {
    const std::map<QString, std::int64_t> expected = {
        {"categories", 14},          {"contacts", 520},
        {"countries", 15},           {"customers", 260},
        {"employees", 25},           {"order_lines", 5400},
        {"order_totals", 1800},      {"orders", 1800},
        {"payments", 1443},          {"products", 230},
        {"products_to_reorder", 93}, {"shipment_lines", 5726},
        {"shipments", 1920},         {"stock", 736},
        {"suppliers", 24},           {"warehouses", 4}};
    std::map<QString, std::int64_t> counted;
    const auto tables = mReader->tables();
    ASSERT_TRUE(tables) << tables.error().toStdString();
    for (const auto& entry : *tables) {
        const QString name = QString::fromStdU16String(entry.id.name);
        counted[name] = number(QStringLiteral("SELECT count(*) FROM ") + name);
        EXPECT_EQ(entry.isView, name == "order_totals" || name == "products_to_reorder");
    }
    EXPECT_EQ(counted, expected);
    // Of fractions added up, so the last cents depend on the release of SQLite.
    EXPECT_NEAR(number("SELECT sum(amount) FROM payments"), 4437869, 1);
}

TEST_F(TheSampleDatabase, IsSound) {
    EXPECT_EQ(number("SELECT count(*) FROM pragma_foreign_key_check"), 0);
    EXPECT_EQ(number("SELECT integrity_check = 'ok' FROM pragma_integrity_check"), 1);
}

TEST_F(TheSampleDatabase, ShipsNoMoreThanWasOrdered) {
    EXPECT_EQ(number("SELECT count(*) FROM order_lines AS l JOIN (SELECT order_id, line_no, "
                     "sum(quantity) AS shipped FROM shipment_lines GROUP BY 1, 2) AS s "
                     "USING (order_id, line_no) WHERE s.shipped <> l.quantity"),
              0);
}

TEST_F(TheSampleDatabase, HasColumnsOfEveryType) {
    std::map<model::ColumnType, int> seen;
    const auto tables = mReader->tables();
    ASSERT_TRUE(tables);
    for (const auto& entry : *tables) {
        const auto table = mReader->table(entry.id);
        ASSERT_TRUE(table) << table.error().toStdString();
        for (const auto& column : table->columns) ++seen[column.type];
    }
    for (const auto type :
         {model::ColumnType::Text, model::ColumnType::Integer, model::ColumnType::Decimal,
          model::ColumnType::Date, model::ColumnType::Time, model::ColumnType::Timestamp,
          model::ColumnType::Boolean, model::ColumnType::Blob})
        EXPECT_GT(seen[type], 0) << static_cast<int>(type);
}

TEST_F(TheSampleDatabase, FitsIntoOneQueryWithAllItsJoins) {
    const auto tables = mReader->tables();
    ASSERT_TRUE(tables);
    std::vector<reader::TableId> names;
    for (const auto& entry : *tables)
        if (!entry.isView) names.push_back(entry.id);
    EXPECT_EQ(names.size(), 14U);
    model::Query query;
    const auto added = reader::addTables(query, *mReader, names, 16000);
    ASSERT_TRUE(added) << added.error().toStdString();
    EXPECT_EQ(query.Joins().Count(), 19); // 18 foreign keys, one of two columns
    for (const auto& table : *added) {
        EXPECT_LE(table->Left() + table->Width(), 16000);
        EXPECT_LE(table->Top() + table->Height(), 16000);
    }
}
