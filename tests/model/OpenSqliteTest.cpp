#include "model/TemporaryDatabase.h"

#include <QElapsedTimer>
#include <QFile>
#include <QSqlQuery>

#include <gtest/gtest.h>

#include <sys/stat.h>
#include <unistd.h>

using namespace zandor;

namespace {

class OpeningASqliteFile : public testing::Test {
protected:
    QString path(const char* name) const { return mDirectory.filePath(QString::fromUtf8(name)); }

    QString write(const char* name, const QByteArray& content) const {
        QFile file(path(name));
        EXPECT_TRUE(file.open(QIODevice::WriteOnly));
        EXPECT_EQ(file.write(content), content.size());
        return path(name);
    }

    QString database(const char* name) const {
        writeSqlite(path(name), {QStringLiteral("CREATE TABLE t (x INTEGER)"),
                                 QStringLiteral("INSERT INTO t VALUES (7)")});
        return path(name);
    }

    static QByteArray content(const QString& path) {
        QFile file(path);
        EXPECT_TRUE(file.open(QIODevice::ReadOnly));
        return file.readAll();
    }

    /// The error text with the test's folder left out.
    std::string errorFor(const QString& path) const {
        const auto opened = reader::openSqlite(path);
        EXPECT_FALSE(opened);
        EXPECT_FALSE(opened.error().contains(QLatin1Char('\n')));
        return opened.error().remove(mDirectory.path() + QLatin1Char('/')).toStdString();
    }

    QTemporaryDir mDirectory;
};

} // namespace

TEST_F(OpeningASqliteFile, GivesADatabaseThatCanBeRead) {
    const auto connection = reader::openSqlite(database("good.sqlite"));
    ASSERT_TRUE(connection) << connection.error().toStdString();
    QSqlQuery query(QStringLiteral("SELECT x FROM t"), connection->database());
    ASSERT_TRUE(query.next());
    EXPECT_EQ(query.value(0).toInt(), 7);
}

TEST_F(OpeningASqliteFile, AllowsNoWriting) {
    const auto connection = reader::openSqlite(database("good.sqlite"));
    ASSERT_TRUE(connection);
    QSqlQuery query(connection->database());
    EXPECT_FALSE(query.exec(QStringLiteral("INSERT INTO t VALUES (8)")));
    EXPECT_FALSE(query.exec(QStringLiteral("CREATE TABLE u (y)")));
}

TEST_F(OpeningASqliteFile, TakesAPathWithSpacesQuotesAndOtherLetters) {
    EXPECT_TRUE(reader::openSqlite(database("Bücher & \"Söhne\"; 100 %?.sqlite")));
}

TEST_F(OpeningASqliteFile, CanBeDoneSeveralTimesAtOnce) {
    const QString path = database("good.sqlite");
    const auto before = QSqlDatabase::connectionNames();
    {
        const auto first = reader::openSqlite(path);
        const auto second = reader::openSqlite(path);
        EXPECT_TRUE(first && second);
        EXPECT_EQ(QSqlDatabase::connectionNames().size(), before.size() + 2);
    }
    EXPECT_EQ(QSqlDatabase::connectionNames(), before);
}

TEST_F(OpeningASqliteFile, SaysWhenThereIsNone) {
    EXPECT_EQ(errorFor(path("absent.sqlite")),
              "There is no file \"absent.sqlite\"; check the path.");
    EXPECT_FALSE(QFile::exists(path("absent.sqlite")));
}

TEST_F(OpeningASqliteFile, SaysWhenItIsAFolder) {
    ASSERT_EQ(mkdir(path("folder").toUtf8(), 0755), 0);
    EXPECT_EQ(errorFor(path("folder")), "\"folder\" is a folder; choose a database file in it.");
}

TEST_F(OpeningASqliteFile, SaysWhenItIsADevice) {
    ASSERT_EQ(mkfifo(path("pipe").toUtf8(), 0644), 0);
    EXPECT_EQ(errorFor(path("pipe")), "\"pipe\" is a device, not a file; choose a database file.");
}

TEST_F(OpeningASqliteFile, SaysWhenItMayNotBeRead) {
    const QString locked = database("locked.sqlite");
    ASSERT_EQ(chmod(locked.toUtf8(), 0), 0);
    // The superuser may read everything, so the test steps down while it tries.
    const uid_t self = geteuid();
    ASSERT_EQ(chmod(mDirectory.path().toUtf8(), 0755), 0);
    ASSERT_EQ(seteuid(self == 0 ? 65534 : self), 0);
    const std::string error = errorFor(locked);
    ASSERT_EQ(seteuid(self), 0);
    EXPECT_EQ(error, "The file \"locked.sqlite\" cannot be read (Permission denied); ask its owner "
                     "for permission.");
}

TEST_F(OpeningASqliteFile, SaysWhenItIsEmpty) {
    EXPECT_EQ(errorFor(write("empty.sqlite", {})),
              "The file \"empty.sqlite\" is empty; choose a file that holds a database.");
}

TEST_F(OpeningASqliteFile, SaysWhenItIsSomethingElse) {
    const std::string complaint = " is not an SQLite database, or it is encrypted; choose another "
                                  "file.";
    EXPECT_EQ(errorFor(write("letter.txt", "Dear Sir or Madam, thank you for your order.")),
              "The file \"letter.txt\"" + complaint);
    EXPECT_EQ(errorFor(write("short", "SQLite")), "The file \"short\"" + complaint);
}

TEST_F(OpeningASqliteFile, SaysWhenOnlyItsFirstBytesAreThoseOfADatabase) {
    QByteArray fake("SQLite format 3\0", 16);
    EXPECT_EQ(errorFor(write("fake.sqlite", fake.append(4080, 'x'))),
              "The database \"fake.sqlite\" cannot be opened (file is not a database): it is "
              "damaged or encrypted; choose another file.");
}

TEST_F(OpeningASqliteFile, SaysWhenItIsDamaged) {
    QByteArray bytes = content(database("good.sqlite"));
    bytes.replace(100, 1000, QByteArray(1000, '\x7f')); // the schema begins at byte 100
    EXPECT_EQ(errorFor(write("broken.sqlite", bytes)),
              "The database \"broken.sqlite\" cannot be opened (database disk image is malformed): "
              "the file is damaged; restore it from a copy.");
}

TEST_F(OpeningASqliteFile, SaysWhenAnotherProgramKeepsItLocked) {
    const QString path = database("busy.sqlite");
    QSqlDatabase other = QSqlDatabase::addDatabase(QStringLiteral("QSQLITE"), path);
    other.setDatabaseName(path);
    ASSERT_TRUE(other.open());
    const reader::Connection closes(std::exchange(other, {}));
    QSqlQuery lock(closes.database());
    ASSERT_TRUE(lock.exec(QStringLiteral("BEGIN EXCLUSIVE")));
    QElapsedTimer waiting;
    waiting.start();
    EXPECT_EQ(errorFor(path), "The database \"busy.sqlite\" cannot be opened (database is locked): "
                              "another program is writing to it; try again in a moment.");
    EXPECT_LT(waiting.elapsed(), 20'000) << "nobody waits for that long";
}

TEST_F(OpeningASqliteFile, LeavesNoConnectionBehindWhenItFails) {
    const auto before = QSqlDatabase::connectionNames();
    QByteArray fake("SQLite format 3\0", 16);
    errorFor(write("fake.sqlite", fake.append(4080, 'x')));
    EXPECT_EQ(QSqlDatabase::connectionNames(), before);
}
