#include "Databases.h"
#include "Queries.h"

#include "designer/run/ParameterDialog.h"
#include "support/QtHands.h"

#include <gtest/gtest.h>

#include <QDialogButtonBox>
#include <QLabel>
#include <QLineEdit>
#include <QPushButton>

using namespace zandor;

using designer::ParameterDialog;
using model::sql::Dialect;

namespace {

class AskingForParameters : public testing::Test {
protected:
    void open(const designer::Answers& answers = {}) {
        const auto query = draw(sampleDatabase(), {"stock", "products"},
                                {{"stock.quantity", {"< :most"}},
                                 {"stock.reorder_level", {"> :most"}},
                                 {"products.name", {"= [Which product?]"}}});
        dialog.emplace(designer::questions(designer::statementFor(*query, Dialect::SQLite, {})),
                       answers);
        dialog->show();
    }
    QLineEdit& field(const QString& name) { return *dialog->findChild<QLineEdit*>(name); }
    QPushButton& run() {
        return *dialog->findChild<QDialogButtonBox*>()->button(QDialogButtonBox::Ok);
    }

    std::optional<ParameterDialog> dialog;
};

} // namespace

TEST_F(AskingForParameters, HasAFieldForEachName) {
    open();
    EXPECT_EQ(dialog->findChildren<QLineEdit*>().size(), 2);
    EXPECT_EQ(field("most").placeholderText(), "a number");
    EXPECT_EQ(field("Which product?").placeholderText(), "a text");
}

TEST_F(AskingForParameters, LetsNothingRunThatDoesNotFit) {
    open();
    EXPECT_FALSE(run().isEnabled());
    for (const QChar letter : QString("1o")) hands::key(field("most"), 0, QString(letter));
    EXPECT_FALSE(run().isEnabled());
    hands::key(field("most"), Qt::Key_Backspace);
    EXPECT_TRUE(run().isEnabled());
    hands::click(run(), run().rect().center());
    EXPECT_EQ(dialog->result(), QDialog::Accepted);
    EXPECT_EQ(dialog->answers(), (designer::Answers{{"most", "1"}, {"Which product?", ""}}));
}

TEST_F(AskingForParameters, SaysWhatIsWanted) {
    open();
    QStringList texts;
    for (const QLabel* label : dialog->findChildren<QLabel*>()) texts << label->text();
    EXPECT_TRUE(texts.contains("most has to be a number.")) << texts.join("|").toStdString();
}

TEST_F(AskingForParameters, RemembersWhatWasTypedTheLastTime) {
    open({{"most", "20"}, {"Which product?", "Tea"}, {"other", "x"}});
    EXPECT_EQ(field("most").text(), "20");
    EXPECT_EQ(field("Which product?").text(), "Tea");
    EXPECT_TRUE(run().isEnabled());
}

TEST_F(AskingForParameters, CutsNeitherItsTitleNorItsFields) {
    open();
    const QFontMetrics metrics = dialog->fontMetrics();
    // Beside the title stand the window's own buttons.
    EXPECT_GE(dialog->width(), metrics.horizontalAdvance(dialog->windowTitle()) * 3 / 2 + 120);
    for (const char* name : {"most", "Which product?"}) {
        QLineEdit& line = field(name);
        EXPECT_GE(line.width(), metrics.averageCharWidth() * 30) << name;
        EXPECT_GT(line.width(), metrics.horizontalAdvance(line.placeholderText()));
    }
    EXPECT_GE(dialog->width(), dialog->minimumSizeHint().width());
}

TEST_F(AskingForParameters, HasRoomForManyOnASmallScreen) {
    QStringList criteria;
    for (int n = 0; n < 40; ++n)
        criteria << QStringLiteral("= [what the value number %1 is]").arg(n);
    const auto query =
        draw(sampleDatabase(), {"products"}, {{"products.name", {criteria.join(" Or ")}}});
    dialog.emplace(designer::questions(designer::statementFor(*query, Dialect::SQLite, {})),
                   designer::Answers());
    dialog->show();
    EXPECT_EQ(dialog->findChildren<QLineEdit*>().size(), 40);
    EXPECT_LE(dialog->height(), 560);
    EXPECT_LE(dialog->width(), 1000);
    // The buttons are in sight, and a field comes into it with the focus.
    EXPECT_TRUE(dialog->rect().contains(run().mapTo(&*dialog, run().rect().center())));
    QLineEdit& last = field("what the value number 39 is");
    dialog->activateWindow();
    QCoreApplication::processEvents();
    last.setFocus(Qt::BacktabFocusReason);
    QCoreApplication::processEvents();
    EXPECT_FALSE(last.visibleRegion().isEmpty());
    EXPECT_GE(last.visibleRegion().boundingRect().width(), last.width());
}
