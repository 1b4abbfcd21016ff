#include "../OpenWindow.h"
#include "model/reader/OneServer.h"

#include "designer/database/ConnectionBanner.h"

#include <QLabel>

using namespace zandor;

namespace {

/// A window over a server that dies and comes back.
class ALostServerInTheWindow : public OpenWindow {
protected:
    ALostServerInTheWindow() {
        runOnServer({"DROP TABLE IF EXISTS harbours",
                     "CREATE TABLE harbours (id integer PRIMARY KEY, name text)"});
        open({.file = serverAddress(), .tables = {"harbours"}});
    }
    ~ALostServerInTheWindow() override {
        window.reset();
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

    bool saysLost() {
        const auto* banner = window->findChild<designer::ConnectionBanner*>();
        return banner && banner->isVisible();
    }
    std::string status() { return window->findChild<QLabel*>("runStatus")->text().toStdString(); }
    std::string message() { return window->findChild<QLabel*>("runMessage")->text().toStdString(); }
    /// By F5's command, until it has ended.
    void run() {
        command("run");
        ASSERT_TRUE(until([this] { return !offers("cancel"); }));
        calm();
    }

    bool dead = false;
};

} // namespace

TEST_F(ALostServerInTheWindow, IsToldByTheBarUntilAQueryHasRun) {
    run();
    EXPECT_EQ(status().find("Rows: 0"), 0u) << status();
    EXPECT_FALSE(saysLost());

    killServer();
    run();
    EXPECT_TRUE(saysLost()) << message();
    EXPECT_TRUE(window->database().isLost());

    restartServer();
    run();
    EXPECT_EQ(status().find("Rows: 0"), 0u) << status() << message();
    EXPECT_FALSE(saysLost());
    EXPECT_FALSE(window->database().isLost());
}

TEST_F(ALostServerInTheWindow, IsThereAgainEvenWhereTheStatementFails) {
    killServer();
    run();
    ASSERT_TRUE(saysLost());
    restartServer();
    runOnServer({"DROP TABLE harbours"});
    run();
    EXPECT_NE(message().find("did not run the statement"), std::string::npos) << message();
    EXPECT_FALSE(saysLost()) << "the server has answered";
}

TEST_F(ALostServerInTheWindow, IsThereAgainForAnExportToo) {
    killServer();
    run();
    ASSERT_TRUE(saysLost());
    restartServer();
    commandWithFile("exportRows", folder.path("harbours.csv"));
    ASSERT_TRUE(until([this] { return !offers("cancel"); }));
    calm();
    EXPECT_TRUE(QFile::exists(folder.path("harbours.csv")));
    EXPECT_FALSE(saysLost());
}
