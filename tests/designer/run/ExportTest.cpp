#include "Databases.h"
#include "Queries.h"

#include "designer/run/FileExport.h"

#include <gmock/gmock.h>

#include <QDir>
#include <QFile>

using namespace zandor;

using designer::Database;
using designer::FileExport;
using designer::Outcome;
using model::sql::Dialect;
using testing::HasSubstr;

namespace {

QByteArray contentOf(const QString& path) {
    QFile file(path);
    return file.open(QIODevice::ReadOnly) ? file.readAll() : QByteArray();
}

/// Sets a flag in the midst of the rows, as a user does who has seen enough.
class StoppedExport final : public designer::Sink {
public:
    static constexpr int rows = 2000;

    StoppedExport(const QString& path, std::atomic<bool>& stop) : mFile(path), mStop(stop) {}
    std::optional<QString> begin(const QStringList& columns) override {
        return mFile.begin(columns);
    }
    std::optional<QString> add(const designer::Row& row) override {
        mStop = ++mRows == rows;
        return mFile.add(row);
    }
    std::optional<QString> finish() override { return mFile.finish(); }

private:
    FileExport mFile;
    std::atomic<bool>& mStop;
    int mRows = 0;
};

class Exporting : public testing::Test {
protected:
    Outcome run(const platform::Ref<model::Query>& query, const QString& path) {
        FileExport file(path);
        return designer::fetch(Database::connectorTo(database, {}),
                               commandFor(query, Dialect::SQLite), file, stop);
    }
    QStringList files() const { return QDir(target.path("")).entryList(QDir::Files); }

    DatabaseFolder folder;
    DatabaseFolder target;
    QString database = folder.database("numbers.db", numbersTable(3000));
    std::atomic<bool> stop = false;
};

} // namespace

TEST_F(Exporting, WritesAllRows) {
    const auto query = draw(database, {"numbers"}, {{"numbers.n"}, {"numbers.missing"}});
    EXPECT_EQ(run(query, target.path("all.csv")).end, Outcome::End::complete);
    const QByteArray content = contentOf(target.path("all.csv"));
    EXPECT_TRUE(content.startsWith("n,missing\r\n0,\r\n1,\r\n"));
    EXPECT_TRUE(content.endsWith("\r\n2999,\r\n"));
    EXPECT_EQ(content.count("\r\n"), 3001);
}

TEST_F(Exporting, LeavesNoHalfFileWhenItIsCancelled) {
    const auto query = draw(database, {"numbers"});
    const QString path = target.path("half.csv");
    const QString before = target.file("before.csv", "precious");
    for (const QString& each : {path, before}) {
        stop = false;
        StoppedExport file(each, stop);
        const Outcome outcome = designer::fetch(Database::connectorTo(database, {}),
                                                commandFor(query, Dialect::SQLite), file, stop);
        EXPECT_EQ(outcome.end, Outcome::End::cancelled);
        EXPECT_EQ(outcome.rows, StoppedExport::rows);
    }
    EXPECT_EQ(files(), QStringList("before.csv"));
    EXPECT_EQ(contentOf(before), "precious");
}

TEST_F(Exporting, SaysWhenTheFileCannotBeWritten) {
    const Outcome outcome = run(draw(database, {"numbers"}), "/no/such/folder/a.csv");
    EXPECT_EQ(outcome.end, Outcome::End::refused);
    EXPECT_THAT(
        outcome.message.toStdString(),
        HasSubstr(
            "The file \"/no/such/folder/a.csv\" cannot be saved (No such file or directory)"));
}
