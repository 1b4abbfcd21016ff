#include "must.h"

#include <Zandor/SqlReader.h>
#include <Zandor/model/Names.h>
#include <Zandor/sql/Builder.h>

#include <sqlite3.h>

#include <algorithm>
#include <memory>
#include <optional>
#include <string>
#include <vector>

using namespace zandor;

// Statements of any dialect: the first byte chooses it, SQLite but for 1 to 4. What is accepted is
// written, and read, and written the same; and finds on SQLite the rows that it found.

namespace {

using model::ColumnType;
using model::sql::Dialect;
using platform::String;

constexpr const char* rowsOfTables = R"(
CREATE TABLE customers (id INTEGER PRIMARY KEY, name TEXT, city TEXT, credit DECIMAL(10, 2),
                        active BOOLEAN, since DATE);
INSERT INTO customers VALUES (1, 'Ada', 'Wien', 10.5, 1, '2020-01-01'),
    (2, 'Bob', 'Graz', NULL, 0, '2021-05-06'), (3, 'O''Brien', NULL, 0, 1, NULL),
    (4, 'a_b%', 'Wien', -3, NULL, '2020-01-01'), (5, '', 'wien', 1e3, 0, '2022-12-31');
CREATE TABLE orders (id INTEGER PRIMARY KEY, customer_id INTEGER, placed TIMESTAMP, total REAL);
INSERT INTO orders VALUES (1, 1, '2023-01-01 10:00:00', 5.5), (2, 1, '2023-02-03 00:00:00', 7),
    (3, 2, NULL, NULL), (4, 4, '2023-02-03 23:59:59', 0), (5, 9, '2020-02-29 12:00:00', 2.25);
CREATE TABLE lines (order_id INTEGER, number INTEGER, quantity INTEGER, price DECIMAL(10, 2));
INSERT INTO lines VALUES (1, 1, 2, 2.5), (1, 2, 1, 0.5), (2, 1, 0, 7), (4, 1, NULL, 3), (7, 1, 5, 5);
)";

const std::vector<model::TableDescription>& tables() {
    static const std::vector<model::TableDescription> all = {
        {u"",
         u"customers",
         {{u"id", ColumnType::Integer, u"INTEGER", true},
          {u"name", ColumnType::Text, u"TEXT"},
          {u"city", ColumnType::Text, u"TEXT"},
          {u"credit", ColumnType::Decimal, u"DECIMAL(10, 2)"},
          {u"active", ColumnType::Boolean, u"BOOLEAN"},
          {u"since", ColumnType::Date, u"DATE"}}},
        {u"",
         u"orders",
         {{u"id", ColumnType::Integer, u"INTEGER", true},
          {u"customer_id", ColumnType::Integer, u"INTEGER"},
          {u"placed", ColumnType::Timestamp, u"TIMESTAMP"},
          {u"total", ColumnType::Decimal, u"REAL"}}},
        {u"",
         u"lines",
         {{u"order_id", ColumnType::Integer, u"INTEGER"},
          {u"number", ColumnType::Integer, u"INTEGER"},
          {u"quantity", ColumnType::Integer, u"INTEGER"},
          {u"price", ColumnType::Decimal, u"DECIMAL(10, 2)"}}}};
    return all;
}

sql_reader::Schema schema() {
    sql_reader::Schema all;
    for (const auto& table : tables()) all.names.push_back(table.name);
    all.table = [](platform::StringView, platform::StringView name)
        -> std::optional<model::TableDescription> {
        for (const auto& table : tables())
            if (model::sameName(table.name, name)) return table;
        return {};
    };
    return all;
}

class Database {
public:
    Database() {
        must(sqlite3_open(":memory:", &mDatabase) == SQLITE_OK, "a database");
        must(sqlite3_exec(mDatabase, rowsOfTables, nullptr, nullptr, nullptr) == SQLITE_OK, "rows");
        sqlite3_db_config(mDatabase, SQLITE_DBCONFIG_DQS_DML, 0, nullptr);
    }
    ~Database() { sqlite3_close(mDatabase); }
    Database(const Database&) = delete;
    Database& operator=(const Database&) = delete;

    /// The rows in any order; nothing where the engine refuses, or takes too long.
    std::optional<std::vector<std::string>> rows(const std::string& statement) {
        sqlite3_stmt* prepared = nullptr;
        if (sqlite3_prepare_v2(mDatabase, statement.c_str(), -1, &prepared, nullptr) != SQLITE_OK)
            return {};
        constexpr int steps = 200'000;
        int left = 10;
        sqlite3_progress_handler(
            mDatabase, steps, [](void* count) { return --*static_cast<int*>(count) < 0 ? 1 : 0; },
            &left);
        std::vector<std::string> found;
        int state = SQLITE_ROW;
        while ((state = sqlite3_step(prepared)) == SQLITE_ROW) found.push_back(row(prepared));
        sqlite3_finalize(prepared);
        sqlite3_progress_handler(mDatabase, 0, nullptr, nullptr);
        if (state != SQLITE_DONE) return {};
        std::sort(found.begin(), found.end());
        return found;
    }

private:
    static std::string row(sqlite3_stmt* prepared) {
        std::string line;
        for (int n = 0; n < sqlite3_column_count(prepared); ++n) {
            switch (sqlite3_column_type(prepared, n)) {
            case SQLITE_NULL: line += "null"; break;
            case SQLITE_INTEGER:
            case SQLITE_FLOAT: {
                // Sums differ in their last digits by the order of their rows.
                char digits[40];
                sqlite3_snprintf(sizeof digits, digits, "%.9g", sqlite3_column_double(prepared, n));
                line += digits;
                break;
            }
            default:
                line += '\'';
                line += reinterpret_cast<const char*>(sqlite3_column_text(prepared, n));
            }
            line += '|';
        }
        return line;
    }

    sqlite3* mDatabase = nullptr;
};

bool isLimited(const model::Query& query) {
    if (query.options().first != 0) return true;
    const model::QueryRecord record = query.record();
    return std::any_of(record.tables.begin(), record.tables.end(), [](const auto& table) {
        return table.query && isLimited(*model::Query::restored(table.query->record));
    });
}

void compareRows(const std::string& typed, const String& written, const model::Query& query) {
    static Database database;
    const auto one = database.rows(typed);
    const auto other = database.rows(platform::toUtf8(written));
    if (!one || !other) return;
    must(one->size() == other->size() || isLimited(query), "as many rows: " + typed);
    if (!isLimited(query)) must(*one == *other, "the same rows: " + typed);
}

} // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size < 2) return 0;
    const bool other = data[0] >= '1' && data[0] <= '4';
    const auto dialect = other ? static_cast<Dialect>(data[0] - '0') : Dialect::SQLite;
    const String text = platform::fromUtf8(
        std::string_view(reinterpret_cast<const char*>(data + 1), size - 1));
    static const sql_reader::Schema known = schema();
    const auto drawn = sql_reader::read(text, dialect, known);
    if (!drawn) {
        const auto& refusal = drawn.failure();
        const String line = refusal.text();
        must(!line.empty() && line.find(u'\n') == String::npos, "a refusal of one line");
        must(refusal.position <= text.size() && refusal.line > 0 && refusal.column > 0, "a place");
        return 0;
    }
    using model::sql::ValueForm;
    const auto written = model::sql::statementText(**drawn, dialect, ValueForm::literal);
    // What a dialect cannot say was not said in it; but it may be too long, or too deep.
    if (!written.runnable()) return 0;
    const auto again = sql_reader::read(written.text, dialect, known);
    if (!again) {
        must(written.text.size() > sql_reader::longestText,
             "what is written is read: " + platform::toUtf8(again.error()) + "\n" +
                 platform::toUtf8(written.text));
        return 0;
    }
    must(model::sql::statementText(**again, dialect, ValueForm::literal).text == written.text,
         "what is read is written the same: " + platform::toUtf8(written.text));
    if (dialect == Dialect::SQLite && written.bindings.empty())
        compareRows(platform::toUtf8(text), written.text, **drawn);
    return 0;
}
