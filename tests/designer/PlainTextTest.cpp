#include "OpenWindow.h"

#include "designer/Banner.h"
#include "designer/PlainBox.h"
#include "designer/run/ResultTable.h"
#include "designer/run/ResultsPanel.h"

#include <Zandor/QueryDocument.h>

#include <QHeaderView>
#include <QLabel>

using namespace zandor;

using testing::HasSubstr;
using testing::Not;

namespace {

const QString evil = QStringLiteral("<h1>big</h1>\u202Ebmi\n\a");

/// Whether Qt would read markup in a label.
bool isRich(const QLabel& label) {
    return label.textFormat() == Qt::RichText || label.textFormat() == Qt::MarkdownText ||
           (label.textFormat() == Qt::AutoText && Qt::mightBeRichText(label.text()));
}

bool hidesSomething(const QString& text) {
    return text.contains(QChar(0x202E)) || text.contains(u'\a');
}

class TextFromElsewhere : public OpenWindow {
protected:
    void expectPlain(QWidget& widget) {
        for (const auto* label : widget.findChildren<QLabel*>()) {
            EXPECT_FALSE(isRich(*label)) << label->text().toStdString();
            EXPECT_FALSE(hidesSomething(label->text())) << label->text().toStdString();
        }
        EXPECT_FALSE(hidesSomething(widget.windowTitle()));
    }
};

} // namespace

TEST_F(TextFromElsewhere, IsPlainInEveryBox) {
    answering(
        [&](QMessageBox& box) {
            expectPlain(box);
            EXPECT_THAT(textOf(box), HasSubstr("<h1>big</h1>"));
            ::press(box, "OK");
        },
        [] { designer::PlainBox::warn(nullptr, "title", evil); });
    designer::PlainBox box(QMessageBox::Warning, "title", evil, QMessageBox::Ok, nullptr);
    box.setInformativeText(evil);
    expectPlain(box);
}

TEST_F(TextFromElsewhere, IsPlainWhereAQueryNamesItsDatabase) {
    files::QueryDocument document{openedSample({"orders"}).query};
    document.database = (u'/' + evil).toStdU16String();
    const QString query = folder.path("query.json");
    ASSERT_FALSE(files::saveQuery(query.toStdString(), document));
    open();
    const Answering answers({[&](QDialog& dialog) { choose(dialog, query); },
                             [&](QDialog& dialog) {
                                 expectPlain(dialog);
                                 press(dialog, "Close");
                             }});
    command("open");
}

TEST_F(TextFromElsewhere, IsPlainInTheHeadersAndCellsOfTheRows) {
    const QString name = QString(evil).remove(u'\n').remove(u'\a') + QString(5000, u'w');
    const QString path = folder.database(
        "a.db", {QStringLiteral("CREATE TABLE t (\"%1\" TEXT)").arg(name),
                 QStringLiteral("INSERT INTO t VALUES ('%1')").arg(evil + QString(5000, u'w'))});
    open({.file = path, .tables = {"t"}});
    window->results().run();
    ASSERT_TRUE(until([&] { return !window->results().isRunning(); }));
    auto& table = *window->findChild<designer::ResultTable*>();
    const auto& rows = table.rows();
    ASSERT_EQ(rows.rowCount(), 1);
    for (const int role : {Qt::DisplayRole, Qt::ToolTipRole}) {
        for (const QString& text : {rows.headerData(0, Qt::Horizontal, role).toString(),
                                    rows.data(rows.index(0, 0), role).toString()}) {
            EXPECT_FALSE(hidesSomething(text)) << text.left(100).toStdString();
            EXPECT_LT(text.size(), 2500);
            // Qt reads a tooltip as rich text when it looks like that: the markup is escaped then.
            EXPECT_EQ(text.contains("<h1>"), role == Qt::DisplayRole) << text.toStdString();
        }
    }
    EXPECT_LE(table.columnWidth(0), 320);
    table.horizontalHeader()->resizeSection(0, 100'000);
    EXPECT_LE(table.columnWidth(0), 1200);
}

TEST_F(TextFromElsewhere, IsPlainInABar) {
    designer::Banner banner;
    banner.say(evil, evil);
    expectPlain(banner);
    EXPECT_THAT(banner.findChild<QLabel*>()->toolTip().toStdString(), Not(HasSubstr("<h1>")));
}
