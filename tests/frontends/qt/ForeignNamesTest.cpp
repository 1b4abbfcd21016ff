#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/Desk.h"
#include "frontends/qt/ShownText.h"

#include <QAccessible>
#include <QDialog>
#include <QHeaderView>
#include <QHelpEvent>
#include <QLineEdit>
#include <QToolTip>

using namespace zandor;

using platform::qt::asSigns;

namespace {

constexpr char16_t turned[] = u"OR\u202EDER\nS<b>&amp;\u0007";
const char shown[] = "OR⇄DER↵S<b>&amp;␇";

/// A table and a column whose name nobody would want on the screen as it is.
class ANameFromADatabase : public Desk {
protected:
    ANameFromADatabase() {
        show();
        model = library.newModel();
        orders = model->table(turned, {u"*", u"ID", turned});
        orders->place(600, 600, 900, 2700);
        customers = model->table(u"CUSTOMERS", {u"*", u"ID"});
        customers->place(5100, 450, 2400, 1800);
        model->join(orders, turned, customers, u"ID");
        model->definition(orders, turned, {turned});
        widget->setOnlyJoin(false);
        widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(model));
        settle();
    }

    static std::string toolTipAt(QWidget& part, QPoint at) {
        QHelpEvent help(QEvent::ToolTip, at, part.mapToGlobal(at));
        QCoreApplication::sendEvent(&part, &help);
        return QToolTip::text().toStdString();
    }
};

} // namespace

TEST_F(ANameFromADatabase, IsShownWithSignsInItsTable) {
    EXPECT_EQ(table(1).title().toStdString(), shown);
    EXPECT_EQ(table(1).accessibleName().toStdString(), shown);
    const auto& entries = *table(1).list().model();
    EXPECT_EQ(entries.index(2, 0).data().toString().toStdString(), shown);
}

TEST_F(ANameFromADatabase, IsShownWithSignsInTheGridWhoseCellKeepsIt) {
    const auto& cells = *grid().view().model();
    EXPECT_EQ(cells.headerData(0, Qt::Horizontal).toString().toStdString(), shown);
    EXPECT_EQ(cells.index(3, 0).data().toString().toStdString(), shown);
    EXPECT_EQ(cells.index(3, 0).data(Qt::AccessibleTextRole).toString().toStdString(),
              std::string("Criteria, ") + shown + ": " + shown);
    EXPECT_EQ(grid().model().text(0, 1), QString::fromUtf16(turned));
    EXPECT_EQ(grid().model().text(4, 1), QString::fromUtf16(turned));
}

TEST_F(ANameFromADatabase, IsSpokenWithSignsInTheNameOfItsJoin) {
    auto* line = child<platform::qt::Canvas>("fraTable").lines().front();
    EXPECT_EQ(line->accessible()->text(QAccessible::Name).toStdString(),
              std::string("Join ") + shown + "." + shown + " = CUSTOMERS.ID");
}

TEST_F(ANameFromADatabase, IsPlainTextInItsTooltips) {
    EXPECT_NE(toolTipAt(table(1), table(1).titleBar().center()).find("S&lt;b&gt;&amp;amp;"),
              std::string::npos);
    EXPECT_EQ(toolTipAt(table(1), table(1).titleBar().center()).find(u'\n'), std::string::npos);
    auto& list = table(1).list();
    const QPoint entry = list.visualRect(list.model()->index(2, 0)).center();
    EXPECT_NE(toolTipAt(*list.viewport(), entry).find("S&lt;b&gt;&amp;amp;"), std::string::npos);
}

TEST_F(ANameFromADatabase, IsShownWithSignsInTheDialogThatKeepsItsJoin) {
    std::string table, column;
    QTimer::singleShot(0, [&] {
        auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget());
        ASSERT_TRUE(dialog);
        table = dialog->findChild<QLineEdit*>("txtLeftTable")->text().toStdString();
        column = dialog->findChild<QLineEdit*>("txtLeftColumn")->text().toStdString();
        dialog->reject();
    });
    auto& canvas = child<platform::qt::Canvas>("fraTable");
    canvas.focusOn(canvas.lines().front(), Qt::TabFocusReason);
    canvas.openCurrentLine();
    EXPECT_EQ(table, shown);
    EXPECT_EQ(column, shown);
}

TEST_F(ANameFromADatabase, IsEditedAsItIs) {
    press(4, 1);
    EXPECT_EQ(child<QLineEdit>("txtValue").text(), QString::fromUtf16(turned));
}
