#include "Databases.h"

#include <Zandor/QueryDocument.h>

#include <gmock/gmock.h>

#include <QDir>
#include <QImage>
#include <QProcess>
#include <QProcessEnvironment>

using namespace zandor;

using testing::EndsWith;
using testing::HasSubstr;
using testing::StartsWith;

namespace {

struct Ended {
    int code = -1;
    std::string out;
    std::string err;
};

/// Runs the program to its end. Nothing names a screen unless `environment` does.
Ended run(const QStringList& arguments, const QMap<QString, QString>& environment = {}) {
    QProcess process;
    auto variables = QProcessEnvironment::systemEnvironment();
    for (const char* name : {"DISPLAY", "WAYLAND_DISPLAY", "QT_QPA_PLATFORM"})
        variables.remove(QLatin1String(name));
    for (auto it = environment.begin(); it != environment.end(); ++it)
        variables.insert(it.key(), it.value());
    process.setProcessEnvironment(variables);
    process.setStandardInputFile(QProcess::nullDevice());
    process.start(QStringLiteral(ZANDOR_DESIGNER), arguments);
    EXPECT_TRUE(process.waitForFinished(60000)) << process.errorString().toStdString();
    EXPECT_EQ(process.exitStatus(), QProcess::NormalExit);
    return {process.exitCode(), process.readAllStandardOutput().toStdString(),
            process.readAllStandardError().toStdString()};
}

/// Expects the program to end with code 2 and one line about why.
void expectRefusal(const QStringList& arguments, const std::string& why) {
    const Ended ended = run(arguments);
    EXPECT_EQ(ended.code, 2);
    EXPECT_EQ(ended.out, "");
    EXPECT_THAT(ended.err, StartsWith("zandor-designer: "));
    EXPECT_THAT(ended.err, HasSubstr(why));
    EXPECT_EQ(std::count(ended.err.begin(), ended.err.end(), '\n'), 1) << ended.err;
    EXPECT_THAT(ended.err, EndsWith("\n"));
}

QRgb cornerOf(const QImage& picture) {
    // Of the canvas, where no table stands.
    return picture.pixel(5, 5);
}

} // namespace

TEST(TheDesignerProgram, RefusesAMissingFileInOneLine) {
    expectRefusal({"/no/such/file.db"}, "There is no file \"/no/such/file.db\"");
}

TEST(TheDesignerProgram, RefusesAFolderInOneLine) {
    expectRefusal({QDir::tempPath()}, "is a folder");
}

TEST(TheDesignerProgram, RefusesAFileOfAnotherKindInOneLine) {
    DatabaseFolder folder;
    expectRefusal({folder.file("notes.txt", "just some words, and more of them")},
                  "is not an SQLite database");
}

TEST(TheDesignerProgram, RefusesADamagedDatabaseInOneLine) {
    DatabaseFolder folder;
    expectRefusal(
        {folder.file("damaged.db", QByteArray("SQLite format 3\0", 16) + QByteArray(4096, '\xA5'))},
        "cannot be opened");
}

TEST(TheDesignerProgram, RefusesAnUnknownTableInOneLine) {
    expectRefusal({"--tables", "customers,nowhere"}, "There is no table \"nowhere\"");
}

TEST(TheDesignerProgram, RefusesAnUnknownOptionInOneLine) {
    expectRefusal({"--colour"}, "Unknown option 'colour'. See --help.");
}

TEST(TheDesignerProgram, ShowsHelpAndVersionWithoutAScreen) {
    const QMap<QString, QString> broken{{"QT_QPA_PLATFORM", "no-such-platform"}};
    const Ended help = run({"--help"}, broken);
    EXPECT_EQ(help.code, 0);
    EXPECT_THAT(help.out, StartsWith("Usage: zandor-designer"));
    const Ended version = run({"--version"}, broken);
    EXPECT_EQ(version.code, 0);
    EXPECT_THAT(version.out, StartsWith("zandor-designer 0."));
}

TEST(TheDesignerProgram, DrawsItsWindowIntoAPicture) {
    DatabaseFolder folder;
    const Ended ended = run({"--screenshot", folder.path("window.png")});
    EXPECT_EQ(ended.code, 0) << ended.err;
    EXPECT_EQ(ended.err, "");
    EXPECT_EQ(QImage(folder.path("window.png")).size(), QSize(1340, 800));
}

TEST(TheDesignerProgram, DrawsATwiceAsLargePictureOnATwiceAsFineScreen) {
    DatabaseFolder folder;
    const Ended ended =
        run({"--screenshot", folder.path("window.png")}, {{"QT_SCALE_FACTOR", "2"}});
    EXPECT_EQ(ended.code, 0) << ended.err;
    EXPECT_EQ(QImage(folder.path("window.png")).size(), QSize(2680, 1600));
}

TEST(TheDesignerProgram, DrawsDarkColoursWhenAskedTo) {
    DatabaseFolder folder;
    ASSERT_EQ(run({"--screenshot", folder.path("light.png")}).code, 0);
    ASSERT_EQ(run({"--dark", "--screenshot", folder.path("dark.png")}).code, 0);
    EXPECT_GT(qGray(cornerOf(QImage(folder.path("light.png")))), 200);
    EXPECT_LT(qGray(cornerOf(QImage(folder.path("dark.png")))), 80);
}

TEST(TheDesignerProgram, EndsWithCodeOneWhenThePictureCannotBeWritten) {
    const Ended ended = run({"--screenshot", "/no/such/folder/window.png"});
    EXPECT_EQ(ended.code, 1);
    EXPECT_EQ(ended.err, "zandor-designer: The file \"/no/such/folder/window.png\" cannot be saved "
                         "(No such file or directory); check the path.\n");
}

TEST(TheDesignerProgram, DrawsAPictureWhenThereIsNoDisplay) {
    DatabaseFolder folder;
    const Ended ended = run({}, {{"TMPDIR", folder.path("")}});
    EXPECT_EQ(ended.code, 0);
    EXPECT_EQ(ended.err, "");
    EXPECT_THAT(ended.out, StartsWith("No display can be reached"));
    EXPECT_THAT(ended.out, HasSubstr("\n" + folder.path("zandor-designer.png").toStdString()));
    EXPECT_EQ(QImage(folder.path("zandor-designer.png")).size(), QSize(1340, 800));
}

TEST(TheDesignerProgram, SweepsTheRowsThatAnEarlierRunHasLeft) {
    DatabaseFolder folder;
    QFile rows(folder.path("zandor-rows-Ab12Cd"));
    ASSERT_TRUE(rows.open(QIODevice::WriteOnly));
    rows.close();
    EXPECT_EQ(run({}, {{"TMPDIR", folder.path("")}}).code, 0);
    EXPECT_FALSE(rows.exists());
}

TEST(TheDesignerProgram, DrawsAPictureWhenTheDisplayCannotBeReached) {
    DatabaseFolder folder;
    const Ended ended = run({}, {{"TMPDIR", folder.path("")}, {"DISPLAY", ":8765"}});
    EXPECT_EQ(ended.code, 0);
    EXPECT_EQ(ended.err, "");
    EXPECT_THAT(ended.out, StartsWith("No display can be reached"));
    EXPECT_FALSE(QImage(folder.path("zandor-designer.png")).isNull());
}

TEST(TheDesignerProgram, DrawsTheTablesOfAQueryFileIntoAPicture) {
    DatabaseFolder folder;
    const QString query = folder.path("query.json");
    ASSERT_FALSE(files::saveQuery(query.toStdString(), {openedSample().query}));
    for (const char* name : {"out.png", "out.svg", "out.pdf"}) {
        const Ended ended = run({"--picture", query, folder.path(name)});
        EXPECT_EQ(ended.code, 0) << ended.err;
        EXPECT_EQ(ended.err, "");
    }
    QFile svg(folder.path("out.svg"));
    ASSERT_TRUE(svg.open(QIODevice::ReadOnly));
    EXPECT_TRUE(svg.readAll().contains(">order_lines</text>"));
    EXPECT_GT(QImage(folder.path("out.png")).width(), 2000);
    // With all columns of the tables, unless they are to be as in the window.
    ASSERT_EQ(run({"--picture", query, folder.path("shown.png"), "--as-shown"}).code, 0);
    EXPECT_LT(QImage(folder.path("shown.png")).height(), QImage(folder.path("out.png")).height());
    expectRefusal({"--as-shown", query}, "--as-shown goes with --picture only.");
}

// As of a query that a program has made.
TEST(TheDesignerProgram, LaysOutAPictureOfTablesThatHaveNoPlace) {
    DatabaseFolder folder;
    const QString file = folder.path("query.json");
    const auto query = openedSample().query;
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(query->Tables())) {
        table->Left(-1);
        table->Top(-1);
        table->Width(0);
        table->Height(0);
    }
    ASSERT_FALSE(files::saveQuery(file.toStdString(), {query}));
    ASSERT_EQ(run({"--picture", file, folder.path("out.svg")}).code, 0);
    QFile svg(folder.path("out.svg"));
    ASSERT_TRUE(svg.open(QIODevice::ReadOnly));
    const QByteArray drawn = svg.readAll();
    for (const char* name : {">customers</text>", ">orders</text>", ">order_lines</text>"})
        EXPECT_TRUE(drawn.contains(name)) << name;
    ASSERT_EQ(run({"--picture", file, folder.path("out.png")}).code, 0);
    const QImage picture(folder.path("out.png"));
    EXPECT_GT(picture.width(), 1500);
    EXPECT_GT(picture.height(), 500);
}

TEST(TheDesignerProgram, RefusesAPictureOfABrokenQueryInOneLine) {
    DatabaseFolder folder;
    expectRefusal({"--picture", folder.file("query.json", "{"), folder.path("out.png")},
                  "query.json");
    expectRefusal({"--picture", "/no/such/query.json", folder.path("out.png")}, "query.json");
    const QString query = folder.path("good.json");
    ASSERT_FALSE(files::saveQuery(query.toStdString(), {openedSample().query}));
    const Ended ended = run({"--picture", query, folder.path("out.gif")});
    EXPECT_EQ(ended.code, 1);
    EXPECT_THAT(ended.err, HasSubstr("A picture ends in .png, .svg or .pdf"));
}

TEST(TheDesignerProgram, OpensAQueryFileWithItsDatabase) {
    DatabaseFolder folder;
    files::QueryDocument document{openedSample({"orders"}).query};
    document.database = sampleDatabase().toStdU16String();
    const QString query = folder.path("query.json");
    ASSERT_FALSE(files::saveQuery(query.toStdString(), document));
    const Ended ended = run({"--screenshot", folder.path("window.png"), query});
    EXPECT_EQ(ended.code, 0) << ended.err;
    EXPECT_EQ(QImage(folder.path("window.png")).size(), QSize(1340, 800));
    expectRefusal({"--screenshot", folder.path("window.png"), "/no/such/query.json"}, "query.json");
}
