#include "designer/options/OptionsDialog.h"
#include "designer/options/ControlProperties.h"

#include "support/QtHands.h"

#include <gmock/gmock.h>

#include <QCheckBox>
#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QMenu>
#include <QPushButton>
#include <QSettings>
#include <QTabWidget>
#include <QTableWidget>
#include <QTemporaryDir>

using namespace zandor;

using designer::ControlOptions;
using designer::ControlProperty;

namespace {

class TheOptionsDialog : public testing::Test {
protected:
    void SetUp() override {
        QObject::connect(
            &dialog, &designer::OptionsDialog::applied,
            [this](const ControlOptions& options) { applied.push_back(options.properties()); });
        dialog.show();
    }

    void click(QAbstractButton& button) {
        auto& pages = *dialog.findChild<QTabWidget*>();
        for (int n = 0; n < pages.count(); ++n)
            if (pages.widget(n)->isAncestorOf(&button)) pages.setCurrentIndex(n);
        QCoreApplication::processEvents();
        hands::click(button, {8, button.height() / 2.0});
    }
    QCheckBox& box(const char* name) {
        return *dialog.findChild<QCheckBox*>(QString::fromLatin1(name));
    }
    QPushButton& button(QDialogButtonBox::StandardButton which) {
        return *dialog.findChild<QDialogButtonBox*>()->button(which);
    }
    QTableWidget& texts() { return *dialog.findChild<QTableWidget*>(); }
    int rowOf(const char* name) {
        for (int row = 0; row < texts().rowCount(); ++row)
            if (texts().item(row, 0)->toolTip().endsWith(QLatin1String(name))) return row;
        return -1;
    }
    QString text(const char* name) { return texts().item(rowOf(name), 1)->text(); }
    void type(const char* name, const QString& text) {
        auto* const item = texts().item(rowOf(name), 1);
        texts().setCurrentItem(item);
        texts().editItem(item);
        auto* const editor = texts().viewport()->findChild<QLineEdit*>();
        ASSERT_NE(editor, nullptr);
        editor->selectAll();
        if (text.isEmpty()) hands::key(*editor, Qt::Key_Delete);
        for (const QChar letter : text) hands::key(*editor, 0, letter);
        hands::key(*editor, Qt::Key_Return);
        QCoreApplication::processEvents();
    }
    QVariantMap stored() {
        settings.sync();
        return ControlOptions::read(settings).properties();
    }

    QTemporaryDir folder;
    QSettings settings{folder.filePath("settings.ini"), QSettings::IniFormat};
    designer::OptionsDialog dialog{settings};
    std::vector<QVariantMap> applied;
};

} // namespace

TEST_F(TheOptionsDialog, HasAPlaceForEachProperty) {
    for (const ControlProperty& property : designer::controlProperties()) {
        const QByteArray name = property.name.toLatin1();
        if (property.page == ControlProperty::Page::texts) {
            EXPECT_GE(rowOf(name), 0) << name.constData();
        } else {
            EXPECT_NE(dialog.findChild<QCheckBox*>(property.name), nullptr) << name.constData();
        }
        if (!property.also.isEmpty()) {
            EXPECT_TRUE(box(name).toolTip().contains(property.also)) << name.constData();
        }
    }
}

TEST_F(TheOptionsDialog, AppliesAtOnceAndKeepsWhatWasChosen) {
    EXPECT_FALSE(button(QDialogButtonBox::Apply).isEnabled());
    click(box("LNGMnuSep1Vis"));
    EXPECT_TRUE(button(QDialogButtonBox::Apply).isEnabled());
    EXPECT_EQ(applied.size(), 0U);
    click(button(QDialogButtonBox::Apply));
    ASSERT_EQ(applied.size(), 1U);
    EXPECT_EQ(applied[0].value("LNGMnuSep1Vis"), QVariant(false));
    EXPECT_EQ(stored().value("LNGMnuSep1Vis"), QVariant(false));
    EXPECT_FALSE(button(QDialogButtonBox::Apply).isEnabled());
    EXPECT_TRUE(dialog.isVisible());
}

TEST_F(TheOptionsDialog, AppliesAndClosesWithOk) {
    type("LNGJoinForm", "The join");
    click(button(QDialogButtonBox::Ok));
    ASSERT_EQ(applied.size(), 1U);
    EXPECT_EQ(applied[0].value("LNGJoinForm"), QVariant("The join"));
    EXPECT_EQ(stored().value("LNGJoinForm"), QVariant("The join"));
    EXPECT_FALSE(dialog.isVisible());
}

TEST_F(TheOptionsDialog, ForgetsEverythingWithCancel) {
    type("LNGJoinForm", "The join");
    click(box("LNGMnuSep1Vis"));
    click(button(QDialogButtonBox::Cancel));
    EXPECT_EQ(applied.size(), 0U);
    EXPECT_EQ(stored(), ControlOptions().properties());
}

TEST_F(TheOptionsDialog, SaysNothingWhenNothingWasChanged) {
    click(button(QDialogButtonBox::Ok));
    EXPECT_EQ(applied.size(), 0U);
}

TEST_F(TheOptionsDialog, BringsTheDefaultsBack) {
    type("LNGJoinForm", "The join");
    click(box("JoinModifyDisabled"));
    EXPECT_FALSE(box("JoinModifyDisabled").isChecked());
    click(button(QDialogButtonBox::RestoreDefaults));
    EXPECT_EQ(text("LNGJoinForm"), "Join Definition");
    EXPECT_TRUE(box("JoinModifyDisabled").isChecked());
    EXPECT_FALSE(button(QDialogButtonBox::Apply).isEnabled());
}

TEST_F(TheOptionsDialog, FillsInTheTextsOfALanguage) {
    auto* const menu = dialog.findChild<QMenu*>();
    QStringList languages;
    for (QAction* action : menu->actions()) languages << action->text().remove('&');
    EXPECT_EQ(languages, QStringList({"English", "Deutsch", QString::fromUtf8("Fran\u00e7ais"),
                                      QString::fromUtf8("Espa\u00f1ol")}));
    menu->actions().at(1)->trigger();
    EXPECT_EQ(text("LNGSpreadField"), "Feld:");
    for (int row = 0; row < texts().rowCount(); ++row) EXPECT_NE(texts().item(row, 1)->text(), "");
    EXPECT_TRUE(button(QDialogButtonBox::Apply).isEnabled());
    menu->actions().at(0)->trigger();
    EXPECT_EQ(text("LNGMnuDelTable"), "Delete &Table");
    EXPECT_EQ(text("LNGMnuDelCol"), "&Delete Column");
}

TEST_F(TheOptionsDialog, BringsATextBackThatIsEmptied) {
    type("LNGSpreadOr", "");
    EXPECT_EQ(text("LNGSpreadOr"), "Or:");
}

TEST_F(TheOptionsDialog, WarnsOfAGapInWhatTheJoinDialogOffers) {
    const auto warnings = [&] {
        int count = 0;
        for (const QLabel* label : dialog.findChildren<QLabel*>())
            if (label->text().startsWith("The join dialog counts") &&
                !label->parentWidget()->isHidden())
                ++count;
        return count;
    };
    EXPECT_EQ(warnings(), 0);
    click(box("UseJoinTypeBoth"));
    click(box("UseJoinTypeRight"));
    EXPECT_EQ(warnings(), 0);
    click(box("UseJoinTypeNormal"));
    EXPECT_EQ(warnings(), 1);
    click(box("UseJoinCompareOperatorLess"));
    EXPECT_EQ(warnings(), 2);
}
