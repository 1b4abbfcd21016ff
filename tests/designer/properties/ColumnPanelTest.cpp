#include "OpenProperties.h"

#include "designer/properties/FieldEdit.h"

#include <QCheckBox>
#include <QCompleter>
#include <QDockWidget>
#include <QLabel>
#include <QListWidget>
#include <QSpinBox>

using namespace zandor;

using model::Total;
using testing::HasSubstr;

namespace {

class TheColumnPanel : public OpenProperties {
protected:
    TheColumnPanel() { command("columnDockShown", "viewMenu"); }

    void command(const char* name, const char* menuName) {
        click(menu(menuName),
              [&](const QAction& action) { return action.objectName() == QLatin1String(name); });
    }
    designer::FieldEdit& field() { return found<designer::FieldEdit>("columnField"); }
    std::string finding() {
        const auto& label = found<QLabel>("columnFinding");
        return label.isVisible() ? label.text().toStdString() : "";
    }
    QComboBox& combo(const char* name) { return found<QComboBox>(name); }
    void pick(const char* name, const QString& text) {
        QComboBox& box = combo(name);
        const int item = box.findText(text);
        ASSERT_GE(item, 0) << text.toStdString();
        box.setFocus();
        box.setCurrentIndex(item);
        emit box.activated(item);
        calm();
    }
};

} // namespace

TEST_F(TheColumnPanel, ShowsTheColumnThatTheGridIsIn) {
    EXPECT_TRUE(found<QDockWidget>("columnDock").isVisible());
    EXPECT_EQ(field().text(), "orders.status");
    EXPECT_EQ(combo("columnTotal").currentText(), "No total");
    EXPECT_TRUE(found<QCheckBox>("columnShown").isChecked());
    EXPECT_FALSE(found<QSpinBox>("columnPriority").isEnabled());
    window->document().change({}, [&](model::Query&) {
        definition(2).total(Total::Sum);
        definition(2).Synonym(u"pieces");
        definition(2).SortOrder(2);
        definition(2).sortPriority(3);
        definition(2).Visible(false);
    });
    goToColumn(2);
    EXPECT_EQ(field().text(), "order_lines.quantity") << "without its total";
    EXPECT_EQ(combo("columnTotal").currentText(), "Sum");
    EXPECT_EQ(found<QLineEdit>("columnName").text(), "pieces");
    EXPECT_EQ(combo("columnSort").currentText(), "Descending");
    EXPECT_EQ(found<QSpinBox>("columnPriority").value(), 3);
    EXPECT_FALSE(found<QCheckBox>("columnShown").isChecked());
    goToColumn(3);
    EXPECT_EQ(field().text(), "");
    EXPECT_FALSE(combo("columnTotal").isEnabled());
}

TEST_F(TheColumnPanel, MakesEachChangeAStep) {
    pick("columnTotal", "Count");
    EXPECT_EQ(definition(1).total(), Total::Count);
    EXPECT_EQ(made(), 1);
    pick("columnSort", "Ascending");
    EXPECT_EQ(definition(1).SortOrder(), 1);
    EXPECT_EQ(made(), 2);
    auto& priority = found<QSpinBox>("columnPriority");
    priority.setFocus();
    hands::key(priority, Qt::Key_Up);
    calm();
    EXPECT_EQ(definition(1).sortPriority(), 1);
    EXPECT_EQ(made(), 3);
    auto& shown = found<QCheckBox>("columnShown");
    hands::click(shown, QPointF(10, shown.height() / 2.0));
    calm();
    EXPECT_FALSE(definition(1).Visible());
    EXPECT_EQ(made(), 4);
    write("columnName", "state");
    EXPECT_EQ(definition(1).Synonym(), u"") << "until it counts";
    hands::key(found<QLineEdit>("columnName"), Qt::Key_Return);
    calm();
    EXPECT_EQ(definition(1).Synonym(), u"state");
    EXPECT_EQ(made(), 5);
    for (int n = 0; n < 5; ++n) window->document().undo();
    calm();
    EXPECT_EQ(made(), 0);
    EXPECT_EQ(found<QLineEdit>("columnName").text(), "");
    EXPECT_EQ(combo("columnTotal").currentText(), "No total");
}

TEST_F(TheColumnPanel, SaysWhatIsWrongWhileItIsTyped) {
    write("columnField", "order_lines.quantity * nothing");
    ASSERT_TRUE(until([&] { return !finding().empty(); }));
    EXPECT_THAT(finding(), HasSubstr("nothing"));
    EXPECT_EQ(field().marked(), 23);
    EXPECT_EQ(field().accessibleDescription().toStdString(), finding());
    EXPECT_EQ(made(), 0);
    EXPECT_FALSE(definition(1).isExpression());
    write("columnField", "order_lines.quantity * 2");
    ASSERT_TRUE(until([&] { return finding().empty(); }));
    EXPECT_EQ(field().marked(), -1);
    hands::key(field(), Qt::Key_Escape); // the list of names
    hands::key(field(), Qt::Key_Return);
    calm();
    EXPECT_EQ(definition(1).expression().text, u"order_lines.quantity * 2");
    EXPECT_EQ(made(), 1);
    EXPECT_EQ(lastStep(), "Change field of order_lines.quantity * 2");
    EXPECT_EQ(grid().model().text(0, 1), "order_lines.quantity * 2");
}

TEST_F(TheColumnPanel, TakesTheNameOfAColumnForTheColumn) {
    write("columnField", "ORDERS.id");
    hands::key(field(), Qt::Key_Escape);
    hands::key(field(), Qt::Key_Return);
    calm();
    EXPECT_FALSE(definition(1).isExpression());
    EXPECT_EQ(grid().model().text(0, 1), "orders.id");
    EXPECT_EQ(field().text(), "orders.id");
    // An empty field is no wish to have none.
    write("columnField", "");
    hands::key(field(), Qt::Key_Return);
    calm();
    EXPECT_EQ(field().text(), "orders.id");
    EXPECT_EQ(made(), 1);
    window->document().change({}, [&](model::Query&) { definition(1).expression(u"2 * id"); });
    calm();
    write("columnField", "");
    hands::key(field(), Qt::Key_Return);
    calm();
    EXPECT_EQ(field().text(), "2 * id");
    EXPECT_EQ(made(), 2);
}

TEST_F(TheColumnPanel, TakesTheNameThatOneTableHasForItsColumn) {
    write("columnField", "Unit_price");
    hands::key(field(), Qt::Key_Escape);
    hands::key(field(), Qt::Key_Return);
    calm();
    EXPECT_FALSE(definition(1).isExpression());
    EXPECT_EQ(grid().model().text(0, 1), "order_lines.unit_price");
    EXPECT_EQ(field().text(), "order_lines.unit_price");
}

TEST_F(TheColumnPanel, OffersNamesOfColumnsAndFunctions) {
    write("columnField", "2 * quan");
    auto* const completer = field().findChild<QCompleter*>();
    EXPECT_EQ(completer->currentCompletion(), "order_lines.quantity");
    ASSERT_TRUE(completer->popup()->isVisible());
    emit completer->activated(completer->currentCompletion());
    EXPECT_EQ(field().text(), "2 * order_lines.quantity");
    EXPECT_FALSE(completer->popup()->isVisible());
    write("columnField", "rou");
    EXPECT_EQ(completer->currentCompletion(), "Round(");
    hands::key(field(), Qt::Key_Escape);
}

TEST_F(TheColumnPanel, MakesANewColumnOfAFieldInABlankOne) {
    goToColumn(3);
    write("columnField", "quantity * unit_price");
    hands::key(field(), Qt::Key_Escape);
    hands::key(field(), Qt::Key_Return);
    calm();
    ASSERT_EQ(query().ColumnDefinitions().Count(), 3);
    EXPECT_EQ(definition(3).expression().text, u"quantity * unit_price");
    EXPECT_EQ(made(), 1);
    EXPECT_EQ(grid().model().text(0, 3), "quantity * unit_price");
    EXPECT_TRUE(combo("columnTotal").isEnabled());
    pick("columnTotal", "Sum");
    EXPECT_EQ(definition(3).total(), Total::Sum);
}

TEST_F(TheColumnPanel, CountsWhatIsTypedWhenOneTurnsToSomethingElse) {
    write("columnName", "one");
    goToColumn(2);
    EXPECT_EQ(definition(1).Synonym(), u"one");
    EXPECT_EQ(definition(2).Synonym(), u"");
    write("columnName", "two");
    hands::shortcut(found<QLineEdit>("columnName"), Qt::Key_F5);
    EXPECT_EQ(definition(2).Synonym(), u"two") << "by the keys of a command";
    write("columnName", "three");
    hands::click(*found<QListView>("tables").viewport(), {5, 5});
    calm();
    EXPECT_EQ(definition(2).Synonym(), u"three");
    // What another query has is not what was typed for this one.
    write("columnName", "four");
    window->document().setQuery(platform::makeRef<model::Query>());
    calm();
    EXPECT_EQ(found<QLineEdit>("columnName").text(), "");
}

TEST_F(TheColumnPanel, IsWhereAFindingAboutAColumnLeads) {
    found<QDockWidget>("columnDock").hide();
    window->document().change({}, [&](model::Query&) { definition(2).expression(u"2 * nothing"); });
    calm();
    auto& findings = found<QListWidget>("findings");
    ASSERT_TRUE(until([&] { return findings.count() == 1; }));
    window->activateWindow();
    hands::click(*findings.viewport(), findings.visualItemRect(findings.item(0)).center());
    calm();
    EXPECT_EQ(grid().currentCol(), 2);
    EXPECT_TRUE(found<QDockWidget>("columnDock").isVisible());
    EXPECT_TRUE(until([&] { return field().hasFocus(); }));
    EXPECT_EQ(field().text(), "2 * nothing");
    EXPECT_EQ(field().marked(), 4);
}
