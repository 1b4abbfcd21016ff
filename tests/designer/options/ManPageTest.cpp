#include "designer/Arguments.h"

#include <gmock/gmock.h>

#include <QFile>
#include <QProcess>
#include <QRegularExpression>
#include <QStandardPaths>

#include <set>

using namespace zandor;

using testing::HasSubstr;
using testing::Not;

namespace {

const QString page = QStringLiteral(SOURCE_ROOT "/docs/zandor-designer.1");

QString textOf(const QString& path) {
    QFile file(path);
    EXPECT_TRUE(file.open(QIODevice::ReadOnly));
    return QString::fromUtf8(file.readAll());
}

std::set<std::string> optionsIn(const QString& text) {
    std::set<std::string> result;
    const QRegularExpression options("--([a-z][a-z-]*)");
    for (auto all = options.globalMatch(text); all.hasNext();)
        result.insert(all.next().captured(1).toStdString());
    return result;
}

} // namespace

TEST(TheManPage, HasTheOptionsOfTheHelpAndNoOthers) {
    EXPECT_EQ(optionsIn(textOf(page).replace("\\-", "-")), optionsIn(designer::helpText()));
}

TEST(TheManPage, HasNoOptionThatTheProgramDoesNotKnow) {
    for (const std::string& option : optionsIn(textOf(page).replace("\\-", "-"))) {
        if (option == "help" || option == "version") continue;
        const auto arguments =
            designer::readArguments({"--" + QString::fromStdString(option) + "=x"});
        if (!arguments) {
            EXPECT_THAT(arguments.error().toStdString(), Not(HasSubstr("Unknown"))) << option;
        }
    }
}

TEST(TheManPage, IsFormattedWithoutAWarning) {
    const QString man = QStandardPaths::findExecutable("man");
    if (man.isEmpty()) GTEST_SKIP() << "man is not installed";
    QProcess process;
    process.start(man, {"--warnings", "-E", "UTF-8", "-l", "-Tutf8", "-P", "cat", page});
    ASSERT_TRUE(process.waitForFinished(60000));
    EXPECT_EQ(process.exitCode(), 0);
    EXPECT_EQ(process.readAllStandardError().toStdString(), "");
    EXPECT_THAT(process.readAllStandardOutput().toStdString(), HasSubstr("All well."));
}
