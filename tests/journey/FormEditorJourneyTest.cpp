#include "Home.h"
#include "Screen.h"

#include <QCoreApplication>
#include <QDir>
#include <QRect>

#include <gtest/gtest.h>

#include <unistd.h>

// Qt Designer itself, on a screen, with a form that has the query designer.

namespace {

class QtDesigner : public testing::Test {
protected:
    QString ask(const QString& question) {
        program.send(question);
        return program.line();
    }

    /// The query designer as the probe describes it; waits for it.
    QStringList form() {
        QString said;
        await(QStringLiteral("the form is open"), [&] { return !(said = ask("form")).isEmpty(); });
        return said.split(u' ');
    }

    void picture(const QString& name) {
        QDir().mkpath(QStringLiteral(ZANDOR_JOURNEY_PICTURES));
        EXPECT_EQ(ask("picture " ZANDOR_JOURNEY_PICTURES "/" + name + ".png"), u"saved");
    }

    Home home;
    Screen screen{QSize(1440, 800)};
    Program program{QStringLiteral(ZANDOR_QT_DESIGNER),
                    {QStringLiteral(ZANDOR_FORM)},
                    home.environment() + QStringList{screen.variable(), "QT_QPA_PLATFORM=xcb",
                                                     "QT_PLUGIN_PATH=" ZANDOR_PLUGINS}};
};

} // namespace

TEST_F(QtDesigner, OpensTheFormWithTheWidgetItselfAndItsPropertiesInGroups) {
    form();
    EXPECT_EQ(ask("room"), u"there is");
    const QStringList widget = form();
    EXPECT_EQ(widget.mid(0, 4).join(u' ').toStdString(), "ZandorWidget query plug-in 3");

    const QRect place(widget[4].toInt(), widget[5].toInt(), widget[6].toInt(), widget[7].toInt());
    screen.click(place.center());
    await(QStringLiteral("it is selected"), [&] { return ask("selected") == u"query"; });
    QString headings;
    await(QStringLiteral("the property editor shows it"), [&] {
        headings = ask("headings");
        return headings.contains(u"Texts");
    });
    EXPECT_EQ(headings.toStdString(),
              "QObject|QWidget|Texts|Menu|Appearance|Run Time|Diagnostics|Behaviour");
    EXPECT_FALSE(screen.shows(QStringLiteral("TalvikDBxZandor"))); // a box of the control
    EXPECT_EQ(ask("show Texts"), u"shown");
    picture(QStringLiteral("qt-designer"));
}

int main(int argc, char** argv) {
    // Whatever happens, nothing is left behind: the children die with this program.
    alarm(120);
    const QCoreApplication application(argc, argv);
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
