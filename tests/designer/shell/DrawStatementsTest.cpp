#include "Databases.h"
#include "Program.h"

#include <Zandor/QueryDocument.h>

#include <gmock/gmock.h>

#include <QDir>
#include <QFile>
#include <QProcess>

using namespace zandor;

using testing::HasSubstr;
using testing::StartsWith;

namespace {

class DrawingStatements : public testing::Test {
protected:
    QString statement(const QByteArray& text, const QString& name = "statement.sql") {
        return folder.file(name, text);
    }
    Ended drawn(const QByteArray& text) {
        return runProgram({"--draw", statement(text), out, "--database", database});
    }
    void expectRefusal(const Ended& ended, int code, const std::string& why) {
        EXPECT_EQ(ended.code, code);
        EXPECT_EQ(ended.out, "");
        EXPECT_THAT(ended.err, StartsWith("zandor-designer: "));
        EXPECT_THAT(ended.err, HasSubstr(why));
        EXPECT_EQ(std::count(ended.err.begin(), ended.err.end(), '\n'), 1) << ended.err;
        EXPECT_FALSE(QFile::exists(out));
    }
    static std::string printed(const QString& query) { return runProgram({"--sql", query}).out; }

    DatabaseFolder folder;
    QString database = folder.database(
        "shop.db", {"CREATE TABLE customers (id INTEGER PRIMARY KEY, name TEXT)",
                    "CREATE TABLE orders (id INTEGER PRIMARY KEY, customer INTEGER, total REAL)",
                    "INSERT INTO customers VALUES (1, 'Ann'), (2, 'Ben')",
                    "INSERT INTO orders VALUES (1, 1, 9.5), (2, 2, 3)"});
    QString out = folder.path("out.json");
};

const QByteArray joined = "select C.name, o.TOTAL from Customers c, Orders o\n"
                          "where o.customer = c.id and o.total > 5";

} // namespace

TEST_F(DrawingStatements, WritesAQueryThatSaysTheSame) {
    const Ended ended = drawn(joined);
    EXPECT_EQ(ended.code, 0) << ended.err;
    EXPECT_EQ(ended.out + ended.err, "");
    EXPECT_EQ(printed(out), "SELECT\n    c.name,\n    o.total\nFROM customers AS c\n"
                            "    INNER JOIN orders AS o ON o.customer = c.id\n"
                            "WHERE o.total > 5;\n");
}

TEST_F(DrawingStatements, WritesAQueryThatKnowsItsDatabase) {
    QProcess program;
    program.setWorkingDirectory(QFileInfo(database).path());
    program.start(ZANDOR_DESIGNER,
                  {"--draw", statement(joined), out, "--database", QFileInfo(database).fileName()});
    ASSERT_TRUE(program.waitForFinished(60'000));
    EXPECT_EQ(program.exitCode(), 0) << program.readAllStandardError().toStdString();
    EXPECT_EQ(runProgram({"--run", out}).out, "name,total\r\nAnn,9.5\r\n");
}

TEST_F(DrawingStatements, GivesEachTableAPlaceAndASize) {
    ASSERT_EQ(drawn(joined).code, 0);
    const auto document = files::loadQuery(out.toStdString());
    ASSERT_TRUE(document);
    const auto record = document->query->record();
    ASSERT_EQ(record.tables.size(), 2U);
    for (const model::TableRecord& table : record.tables) {
        EXPECT_GE(table.left, 0);
        EXPECT_GE(table.top, 0);
        EXPECT_GT(table.width, 0);
        EXPECT_GT(table.height, 0);
    }
    EXPECT_GE(record.tables[1].left, record.tables[0].left + record.tables[0].width);
}

TEST_F(DrawingStatements, ReadsTheStandardInputStream) {
    QProcess program;
    program.start(ZANDOR_DESIGNER, {"--draw", "-", out, "--database", database});
    ASSERT_TRUE(program.waitForStarted());
    program.write("SELECT name FROM customers");
    program.closeWriteChannel();
    ASSERT_TRUE(program.waitForFinished(60'000));
    EXPECT_EQ(program.exitCode(), 0) << program.readAllStandardError().toStdString();
    EXPECT_THAT(printed(out), StartsWith("SELECT\n    customers.name\n"));
}

TEST_F(DrawingStatements, SaysWhereAStatementCannotBeDrawn) {
    const Ended ended = drawn("SELECT name,\n    shoe FROM customers");
    expectRefusal(ended, 1, "statement.sql:2:5: ");
    EXPECT_THAT(ended.err, HasSubstr("\"shoe\""));
}

TEST_F(DrawingStatements, ProposesTheNameThatIsNearest) {
    expectRefusal(drawn("SELECT * FROM custmers"), 1, "is \"customers\" meant?");
}

TEST_F(DrawingStatements, LeavesTheQueryThatIsThereAloneWhenItRefuses) {
    ASSERT_EQ(drawn(joined).code, 0);
    const std::string before = printed(out);
    EXPECT_EQ(drawn("SELECT nothing FROM nowhere").code, 1);
    EXPECT_EQ(printed(out), before);
}

TEST_F(DrawingStatements, RefusesMoreTablesThanTheDrawingTakes) {
    QByteArray text = "SELECT t0.id FROM orders t0";
    for (int n = 1; n < 17; ++n) text += ", orders t" + QByteArray::number(n);
    expectRefusal(drawn(text), 1, "takes 16 tables, and the statement has 17");
}

TEST_F(DrawingStatements, BringsAFolderOfStatementsOver) {
    const QString good = statement(joined, "good.sql");
    const QString bad = statement("SELECT FROM", "bad.sql");
    const QString other = statement("SELECT total FROM orders", "other.of.two.sql");
    const QString into = folder.path("queries");
    ASSERT_TRUE(QDir().mkdir(into));
    const Ended ended = runProgram({"--draw", good, bad, other, into, "--database", database});
    EXPECT_EQ(ended.code, 1) << "one was refused";
    EXPECT_EQ(std::count(ended.err.begin(), ended.err.end(), '\n'), 1) << ended.err;
    EXPECT_THAT(ended.err, HasSubstr("bad.sql:1:"));
    EXPECT_EQ(QDir(into).entryList(QDir::Files), QStringList({"good.json", "other.of.two.json"}));
    EXPECT_THAT(printed(into + "/other.of.two.json"), HasSubstr("FROM orders"));
}

TEST_F(DrawingStatements, RefusesFilesThatCannotBe) {
    const QString file = statement(joined);
    const auto refused = [&](const QStringList& arguments, const std::string& why) {
        expectRefusal(runProgram(arguments), 2, why);
    };
    refused({"--draw", file, out}, "name their database with --database");
    refused({"--draw", out, "--database", database}, "--draw takes two files");
    refused({"--draw", folder.path("none.sql"), out, "--database", database}, "There is no file");
    refused({"--draw", file, file, out, "--database", database}, "There is no folder");
    refused({"--draw", "-", folder.path("."), "--database", database}, "has no name");
    refused({"--draw", file, out, "--database", folder.path("none.db")}, "There is no file");
    refused({"--draw", folder.path("."), out, "--database", database}, "is a folder");
    refused({"--draw", statement("SELECT '\xff'", "bytes.sql"), out, "--database", database},
            "no text in UTF-8");
    refused(
        {"--draw", statement(QByteArray(2'000'000, ' '), "long.sql"), out, "--database", database},
        "too large");
    refused({"--draw", file, folder.path("no/out.json"), "--database", database}, "no/out.json");
    const QString twin = folder.path("twin");
    ASSERT_TRUE(QDir().mkdir(twin));
    ASSERT_TRUE(QFile::copy(file, twin + "/statement.sql"));
    refused({"--draw", file, twin + "/statement.sql", twin, "--database", database},
            "would both become");
}

TEST_F(DrawingStatements, ReadsTextWithAMarkOfItsEncoding) {
    EXPECT_EQ(drawn("\xef\xbb\xbf" + joined).code, 0);
    const QString text = QChar(0xfeff) + QString::fromUtf8(joined);
    EXPECT_EQ(drawn({reinterpret_cast<const char*>(text.utf16()), text.size() * 2}).code, 0);
}
