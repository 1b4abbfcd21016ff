#include "Databases.h"

#include "designer/database/droppedDatabase.h"

#include <gtest/gtest.h>

#include <QMimeData>
#include <QUrl>

using namespace zandor;

namespace {

std::optional<QString> dropped(const QList<QUrl>& urls) {
    QMimeData data;
    data.setUrls(urls);
    return designer::droppedDatabase(data);
}

QUrl url(const QString& path) { return QUrl::fromLocalFile(path); }

} // namespace

TEST(ADroppedDatabase, IsOneFileOfSqliteWhateverItsName) {
    DatabaseFolder folder;
    const QString file =
        folder.database(QStringLiteral("year #1 100%"), {QStringLiteral("CREATE TABLE t (x)")});
    EXPECT_EQ(dropped({url(file)}), file);
}

TEST(ADroppedDatabase, IsNothingElse) {
    DatabaseFolder folder;
    const QString file =
        folder.database(QStringLiteral("a.sqlite"), {QStringLiteral("CREATE TABLE t (x)")});
    const QString text = folder.file(QStringLiteral("b.sqlite"), "not a database");
    EXPECT_EQ(dropped({}), std::nullopt);
    EXPECT_EQ(dropped({url(file), url(file)}), std::nullopt);
    EXPECT_EQ(dropped({url(text)}), std::nullopt);
    EXPECT_EQ(dropped({url(folder.path(QString()))}), std::nullopt);
    EXPECT_EQ(dropped({url(folder.path(QStringLiteral("none.sqlite")))}), std::nullopt);
    EXPECT_EQ(dropped({QUrl(QStringLiteral("https://example.org/a.sqlite"))}), std::nullopt);
}
