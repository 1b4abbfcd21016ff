#include "designer/options/EventPanel.h"

#include "designer/DrawingArea.h"
#include "designer/document/Document.h"
#include "frontends/qt/ZandorWindowMessage.h"
#include "support/PublicInterface.h"
#include "support/QtHands.h"

#include <gmock/gmock.h>

#include <QClipboard>
#include <QGuiApplication>
#include <QPushButton>
#include <QRegularExpression>
#include <QScrollBar>
#include <QTreeWidget>

using namespace zandor;

using testing::ElementsAre;
using Row = std::vector<std::string>;

namespace {

class TheEventPanel : public testing::Test {
protected:
    void SetUp() override {
        const auto query = platform::makeRef<model::Query>();
        for (const char16_t* name : {u"orders", u"customers"})
            query->addTable({u"", name, {{u"id"}, {u"total"}}});
        document.setQuery(query);
        area.resize(800, 600);
        area.show();
        QObject::connect(&area, &designer::DrawingArea::controlMade, &panel,
                         &designer::EventPanel::watch);
        panel.watch(&area.control());
        panel.resize(500, 200);
        panel.show();
        QCoreApplication::processEvents();
    }

    ZandorWidget& control() { return area.control(); }
    QTreeWidget& events() { return *panel.findChild<QTreeWidget*>(); }
    int count() { return events().topLevelItemCount(); }
    /// Number, name and arguments.
    Row row(int number) {
        const auto* item = events().topLevelItem(number);
        return {item->text(1).toStdString(), item->text(2).toStdString(),
                item->text(3).toStdString()};
    }
    Row last() { return count() ? row(count() - 1) : Row(); }
    QPushButton& button(const char* text) {
        for (auto* one : panel.findChildren<QPushButton*>())
            if (one->text() == QLatin1String(text)) return *one;
        throw std::runtime_error(text);
    }
    platform::Ref<model::Column> column(const char16_t* table, const char16_t* name) {
        return document.query()->tableNamed(table)->columnNamed(name);
    }

    designer::Document document;
    designer::DrawingArea area{document};
    designer::EventPanel panel;
    model::Library library;
};

} // namespace

TEST_F(TheEventPanel, ShowsWhatTheUsersHandsBringAbout) {
    control().SetCurrentTable("orders");
    hands::key(*control().window()->focusWidget(), Qt::Key_Delete);
    // Delete acts through the context menu.
    ASSERT_EQ(count(), 4);
    EXPECT_THAT(row(0), ElementsAre("-122", "Activate", ""));
    EXPECT_EQ(row(1)[1], "TALVIKDISABLEVELT");
    EXPECT_THAT(row(2), ElementsAre("-120", "TableDeleted", "DeletedTable: orders"));
    EXPECT_EQ(row(3)[1], "TALVIKDISABLEVELT");
    EXPECT_TRUE(QRegularExpression("^\\d\\d:\\d\\d:\\d\\d\\.\\d\\d\\d$")
                    .match(events().topLevelItem(0)->text(0))
                    .hasMatch());
}

TEST_F(TheEventPanel, NamesEachEventWithItsNumber) {
    const auto join = library.NewZDJoin();
    join->LeftColumn(column(u"orders", u"id"));
    join->RightColumn(column(u"customers", u"id"));
    join->CompareOperator(4);
    const auto definition = library.NewZDColumnDefinition();
    definition->Column(column(u"orders", u"total"));
    emit control().TableDeleted();
    emit control().TableMoved();
    emit control().Activate();
    emit control().ColumnCreated(definition);
    emit control().ColumnModified(definition);
    emit control().ColumnRemoved(definition);
    emit control().Error("New Zanodr is nothing!", -1);
    emit control().JoinCreated(join);
    emit control().JoinModified(join);
    emit control().JoinRemoved(join);
    ASSERT_EQ(count(), static_cast<int>(std::size(promised::events)));
    for (int n = 0; n < count(); ++n) {
        const auto& promise = promised::events[n];
        EXPECT_EQ(row(n)[0], std::to_string(promise.number));
        EXPECT_EQ(row(n)[1], std::string(promise.name.begin(), promise.name.end()));
        if (promise.carries == promised::Carries::definition) {
            EXPECT_EQ(row(n)[2], "orders.total");
        }
        if (promise.carries == promised::Carries::join) {
            EXPECT_EQ(row(n)[2], "orders.id <= customers.id");
        }
        if (promise.carries == promised::Carries::textAndNumber) {
            EXPECT_EQ(row(n)[2], "New Zanodr is nothing! (number -1)");
        }
    }
}

TEST_F(TheEventPanel, SaysWhatIsGone) {
    const auto definition = library.NewZDColumnDefinition();
    definition->Column(column(u"orders", u"total"));
    document.query()->DeleteTable(document.query()->tableNamed(u"orders"));
    emit control().ColumnRemoved(definition);
    EXPECT_THAT(last(), ElementsAre("-125", "ColumnRemoved", "(gone).(gone)"));
    emit control().JoinRemoved({});
    EXPECT_THAT(last(), ElementsAre("-129", "JoinRemoved", "(gone)"));
}

TEST_F(TheEventPanel, ShowsThatTheMenuOpensAndCloses) {
    const auto type = ZandorWindowMessage::typeOf("TALVIKDISABLEVELT");
    std::int32_t scratch = 0;
    for (const std::uintptr_t wParam : {0, 1}) {
        ZandorWindowMessage message(type, wParam, &scratch);
        QCoreApplication::sendEvent(&control(), &message);
    }
    ASSERT_EQ(count(), 2);
    EXPECT_THAT(row(0), ElementsAre("", "TALVIKDISABLEVELT", "wParam 0: the menu opens"));
    EXPECT_THAT(row(1), ElementsAre("", "TALVIKDISABLEVELT", "wParam 1: the menu is closed"));
}

TEST_F(TheEventPanel, ListensToEachNewControl) {
    document.setQuery(platform::makeRef<model::Query>());
    emit control().Activate();
    EXPECT_THAT(last(), ElementsAre("-122", "Activate", ""));
    EXPECT_EQ(count(), 1);
}

TEST_F(TheEventPanel, KeepsAThousandAndShowsTheNewest) {
    for (int n = 0; n < designer::EventPanel::mostEvents + 5; ++n)
        emit control().Error(QString::number(n), 0);
    QCoreApplication::processEvents();
    EXPECT_EQ(count(), 1000);
    EXPECT_EQ(row(0)[2], "5 (number 0)");
    EXPECT_EQ(last()[2], "1004 (number 0)");
    EXPECT_EQ(events().verticalScrollBar()->value(), events().verticalScrollBar()->maximum());
}

TEST_F(TheEventPanel, StaysWhereSomebodyReads) {
    for (int n = 0; n < 100; ++n) emit control().Activate();
    QCoreApplication::processEvents();
    events().verticalScrollBar()->setValue(10);
    emit control().Activate();
    QCoreApplication::processEvents();
    EXPECT_EQ(events().verticalScrollBar()->value(), 10);
}

TEST_F(TheEventPanel, CopiesAndClears) {
    EXPECT_FALSE(button("Copy").isEnabled());
    emit control().Activate();
    emit control().TableMoved();
    hands::click(button("Copy"), {5, 5});
    const QStringList lines = QGuiApplication::clipboard()->text().split('\n');
    ASSERT_EQ(lines.size(), 3);
    EXPECT_TRUE(lines[0].endsWith("\t-122\tActivate\t"));
    EXPECT_TRUE(lines[1].endsWith("\t-121\tTableMoved\t"));
    events().topLevelItem(1)->setSelected(true);
    hands::click(button("Copy"), {5, 5});
    EXPECT_EQ(QGuiApplication::clipboard()->text().count('\n'), 1);
    EXPECT_TRUE(QGuiApplication::clipboard()->text().contains("TableMoved"));
    hands::click(button("Clear"), {5, 5});
    EXPECT_EQ(count(), 0);
    EXPECT_FALSE(button("Clear").isEnabled());
}
