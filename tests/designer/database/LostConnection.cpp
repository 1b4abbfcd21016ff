#include "Answers.h"
#include "model/reader/OneServer.h"

#include "designer/database/ConnectionBanner.h"
#include "designer/database/opening.h"
#include "designer/database/readTables.h"

#include <gtest/gtest.h>

#include <QLabel>
#include <QPushButton>
#include <QToolButton>
#include <QVBoxLayout>

using namespace zandor;

using designer::Database;

namespace {

const reader::TableId towns{u"", u"towns"};

class ALostConnection : public testing::Test {
protected:
    ALostConnection() {
        runOnServer({QStringLiteral("DROP TABLE IF EXISTS towns"),
                     QStringLiteral("CREATE TABLE towns (id int PRIMARY KEY)")});
        EXPECT_EQ(database.open(serverAddress()), std::nullopt);
        auto* const layout = new QVBoxLayout(&window);
        layout->addWidget(banner = new designer::ConnectionBanner(database, &window));
        window.show();
    }

    ~ALostConnection() override {
        if (dead) oneServer.server().restart();
    }

    void killServer() {
        oneServer.server().kill();
        dead = true;
    }

    void restartServer() {
        oneServer.server().restart();
        dead = false;
    }

    /// Asks for the columns as the panels do; what went wrong.
    std::optional<QString> read() {
        const auto error =
            takeTables(database, designer::readTables(database.connector(), {{towns}, {}}));
        if (!error) return {};
        return error->text();
    }

    QString bannerText() { return banner->findChild<QLabel*>()->text(); }

    template <class Button>
    void click(const char* name) {
        auto* const button = banner->findChild<Button*>(QLatin1String(name));
        hands::click(*button, button->rect().center());
    }

    Database database;
    QWidget window;
    designer::ConnectionBanner* banner = nullptr;
    bool dead = false;
};

} // namespace

TEST_F(ALostConnection, IsToldOnce) {
    QStringList lost;
    QObject::connect(&database, &Database::lost, [&](const QString& why) { lost << why; });
    EXPECT_FALSE(banner->isVisible());
    killServer();
    const auto error = read();
    ASSERT_TRUE(error);
    EXPECT_FALSE(error->contains(u'\n'));
    EXPECT_TRUE(read());
    EXPECT_EQ(lost, QStringList(*error));
    EXPECT_TRUE(database.isLost());
    EXPECT_TRUE(banner->isVisible());
    EXPECT_EQ(bannerText(), "The connection to postgres is lost. Your query is kept.");
}

TEST_F(ALostConnection, IsNoticedInTheMiddleOfReading) {
    const auto connection = database.connect();
    ASSERT_TRUE(connection);
    EXPECT_TRUE(reader::answers(*connection));
    killServer();
    // Its session ends when it sees that the server has.
    EXPECT_TRUE(until([&] { return !reader::answers(*connection); }));
}

TEST_F(ALostConnection, IsNotAMistakeInAStatement) {
    int lost = 0;
    QObject::connect(&database, &Database::lost, [&] { ++lost; });
    const auto read = designer::readTables(database.connector(), {{{u"", u"gone"}}, {}});
    EXPECT_FALSE(read.lost);
    EXPECT_TRUE(takeTables(database, read));
    EXPECT_EQ(lost, 0);
}

TEST_F(ALostConnection, IsRenewedWithTheButtonOfTheBanner) {
    killServer();
    ASSERT_TRUE(read());
    ASSERT_TRUE(banner->isVisible());
    click<QPushButton>("reconnect");
    EXPECT_TRUE(banner->isVisible());
    EXPECT_TRUE(
        bannerText().endsWith(QStringLiteral("see that the server runs, and check host and port.")))
        << bannerText().toStdString();

    restartServer();
    runOnServer({QStringLiteral("CREATE TABLE IF NOT EXISTS villages (id int)")});
    int opened = 0;
    QObject::connect(&database, &Database::opened, [&] { ++opened; });
    click<QPushButton>("reconnect");
    EXPECT_EQ(opened, 1);
    EXPECT_FALSE(banner->isVisible());
    EXPECT_FALSE(database.isLost());
    EXPECT_TRUE(std::any_of(database.tables().begin(), database.tables().end(),
                            [](const auto& entry) { return entry.id.name == u"villages"; }));
    EXPECT_EQ(read(), std::nullopt);
    EXPECT_TRUE(database.reader().table(towns));
}

TEST_F(ALostConnection, IsOverAsSoonAsTheServerHasAnswered) {
    killServer();
    ASSERT_TRUE(read());
    ASSERT_TRUE(banner->isVisible());
    restartServer();
    EXPECT_EQ(read(), std::nullopt);
    EXPECT_FALSE(banner->isVisible());
    EXPECT_FALSE(database.isLost());
}

TEST_F(ALostConnection, MayBeLeftLostAndIsToldAgainTheNextTime) {
    killServer();
    ASSERT_TRUE(read());
    click<QToolButton>("close");
    EXPECT_FALSE(banner->isVisible());
    restartServer();
    EXPECT_EQ(read(), std::nullopt); // what reads over connections of its own just goes on
    EXPECT_EQ(database.renew(), std::nullopt);
    EXPECT_FALSE(database.isLost());
    killServer();
    ASSERT_TRUE(read());
    EXPECT_TRUE(banner->isVisible());
}

TEST_F(ALostConnection, WasOneThatRefusesToWrite) {
    const auto connection = database.connect();
    ASSERT_TRUE(connection);
    QSqlQuery query(connection->database());
    EXPECT_FALSE(query.exec(QStringLiteral("INSERT INTO towns VALUES (1)")));
    EXPECT_TRUE(query.lastError().databaseText().contains(QStringLiteral("read-only")))
        << query.lastError().text().toStdString();
}
