#include "Databases.h"
#include "Program.h"
#include "designer/database/Answers.h"
#include "designer/run/Queries.h"

#include <gmock/gmock.h>

#include <QDir>
#include <QFile>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <csignal>

using namespace zandor;

using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

class InAShell : public testing::Test {
protected:
    QString saved(const platform::Ref<model::Query>& query, const QString& names = {}) {
        save(folder.path("query.json"), query, names);
        return folder.path("query.json");
    }
    QString savedNumbers(const std::vector<Drawn>& columns, const QString& names) {
        return saved(draw(database, {"numbers"}, columns), names);
    }
    /// Expects one line about what went wrong, and nothing else.
    void expectRefusal(const QStringList& arguments, int code, const std::string& why) {
        const Ended ended = runProgram(arguments);
        EXPECT_EQ(ended.code, code);
        EXPECT_EQ(ended.out, "");
        EXPECT_THAT(ended.err, StartsWith("zandor-designer: "));
        EXPECT_THAT(ended.err, HasSubstr(why));
        EXPECT_EQ(std::count(ended.err.begin(), ended.err.end(), '\n'), 1) << ended.err;
    }

    DatabaseFolder folder;
    QString database = folder.database("numbers.db", numbersTable(3000));
};

} // namespace

TEST_F(InAShell, PrintsTheStatement) {
    const QString query = savedNumbers({{"numbers.word", {"Like 'a*'"}}}, {});
    const Ended ended = runProgram({"--sql", query});
    EXPECT_EQ(ended.code, 0) << ended.err;
    EXPECT_EQ(ended.err, "");
    EXPECT_THAT(ended.out, StartsWith("SELECT\n    numbers.word\nFROM numbers\nWHERE "));
    EXPECT_THAT(ended.out, EndsWith(";\n"));
}

TEST_F(InAShell, TakesTheDrawingAndSaysThatThereIsATextBesideIt) {
    files::QueryDocument document(draw(database, {"numbers"}, {{"numbers.n", {"< 2"}}}));
    document.database = database.toStdU16String();
    document.typed = files::TypedStatement{u"SELECT rank() OVER () FROM numbers"};
    const QString path = folder.path("typed.json");
    ASSERT_FALSE(files::saveQuery(path.toStdString(), document));
    for (const char* task : {"--sql", "--run"}) {
        const Ended ended = runProgram({task, path});
        EXPECT_EQ(ended.code, 0);
        EXPECT_EQ(ended.err,
                  "zandor-designer: The text that was typed beside the drawing is left out.\n");
        EXPECT_THAT(ended.out, testing::Not(HasSubstr("rank")));
    }
}

TEST_F(InAShell, PrintsTheStatementInADialect) {
    const QString query = savedNumbers({{"numbers.word", {"Like 'a*'"}}}, "postgresql://host/db");
    const Ended postgres = runProgram({"--sql", query});
    EXPECT_THAT(postgres.out, HasSubstr("ILIKE")) << "that of the query's database";
    const Ended mysql = runProgram({"--sql", query, "--dialect", "mysql"});
    EXPECT_THAT(mysql.out, HasSubstr("LIKE 'a%'"));
    EXPECT_EQ(mysql.out.find("ILIKE"), std::string::npos);
    for (const char* dialect : {"sqlite", "sqlserver", "standard"})
        EXPECT_EQ(runProgram({"--sql", query, "--dialect", dialect}).code, 0) << dialect;
}

TEST_F(InAShell, PrintsNoStatementThatDoesNotSayWhatWasDrawn) {
    expectRefusal({"--sql", savedNumbers({{"numbers.n", {"< abc def"}}}, {})}, 1, "numbers.n: ");
    expectRefusal({"--sql", saved(platform::makeRef<model::Query>())}, 1, "has no tables");
}

TEST_F(InAShell, NamesWhatOneShouldKnowBesideTheStatement) {
    const Ended ended = runProgram({"--sql", saved(draw(database, {"numbers", "numbers"}))});
    EXPECT_EQ(ended.code, 0);
    EXPECT_THAT(ended.out, HasSubstr("FROM numbers"));
    EXPECT_THAT(ended.err, HasSubstr("numbers_1"));
}

TEST_F(InAShell, WritesRowsAsCommaSeparatedValues) {
    const QString query =
        savedNumbers({{"numbers.n", {"< 3"}, 1}, {"numbers.word"}, {"numbers.missing"}}, database);
    const Ended ended = runProgram({"--run", query});
    EXPECT_EQ(ended.code, 0) << ended.err;
    EXPECT_EQ(ended.err, "");
    EXPECT_EQ(ended.out, "n,word,missing\r\n0,word 0,\r\n1,word 1,\r\n2,word 2,\r\n");
    EXPECT_EQ(runProgram({"--run", query, "--format", "csv"}).out, ended.out);
}

TEST_F(InAShell, WritesRowsAsJson) {
    const QString query = savedNumbers({{"numbers.n"}, {"numbers.word"}}, database);
    const Ended ended = runProgram({"--run", query, "--format", "json"});
    EXPECT_EQ(ended.code, 0) << ended.err;
    const auto array = QJsonDocument::fromJson(QByteArray::fromStdString(ended.out)).array();
    ASSERT_EQ(array.size(), 3000);
    EXPECT_EQ(array[7].toObject(), (QJsonObject{{"n", 7}, {"word", "word 7"}}));
}

TEST_F(InAShell, WritesNoMoreRowsThanAskedFor) {
    const QString query = savedNumbers({{"numbers.n", {}, 1}}, database);
    EXPECT_EQ(runProgram({"--run", query, "--limit", "2"}).out, "n\r\n0\r\n1\r\n");
    EXPECT_EQ(runProgram({"--run", query, "--limit", "1", "--format", "json"}).out,
              "[\n{\"n\": 0}\n]\n");
}

TEST_F(InAShell, AsksTheDatabaseThatIsNamedInsteadOfTheQuerys) {
    const QString query = savedNumbers({{"numbers.n", {}, 1}}, "/no/such.db");
    expectRefusal({"--run", query}, 2, "There is no file \"/no/such.db\"");
    EXPECT_EQ(runProgram({"--run", query, "--limit", "1", "--database", database}).out,
              "n\r\n0\r\n");
    expectRefusal({"--run", savedNumbers({{"numbers.n"}}, {})}, 2, "--database");
}

TEST_F(InAShell, TakesTheValuesOfParameters) {
    const QString query =
        savedNumbers({{"numbers.n", {"Between :low And [the top]"}, 1}}, database);
    EXPECT_EQ(runProgram({"--run", query, "--set", "low=5", "--set", "the top=6"}).out,
              "n\r\n5\r\n6\r\n");
    expectRefusal({"--run", query, "--set", "low=5"}, 2, "\"the top\"");
    expectRefusal({"--run", query, "--set", "low=x", "--set", "the top=6"}, 2,
                  "\"low\", which has to be a number; \"x\" is not.");
    expectRefusal({"--run", query, "--set", "low=5", "--set", "the top=6", "--set", "lwo=5"}, 2,
                  "does not ask for \"lwo\"");
}

TEST_F(InAShell, SaysWhatTheEngineSays) {
    const QString query = savedNumbers({{"numbers.n"}}, database);
    folder.database("numbers.db", {"ALTER TABLE numbers RENAME TO others"});
    expectRefusal({"--run", query}, 1, "no such table: numbers");
}

TEST_F(InAShell, RefusesWhatItCannotUseInOneLine) {
    const QString query = savedNumbers({{"numbers.n"}}, database);
    expectRefusal({"--run", "/no/such.json"}, 2, "/no/such.json");
    expectRefusal({"--sql", folder.file("bad.json", "no json")}, 2, "bad.json");
    expectRefusal({"--run", query, "--format", "xml"}, 2, "There is no format \"xml\"");
    expectRefusal({"--sql", query, "--dialect", "oracle"}, 2, "There is no dialect \"oracle\"");
    expectRefusal({"--run", query, "--limit", "-1"}, 2, "--limit takes a number");
    expectRefusal({"--run", query, "--set", "low"}, 2, "write --set NAME=VALUE");
    expectRefusal({"--sql", query, "--run", query}, 2, "one at a time");
    expectRefusal({"--limit", "1", "--sql", query}, 2, "--limit goes with --run only");
    expectRefusal({"--run"}, 2, "Missing value");
    expectRefusal({"--run", query, database}, 2, "open no window");
}

TEST_F(InAShell, CanChangeNothing) {
    const auto bytes = [&] {
        QFile file(database);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    };
    const QByteArray before = bytes();
    EXPECT_EQ(runProgram({"--run", savedNumbers({}, database)}).code, 0);
    EXPECT_EQ(bytes(), before);
    QFile::setPermissions(database, QFile::ReadOwner);
    EXPECT_EQ(runProgram({"--run", savedNumbers({}, database)}).code, 0);
}

TEST_F(InAShell, EndsQuietlyWhenNobodyReadsOn) {
    // So many rows that writing them would take hours.
    const QString query = saved(draw(database, {"numbers", "numbers", "numbers"}), database);
    const QString line = QString("\"%1\" --run \"%2\" | head -n 2; echo ${PIPESTATUS[0]}")
                             .arg(ZANDOR_DESIGNER, query);
    QProcess shell;
    shell.start("bash", {"-c", line});
    ASSERT_TRUE(shell.waitForFinished(60'000));
    EXPECT_EQ(shell.readAllStandardError(), "");
    EXPECT_EQ(shell.readAllStandardOutput().split('\n').value(2), "141"); // as of any program
}

TEST_F(InAShell, StopsWhenInterrupted) {
    QProcess program;
    program.start(ZANDOR_DESIGNER, {"--run", saved(drawForMinutes(database), database)});
    ASSERT_TRUE(program.waitForStarted());
    // It has come as far as its database.
    const QDir opened(QString("/proc/%1/fd").arg(program.processId()));
    ASSERT_TRUE(until([&] {
        for (const QFileInfo& file : opened.entryInfoList(QDir::System | QDir::Files))
            if (file.symLinkTarget() == database) return true;
        return false;
    }));
    kill(static_cast<pid_t>(program.processId()), SIGINT);
    ASSERT_TRUE(program.waitForFinished(10'000));
    EXPECT_EQ(program.exitStatus(), QProcess::NormalExit);
    EXPECT_EQ(program.exitCode(), 1);
    EXPECT_EQ(program.readAllStandardError(), "zandor-designer: Cancelled.\n");
}

// To a device on which there is never room.
TEST_F(InAShell, SaysWhenItsOutputCannotBeWritten) {
    for (const QStringList& arguments :
         {QStringList{"--run", savedNumbers({{"numbers.n", {"< 3"}}}, database)},
          QStringList{"--run", folder.path("query.json"), "--format", "json"},
          QStringList{"--run", folder.path("query.json"), "--limit", "1"},
          QStringList{"--sql", folder.path("query.json")}, QStringList{"--help"},
          QStringList{"--version"}}) {
        QProcess program;
        program.setStandardOutputFile("/dev/full");
        program.start(ZANDOR_DESIGNER, arguments);
        ASSERT_TRUE(program.waitForFinished(60'000));
        EXPECT_EQ(program.exitCode(), 2) << arguments.join(' ').toStdString();
        EXPECT_EQ(program.readAllStandardError().toStdString(),
                  "zandor-designer: The output cannot be written (No space left on device); make "
                  "room on the disk, or choose another one.\n");
    }
}
