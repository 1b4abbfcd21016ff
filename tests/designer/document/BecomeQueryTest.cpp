#include "Databases.h"
#include "Drawing.h"

#include "designer/database/Database.h"
#include "designer/document/becomeQuery.h"
#include "designer/statement/readStatement.h"
#include "designer/tables/placeTables.h"

#include <Zandor/sql/Builder.h>

#include <map>
#include <sstream>

using namespace zandor;

namespace {

constexpr int canvasWidth = 18000;

const char* const statements[] = {
    "SELECT * FROM orders",
    "SELECT id, status FROM orders",
    "SELECT status, id FROM orders ORDER BY id DESC",
    "SELECT o.status FROM orders o WHERE o.id > 5",
    "SELECT o.status FROM orders o WHERE o.id > 7 OR o.status = 'open'",
    "SELECT c.name, o.id FROM customers c, orders o WHERE o.customer_id = c.id",
    "SELECT o.id, c.name FROM orders o LEFT JOIN customers c ON o.customer_id = c.id",
    "SELECT o.id, c.name FROM customers c LEFT JOIN orders o ON o.customer_id = c.id",
    // With the names of the one above, exchanged.
    "SELECT o.name, c.id FROM customers o JOIN orders c ON c.customer_id = o.id",
    "SELECT c.name, count(o.id) AS orders FROM customers c JOIN orders o ON o.customer_id = c.id "
    "GROUP BY c.name HAVING count(o.id) > 2 ORDER BY 2 DESC LIMIT 10",
    "SELECT DISTINCT c.city FROM customers c, orders o, order_lines l "
    "WHERE o.customer_id = c.id AND l.order_id = o.id AND l.quantity * l.unit_price > 100",
    "SELECT l.quantity * l.unit_price AS worth, l.line_no FROM order_lines l ORDER BY worth",
    "SELECT a.name, b.name AS other FROM customers a JOIN customers b ON a.city = b.city "
    "WHERE a.id < b.id",
    "SELECT b.name, a.name AS other FROM customers b JOIN customers a ON a.city = b.city "
    "WHERE a.id < b.id",
    "WITH late AS (SELECT id, customer_id FROM orders WHERE status = 'open') "
    "SELECT c.name, l.id FROM late l JOIN customers c ON l.customer_id = c.id",
    "WITH late AS (SELECT id, customer_id FROM orders WHERE status = 'paid') "
    "SELECT c.name, l.id FROM late l JOIN customers c ON l.customer_id = c.id",
    "SELECT customers.name FROM customers, orders WHERE customers.id = orders.customer_id "
    "AND customers.name LIKE 'A%' AND orders.id BETWEEN 3 AND 9",
    "-- who\nSELECT c.name, -- by name\n o.id\nFROM orders o -- all\n"
    "JOIN customers c ON o.customer_id = c.id WHERE o.id > 3 -- late ones\nORDER BY 1 -- sorted",
};

/// What a query is, whatever its keys and places.
std::string shapeOf(model::Query& query) {
    const model::QueryRecord record = query.record();
    std::map<platform::String, std::string> names;
    std::ostringstream shape;
    const auto text = [](const platform::String& each) { return platform::toUtf8(each); };
    for (const auto& table : record.tables) {
        names[table.key] = text(table.name);
        shape << text(table.name) << " is " << text(table.schema) << '.' << text(table.sourceName)
              << (table.query ? " saved" : "") << '\n';
        for (const auto& column : table.columns) {
            names[column.key] = text(table.name) + '.' + text(column.description.name);
            shape << "  " << text(column.description.name) << '\n';
        }
    }
    for (const auto& join : record.joins)
        shape << names[join.left.column] << ' ' << join.type << ' ' << join.comparison << ' '
              << names[join.right.column] << '\n';
    for (const auto& each : record.definitions) {
        shape << names[each.column] << '=' << text(each.expression) << ' ' << text(each.synonym)
              << ' ' << each.sortOrder << ' ' << each.visible << ' ' << int(each.total) << ' '
              << each.sortPriority << '\n';
        for (const auto& criterion : each.criteria) {
            shape << "  " << criterion.row << ": " << text(criterion.text) << '\n';
            for (const auto& name : criterion.names)
                shape << "    " << name.begin << ' ' << names[name.column] << '\n';
        }
    }
    shape << record.options.distinct << ' ' << record.options.first;
    return shape.str();
}

std::string sqlOf(model::Query& query) {
    return platform::toUtf8(
        statementText(query, model::sql::Dialect::SQLite, model::sql::ValueForm::literal).text);
}

class AQueryThatBecomesAnother : public testing::Test {
protected:
    void SetUp() override { ASSERT_FALSE(database.open(sampleDatabase())); }

    platform::Ref<model::Query> read(const char* text) {
        const auto query = designer::readStatement(
            text, {database.reader(), database.tables(), model::sql::Dialect::SQLite});
        EXPECT_TRUE(query) << text << '\n' << query.failure().withPlace().toStdString();
        return query ? *query : platform::makeRef<model::Query>();
    }
    /// A document with a statement drawn.
    void draw(const char* text) {
        const auto query = read(text);
        designer::arrangeUnplaced(*query, canvasWidth);
        document.setQuery(query);
    }
    void become(const char* text) {
        const auto other = read(text);
        document.change("Change", [&](model::Query& query) {
            designer::becomeQuery(query, *other);
            designer::placeUnplaced(query, canvasWidth);
        });
    }
    model::Query& query() { return *document.query(); }

    designer::Database database;
    designer::Document document;
};

} // namespace

TEST_F(AQueryThatBecomesAnother, SaysTheSameAsThatOneWhateverItWasAndGoesBackInOneStep) {
    int tried = 0;
    for (const char* from : statements)
        for (const char* to : statements) {
            SCOPED_TRACE(std::string(from) + "\nbecomes\n" + to);
            draw(from);
            const std::string before = shapeOf(query());
            const auto wanted = read(to);
            become(to);
            EXPECT_EQ(sqlOf(query()), sqlOf(*wanted));
            EXPECT_EQ(shapeOf(query()), shapeOf(*wanted));
            EXPECT_LE(document.steps().count(), 1);
            document.undo();
            EXPECT_EQ(shapeOf(query()), before);
            document.redo();
            EXPECT_EQ(shapeOf(query()), shapeOf(*wanted));
            ++tried;
        }
    EXPECT_EQ(tried, int(std::size(statements) * std::size(statements)));
}

TEST_F(AQueryThatBecomesAnother, MovesNoTableThatStays) {
    for (const char* from : statements)
        for (const char* to : statements) {
            SCOPED_TRACE(std::string(from) + "\nbecomes\n" + to);
            draw(from);
            std::map<platform::String, model::TableRecord> before;
            for (const auto& table : query().record().tables) before[table.name] = table;
            become(to);
            for (const auto& table : query().record().tables) {
                EXPECT_GE(table.left, 0);
                EXPECT_GE(table.top, 0);
                EXPECT_GT(table.width, 0);
                const auto known = before.find(table.name);
                if (known == before.end() || known->second.sourceName != table.sourceName) continue;
                EXPECT_EQ(table.left, known->second.left);
                EXPECT_EQ(table.top, known->second.top);
            }
        }
}

TEST_F(AQueryThatBecomesAnother, DoesNothingWhereItSaysThatAlready) {
    for (const char* text : statements) {
        SCOPED_TRACE(text);
        draw(text);
        become(text);
        EXPECT_EQ(document.steps().count(), 0);
    }
}

TEST_F(AQueryThatBecomesAnother, KeepsTheObjectsThatStay) {
    draw(statements[5]);
    const auto orders = query().tableNamed(u"o");
    const auto join = query().Joins().Item(1);
    const auto definition =
        std::static_pointer_cast<model::ColumnDefinition>(query().ColumnDefinitions().Item(2));
    definition->Width(2345);
    definition->format(model::Format::Number);
    document.settle();
    become("SELECT o.id AS number, o.status FROM customers c "
           "LEFT JOIN orders o ON o.customer_id = c.id");
    EXPECT_EQ(query().tableNamed(u"o"), orders);
    EXPECT_EQ(query().Joins().Item(1), join);
    EXPECT_EQ(query().ColumnDefinitions().Item(1), definition);
    EXPECT_EQ(definition->Synonym(), u"number");
    EXPECT_EQ(definition->Width(), 2345);
    EXPECT_EQ(definition->format(), model::Format::Number);
}

TEST_F(AQueryThatBecomesAnother, TakesATableOfAnotherNameForTheOneBefore) {
    draw("SELECT o.id FROM orders o");
    const auto table = query().tableNamed(u"o");
    become("SELECT bill.id FROM orders bill");
    EXPECT_EQ(query().tableNamed(u"bill"), table);
}

TEST_F(AQueryThatBecomesAnother, KeepsWhatItIsFor) {
    draw("SELECT o.id FROM orders o");
    document.change("Describe", [](model::Query& query) {
        model::QueryOptions options = query.options();
        options.description = u"for the shop";
        query.options(std::move(options));
    });
    become("SELECT DISTINCT o.status FROM orders o LIMIT 3");
    EXPECT_EQ(query().options().description, u"for the shop");
    EXPECT_EQ(query().options().first, 3);
}
