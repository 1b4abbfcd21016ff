#include "designer/run/spoolSweep.h"
#include "designer/run/Spool.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QFile>
#include <QProcess>
#include <QTemporaryDir>

#include <filesystem>
#include <unistd.h>

using namespace zandor;

using designer::sweepSpools;

namespace {

class ALeftSpool : public testing::Test {
protected:
    QString path(const QString& name) const { return folder.filePath(name); }

    void plant(const QString& name) const {
        QFile file(path(name));
        ASSERT_TRUE(file.open(QIODevice::WriteOnly) && file.write("rows") == 4);
    }

    QStringList left() const {
        return QDir(folder.path())
            .entryList(QDir::AllEntries | QDir::System | QDir::Hidden | QDir::NoDotAndDotDot);
    }

    const QTemporaryDir folder;
};

} // namespace

TEST_F(ALeftSpool, Goes) {
    plant("zandor-rows-abcDE1");
    plant("zandor-rows-000000");
    EXPECT_EQ(sweepSpools(folder.path()), 2);
    EXPECT_EQ(left(), QStringList());
    EXPECT_EQ(sweepSpools(folder.path()), 0);
    EXPECT_EQ(sweepSpools(path("none")), 0);
}

TEST_F(ALeftSpool, StaysWhileAProcessHoldsIt) {
    plant("zandor-rows-mine01");
    plant("zandor-rows-other1");
    plant("zandor-rows-nobody");
    QFile mine(path("zandor-rows-mine01"));
    ASSERT_TRUE(mine.open(QIODevice::ReadOnly));
    QProcess other;
    other.start("sh", {"-c", "exec 7<\"$0\"; echo open; read end", path("zandor-rows-other1")});
    ASSERT_TRUE(other.waitForReadyRead(20'000)) << other.errorString().toStdString();

    EXPECT_EQ(sweepSpools(folder.path()), 1);
    EXPECT_EQ(left(), (QStringList{"zandor-rows-mine01", "zandor-rows-other1"}));

    other.kill();
    ASSERT_TRUE(other.waitForFinished(20'000));
    mine.close();
    EXPECT_EQ(sweepSpools(folder.path()), 2);
    EXPECT_EQ(left(), QStringList());
}

TEST_F(ALeftSpool, IsNothingElseOfALikeName) {
    const QStringList others{"zandor-rows-",         "zandor-rows-12345", "zandor-rows-1234567",
                             "my-zandor-rows-12345", "zandor-rows-12 45", "zandor-designer.png"};
    for (const QString& name : others) plant(name);
    ASSERT_TRUE(QDir(folder.path()).mkdir("zandor-rows-folder"));
    plant("precious");
    std::filesystem::create_symlink("precious", path("zandor-rows-linked").toStdString());
    EXPECT_EQ(sweepSpools(folder.path()), 0);
    EXPECT_EQ(left().size(), others.size() + 3);
}

TEST_F(ALeftSpool, OfAnotherUserIsNotTouched) {
    if (::geteuid() != 0) GTEST_SKIP() << "only root can give a file away";
    plant("zandor-rows-theirs");
    ASSERT_EQ(::chown(path("zandor-rows-theirs").toLocal8Bit().constData(), 65534, 65534), 0);
    EXPECT_EQ(sweepSpools(folder.path()), 0);
}

TEST_F(ALeftSpool, IsSoughtWhereSpoolsAreMade) {
    plant("zandor-rows-abcdef");
    const QByteArray before = qgetenv("TMPDIR");
    qputenv("TMPDIR", folder.path().toLocal8Bit());
    sweepSpools();
    before.isNull() ? qunsetenv("TMPDIR") : qputenv("TMPDIR", before);
    EXPECT_EQ(left(), QStringList());
}
