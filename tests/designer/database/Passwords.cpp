#include "Answers.h"
#include "model/reader/OneServer.h"

#include "designer/database/ConnectionDialog.h"
#include "designer/database/Database.h"
#include "designer/database/ErrorLine.h"
#include "designer/database/PasswordPrompt.h"
#include "designer/database/opening.h"

#include <gtest/gtest.h>

#include <QDir>
#include <QDirIterator>
#include <QFile>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>
#include <QSettings>
#include <QStandardPaths>

using namespace zandor;

using designer::Database;
using designer::PasswordPrompt;

namespace {

const QString secret = QStringLiteral("open%Sesame@7");

class APassword : public testing::Test {
protected:
    static void SetUpTestSuite() {
        runOnServer({QStringLiteral("CREATE ROLE mary LOGIN PASSWORD '%1'").arg(secret)});
        oneServer.server().requirePassword(QStringLiteral("mary"));
    }

    static QString address() { return serverAddress(QStringLiteral("mary")); }

    static QString withPassword() {
        QString address = APassword::address();
        return address.replace(QStringLiteral("mary@"), QStringLiteral("mary:open%25Sesame%407@"));
    }

    static void answer(PasswordPrompt& prompt, const QString& password) {
        auto* const field = prompt.findChild<QLineEdit*>();
        EXPECT_EQ(field->echoMode(), QLineEdit::Password);
        type(*field, password);
        hands::key(*field, Qt::Key_Return);
    }

    Database database;
};

QStringList messages;

void keepMessage(QtMsgType, const QMessageLogContext&, const QString& text) { messages << text; }

/// Files below a folder that have the secret in them, as it is or as an address writes it.
QStringList filesWithSecret(const QString& folder) {
    QStringList found;
    QDirIterator files(folder, QDir::Files | QDir::Hidden, QDirIterator::Subdirectories);
    while (files.hasNext()) {
        QFile file(files.next());
        if (!file.open(QIODevice::ReadOnly)) continue;
        const QByteArray content = file.readAll();
        if (content.contains(secret.toUtf8()) || content.contains("Sesame"))
            found << file.fileName();
    }
    return found;
}

} // namespace

TEST_F(APassword, IsAskedForAsLongAsTheServerWantsOne) {
    QStringList texts;
    whenOpen<PasswordPrompt>([&](PasswordPrompt& first) {
        texts << first.findChild<QLabel*>()->text();
        EXPECT_FALSE(first.findChild<designer::ErrorLine*>()->isVisible());
        whenOpen<PasswordPrompt>([&](PasswordPrompt& second) {
            texts << second.findChild<designer::ErrorLine*>()->text();
            answer(second, secret);
        });
        answer(first, QStringLiteral("wrong"));
    });
    const auto opening = openAskingForPassword(database, address(), nullptr);
    EXPECT_TRUE(opening.opened) << opening.error.toStdString();
    ASSERT_EQ(texts.size(), 2);
    EXPECT_EQ(texts[0], "The database postgres on " + oneServer.server().folder() +
                            " asks for the password of mary.");
    EXPECT_TRUE(texts[1].endsWith(QStringLiteral("check the user name and the password.")))
        << texts[1].toStdString();
    EXPECT_FALSE(texts[1].contains(QStringLiteral("wrong")));
    EXPECT_TRUE(database.connect());
    EXPECT_EQ(database.renew(), std::nullopt);
}

TEST_F(APassword, NeedNotBeGiven) {
    whenOpen<PasswordPrompt>([](PasswordPrompt& prompt) { hands::key(prompt, Qt::Key_Escape); });
    const auto opening = openAskingForPassword(database, address(), nullptr);
    EXPECT_FALSE(opening.opened);
    EXPECT_EQ(opening.error, "");
}

TEST_F(APassword, InAnAddressIsUsedAndForgottenThere) {
    const auto opening = openAskingForPassword(database, withPassword(), nullptr);
    EXPECT_TRUE(opening.opened) << opening.error.toStdString();
    EXPECT_EQ(database.address(), address());
}

TEST_F(APassword, IsWrittenNowhere) {
    const QTemporaryDir home;
    const QByteArray before = qgetenv("HOME");
    qputenv("HOME", home.path().toLocal8Bit());
    const auto oldHandler = qInstallMessageHandler(keepMessage);

    QStringList shown;
    designer::ConnectionDialog dialog(database);
    dialog.show();
    dialog.setAddress(
        withPassword().replace(QStringLiteral("/postgres?"), QStringLiteral("/nothing?")));
    for (const auto* button : dialog.findChildren<QPushButton*>())
        if (button->isDefault())
            hands::click(const_cast<QPushButton&>(*button), button->rect().center());
    for (const auto* label : dialog.findChildren<QLabel*>()) shown << label->text();
    for (const auto* field : dialog.findChildren<QLineEdit*>()) shown << field->displayText();
    EXPECT_TRUE(shown.filter(QStringLiteral("check the name of the database")).size() == 1);
    dialog.setAddress(withPassword());
    for (auto* button : dialog.findChildren<QPushButton*>())
        if (button->isDefault()) hands::click(*button, button->rect().center());
    EXPECT_EQ(dialog.result(), QDialog::Accepted);
    shown << dialog.address() << database.address() << database.name() << dialog.windowTitle();
    // What a program keeps of a session is the address.
    QSettings settings(home.filePath(QStringLiteral("settings.ini")), QSettings::IniFormat);
    settings.setValue(QStringLiteral("recent"), database.address());
    settings.sync();
    oneServer.server().kill();
    database.sayLost(database.connect().error());
    shown << database.connect().error();
    oneServer.server().restart();
    EXPECT_EQ(database.renew(), std::nullopt);

    qInstallMessageHandler(oldHandler);
    EXPECT_EQ(filesWithSecret(home.path()), QStringList());
    EXPECT_EQ(filesWithSecret(QDir::tempPath() + QStringLiteral("/runtime-root")), QStringList());
    EXPECT_FALSE((shown + messages).join(u'\n').contains(QStringLiteral("Sesame")))
        << (shown + messages).join(u'\n').toStdString();
    qputenv("HOME", before);
}
