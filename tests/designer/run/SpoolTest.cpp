#include "support/NoRoom.h"

#include "designer/run/Spool.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QTemporaryDir>

#include <limits>
#include <thread>

using namespace zandor;

using designer::Row;
using designer::Spool;
using Kind = designer::Cell::Kind;

namespace {

constexpr qint64 all = std::numeric_limits<qint64>::max();

Row numbered(int n) {
    return {{Kind::number, QString::number(n)}, {Kind::text, QString("row %1").arg(n)}};
}

void fill(Spool& spool, int rows) {
    ASSERT_FALSE(spool.begin({"n", "text"}));
    for (int n = 0; n < rows; ++n) ASSERT_FALSE(spool.add(numbered(n)));
}

/// While it lives, spools have their files in a folder.
class SpoolsIn {
public:
    explicit SpoolsIn(const QString& folder) { qputenv("TMPDIR", folder.toLocal8Bit()); }
    SpoolsIn(const SpoolsIn&) = delete;
    SpoolsIn& operator=(const SpoolsIn&) = delete;
    ~SpoolsIn() { mBefore.isNull() ? qunsetenv("TMPDIR") : qputenv("TMPDIR", mBefore); }

private:
    const QByteArray mBefore = qgetenv("TMPDIR");
};

} // namespace

TEST(TheSpool, GivesBackRowsPageByPage) {
    Spool spool;
    fill(spool, 1000);
    EXPECT_EQ(spool.columns(), QStringList({"n", "text"}));
    EXPECT_EQ(spool.rows(), 1000);
    const auto second = spool.page(1, all);
    ASSERT_EQ(second.size(), 256u);
    EXPECT_EQ(second[0], numbered(256));
    EXPECT_EQ(second[255], numbered(511));
    EXPECT_EQ(spool.page(0, all)[0], numbered(0)); // and goes back
    EXPECT_EQ(spool.page(3, all).size(), 1000u - 3 * 256);
    EXPECT_TRUE(spool.page(4, all).empty());
}

TEST(TheSpool, GivesBackEveryKindOfCell) {
    Spool spool;
    ASSERT_FALSE(spool.begin({"a", "b", "c", "d", "e"}));
    const Row row = {{},
                     {Kind::text, ""},
                     {Kind::boolean, "true"},
                     {Kind::text, "\U0001F600 \u00e4"},
                     {Kind::blob, {}, QByteArray(1234, 'x')}};
    ASSERT_FALSE(spool.add(row));
    const auto page = spool.page(0, all);
    ASSERT_EQ(page.size(), 1u);
    for (int i = 0; i < 4; ++i) EXPECT_EQ(page[0][i], row[i]) << i;
    EXPECT_EQ(page[0][4], (designer::Cell{Kind::blob, "1234"}));
}

TEST(TheSpool, ReadsTheBeginningOfALongTextWithWholeCharacters) {
    Spool spool;
    ASSERT_FALSE(spool.begin({"a", "b"}));
    ASSERT_FALSE(spool.add({{Kind::text, QString(100'000, u'\u00e4')}, {Kind::number, "7"}}));
    const auto page = spool.page(0, 11);
    EXPECT_EQ(page[0][0].text, QString(5, u'\u00e4') + u'\u2026');
    EXPECT_EQ(page[0][1].text, "7");
    EXPECT_EQ(spool.page(0, all)[0][0].text.size(), 100'000);
}

TEST(TheSpool, CanBeReadWhileRowsAreComing) {
    Spool spool;
    ASSERT_FALSE(spool.begin({"n", "text"}));
    constexpr int count = 30'000;
    std::thread writing([&] {
        for (int n = 0; n < count; ++n) (void)spool.add(numbered(n));
        (void)spool.finish();
    });
    for (qint64 seen = 0; seen < count;) {
        seen = spool.rows();
        if (seen == 0) continue;
        const qint64 last = (seen - 1) / Spool::rowsInAPage;
        const auto page = spool.page(last, all);
        ASSERT_FALSE(page.empty());
        ASSERT_EQ(page[0], numbered(static_cast<int>(last * Spool::rowsInAPage)));
    }
    writing.join();
}

TEST(TheSpool, HasAFileOfNoNameThatIsGoneWithTheProcessHoweverThatEnds) {
    const QTemporaryDir folder;
    const SpoolsIn there(folder.path());
    Spool spool;
    fill(spool, 100'000);
    EXPECT_EQ(spool.rows(), 100'000);
    EXPECT_EQ(QDir(folder.path()).entryList(QDir::AllEntries | QDir::Hidden | QDir::NoDotAndDotDot),
              QStringList());
    EXPECT_EQ(spool.page(300, all)[7], numbered(300 * 256 + 7));
}

TEST(TheSpool, LeavesSomeRoomOnItsDiskToOthers) {
    const SmallDisk disk("300m");
    if (!disk.complaint().empty()) GTEST_SKIP() << "no disk can be mounted: " << disk.complaint();
    const QString folder = QString::fromStdString(disk.path());
    const SpoolsIn there(folder);
    const QString megabyte(1024 * 1024, u'x');
    Spool spool;
    ASSERT_FALSE(spool.begin({"text"}));
    int rows = 0;
    std::optional<QString> failure;
    while (!failure && rows < 100) {
        failure = spool.add({{Kind::text, megabyte}});
        ++rows;
    }
    EXPECT_EQ(failure.value_or("").toStdString(),
              ("The rows would fill the disk with the folder \"" + folder +
               "\": make room there, or ask for fewer rows.")
                  .toStdString());
    EXPECT_EQ(rows, 64) << "so many megabytes may come between two looks";
    EXPECT_EQ(spool.rows(), rows - 1);
    EXPECT_EQ(spool.finish(), failure);
}

TEST(TheSpool, SaysWhyItHasNoRoom) {
    Spool spool;
    ASSERT_FALSE(spool.begin({"n", "text"}));
    const LittleRoom none(0);
    ASSERT_FALSE(spool.add(numbered(1))) << "it waits for others";
    EXPECT_EQ(spool.finish().value_or(""),
              "The rows cannot be written (File too large); choose another disk.");
}
