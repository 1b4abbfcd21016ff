#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/Desk.h"
#include "frontends/qt/GridCells.h"
#include "frontends/qt/PickListWidget.h"

#include <Zandor/qt/Text.h>

#include <QAbstractButton>
#include <QAccessible>
#include <QComboBox>
#include <QLineEdit>
#include <QPushButton>
#include <QTranslator>

using namespace zandor;

namespace {

using platform::qt::toQt;

/// Puts every text of the widget into brackets.
class Brackets : public QTranslator {
public:
    QString translate(const char* context, const char* text, const char*, int) const override {
        return qstrcmp(context, "ZandorWidget") == 0 ? "<" + QString::fromUtf8(text) + ">"
                                                     : QString();
    }
    bool isEmpty() const override { return false; }
};

class TheWidgetsWords : public Desk {
protected:
    TheWidgetsWords() {
        widget->setComforts(comforts::Flags::all());
        show();
        bind();
    }
    ~TheWidgetsWords() override { QCoreApplication::removeTranslator(&brackets); }

    /// Everything that is shown and spoken, by where it stands.
    QMap<QString, QString> said() {
        QMap<QString, QString> all;
        all["widget"] = widget->accessibleName();
        for (const char* part : {"fraTable", "hsbTable", "vsbTable", "cmdHome", "paneHandle"})
            all[part] = child<QWidget>(part).accessibleName();
        all["home tip"] = child<QWidget>("cmdHome").toolTip();
        all["divider tip"] = child<QWidget>("paneHandle").toolTip();
        all["grid"] = grid().view().accessibleName();
        all["close"] = table(1).closeButton().toolTip();
        all["close spoken"] = table(1).closeButton().accessibleName();
        const auto& entries = table(1).model();
        all["key column"] = entries.index(1).data(Qt::AccessibleDescriptionRole).toString();
        all["sort"] = grid().model().text(2, 2);
        all["visible"] = grid().model().text(3, 1);
        all["blank column"] = grid().model().titleOf(1, 9);
        all["offer"] = grid().offer();
        all["items"] = child<QComboBox>("cobSortOrder").itemText(0);
        all["set"] = child<QAbstractButton>("cmdSetTextValue").text();
        openFields();
        auto& fields = child<platform::qt::PickListWidget>("lstFields");
        all["find"] = fields.box().placeholderText();
        all["box"] = fields.box().accessibleName();
        all["fields"] = fields.list().accessibleName();
        hands::key(fields.box(), Qt::Key_Escape);
        settle();
        return all;
    }

    void openFields() {
        grid().setCurrentCell(0, 4);
        grid().view().setFocus();
        hands::key(grid().view(), Qt::Key_F2);
        settle();
    }

    Brackets brackets;
};

} // namespace

TEST_F(TheWidgetsWords, AreTheDefaultsWithoutATranslator) {
    EXPECT_EQ(widget->words(), platform::Words());
}

TEST_F(TheWidgetsWords, AreAllTranslatedWhenTheApplicationTakesAnotherLanguage) {
    const auto before = said();
    QCoreApplication::installTranslator(&brackets);
    settle();
    const platform::Words plain;
    for (const auto& [name, word] : platform::wordTable)
        EXPECT_EQ(toQt(widget->words().*word), "<" + toQt(plain.*word) + ">")
            << toQt(name).toStdString();
    const auto now = said();
    for (auto each = before.begin(); each != before.end(); ++each) {
        EXPECT_TRUE(now[each.key()].contains(u'<')) << each.key().toStdString();
        EXPECT_EQ(QString(now[each.key()]).remove(u'<').remove(u'>'), each.value());
    }
    QCoreApplication::removeTranslator(&brackets);
    settle();
    EXPECT_EQ(said(), before);
}

TEST_F(TheWidgetsWords, AreThoseOfATranslatorThatIsThereBefore) {
    QCoreApplication::installTranslator(&brackets);
    open();
    show();
    bind();
    EXPECT_EQ(child<QWidget>("cmdHome").toolTip(), "<Back to the origin>");
    EXPECT_EQ(grid().model().text(2, 2), "<Ascending>");
}

TEST_F(TheWidgetsWords, AreAHostsOwnWhateverTheLanguageUntilItLetsThemGo) {
    platform::Words own;
    own.Home = u"Zum Anfang";
    own.Visible = u"Sichtbar";
    own.Join = u"Verknüpfung %1 %2 %3";
    widget->setWords(own);
    QCoreApplication::installTranslator(&brackets);
    settle();
    EXPECT_EQ(widget->words(), own);
    EXPECT_EQ(child<QWidget>("cmdHome").toolTip(), "Zum Anfang");
    EXPECT_EQ(grid().model().text(3, 1), "Sichtbar");
    widget->resetWords();
    EXPECT_EQ(child<QWidget>("cmdHome").toolTip(), "<Back to the origin>");
    EXPECT_EQ(grid().model().text(3, 1), "<Visible>");
}

TEST_F(TheWidgetsWords, LeaveANameThatTheHostHasGivenTheWidget) {
    widget->setAccessibleName("Abfrage");
    QCoreApplication::installTranslator(&brackets);
    settle();
    EXPECT_EQ(widget->accessibleName(), "Abfrage");
}
