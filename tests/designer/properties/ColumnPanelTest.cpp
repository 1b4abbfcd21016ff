#include "OpenProperties.h"

#include "designer/properties/FieldEdit.h"
#include "designer/properties/fields.h"

#include <QAbstractItemView>
#include <QCheckBox>
#include <QCompleter>
#include <QDockWidget>
#include <QLabel>
#include <QListWidget>
#include <QScrollArea>
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

TEST_F(TheColumnPanel, SetsHowValuesAreShownInOneStep) {
    goToColumn(2); // of whole numbers
    auto& format = combo("columnFormat");
    auto& decimals = found<QSpinBox>("columnDecimals");
    EXPECT_EQ(format.currentText(), "As it is");
    EXPECT_FALSE(decimals.isEnabled());
    EXPECT_EQ(decimals.text(), "as many as there are");
    pick("columnFormat", "Decimals");
    EXPECT_EQ(definition(2).format(), model::Format::Number);
    EXPECT_EQ(definition(2).decimals(), 2);
    EXPECT_EQ(lastStep(), "Change format of quantity");
    EXPECT_EQ(made(), 1);
    EXPECT_TRUE(decimals.isEnabled());
    decimals.setFocus();
    hands::key(decimals, Qt::Key_Down);
    hands::key(decimals, Qt::Key_Down);
    calm();
    EXPECT_EQ(definition(2).decimals(), 0);
    EXPECT_EQ(format.currentText(), "Whole number");
    EXPECT_EQ(made(), 3);
    pick("columnFormat", "Thousands");
    EXPECT_EQ(definition(2).decimals(), 0) << "as was said before";
    pick("columnFormat", "As it is");
    EXPECT_EQ(definition(2).decimals(), model::asManyAsThereAre);
    pick("columnFormat", "Thousands");
    EXPECT_EQ(definition(2).decimals(), model::asManyAsThereAre) << "whole numbers have none";
    for (int n = 0; n < 6; ++n) window->document().undo();
    calm();
    EXPECT_EQ(made(), 0);
    EXPECT_EQ(format.currentText(), "As it is");
}

TEST_F(TheColumnPanel, OffersTheFormatsThatTheValuesCanHave) {
    const auto offered = [&] {
        QStringList result;
        for (int n = 0; n < combo("columnFormat").count(); ++n)
            if (combo("columnFormat").model()->index(n, 0).flags() & Qt::ItemIsEnabled)
                result << combo("columnFormat").itemText(n);
        return result.join(u'|');
    };
    const QString numbers = "As it is|Whole number|Decimals|Thousands|Percent";
    const QString days = "As it is|Short date|Long date|Date and time|ISO date|Year and month|"
                         "Weekday|Time";
    EXPECT_EQ(offered(), days) << "a text may be a day";
    const auto& list = *combo("columnFormat").view();
    const QModelIndex third = list.model()->index(3, 0);
    EXPECT_EQ(third.data(Qt::AccessibleTextRole).toString().toStdString(), "Thousands: 1,234.50");
    EXPECT_GE(list.minimumWidth(), list.sizeHintForIndex(third).width());
    goToColumn(2);
    EXPECT_EQ(offered(), numbers);
    window->document().change({}, [&](model::Query&) { definition(2).total(Total::Largest); });
    goToColumn(1);
    window->document().change({}, [&](model::Query&) { definition(1).total(Total::Count); });
    calm();
    EXPECT_EQ(offered(), numbers) << "how many there are";
    window->document().change({}, [&](model::Query& query) {
        definition(1).total(Total::None);
        definition(1).Column(query.tableNamed(u"orders")->Columns().Item(1));
    });
    calm();
    EXPECT_FALSE(combo("columnFormat").isEnabled()) << "of several columns";
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

TEST_F(TheColumnPanel, OffersFirstWhatBeginsWithWhatIsTyped) {
    const auto offered = [&](const char* typed) {
        write("columnField", typed);
        QStringList result;
        auto& list = *field().findChild<QCompleter*>()->popup();
        for (int row = 0; list.isVisible() && row < list.model()->rowCount(); ++row)
            result << list.model()->index(row, 0).data().toString();
        EXPECT_FALSE(list.isVisible() && list.currentIndex().isValid()) << "none is taken";
        hands::key(field(), Qt::Key_Escape);
        return result.join(u' ').toStdString();
    };
    EXPECT_EQ(offered("mo"), "Month(");
    EXPECT_THAT(offered("st"), testing::StartsWith("orders.status orders.customer_id"));
    EXPECT_EQ(offered("order_id"), "order_lines.order_id");
    EXPECT_EQ(offered("xyz"), "");
    EXPECT_EQ(designer::matching({"a.bc", "b.a", "abs(", "[b c].[a b]", "cab("}, "A"),
              (QStringList{"a.bc", "b.a", "abs(", "[b c].[a b]", "cab("}));
    EXPECT_EQ(designer::matching({"a.bc", "b.a", "abs(", "[b c].[a b]", "cab("}, "b"),
              (QStringList{"a.bc", "b.a", "[b c].[a b]", "abs(", "cab("}));
    EXPECT_EQ(designer::matching({"a.bc", "[b c].[a b]"}, "[a"),
              (QStringList{"a.bc", "[b c].[a b]"}));
}

TEST_F(TheColumnPanel, LeavesWhatItSaysInSightBesideTheListOfNames) {
    const auto& label = found<QLabel>("columnFinding");
    const int height = label.height();
    EXPECT_GE(height, label.fontMetrics().lineSpacing());
    write("columnField", "quantity * unit");
    ASSERT_TRUE(until([&] { return label.height() > height; }));
    calm();
    auto& list = *field().findChild<QCompleter*>()->popup();
    const auto covered = [&] {
        const QRect said(label.mapToGlobal(QPoint()), label.size());
        return list.isVisible() && list.frameGeometry().intersects(said);
    };
    ASSERT_TRUE(list.isVisible());
    EXPECT_FALSE(covered());
    EXPECT_GE(label.height(), label.heightForWidth(label.width())) << label.width();
    // Neither when there is more to say while it is open.
    write("columnField", "quantity * this_is_a_name_that_no_table_of_the_query_has + unit");
    const int before = label.height();
    ASSERT_TRUE(until([&] { return label.height() > before; }));
    calm();
    ASSERT_TRUE(list.isVisible());
    EXPECT_FALSE(covered());
    hands::key(field(), Qt::Key_Escape);
}

TEST_F(TheColumnPanel, ShowsItsPartsAsAWholeOnASmallScreen) {
    window->document().change({}, [&](model::Query&) {
        definition(1).SortOrder(1);
        definition(1).format(model::Format::Number);
    });
    window->resize(1024, 600);
    calm();
    const auto& scrolled = *found<QDockWidget>("columnDock").findChild<QScrollArea*>();
    const auto inSight = [&](const char* name) {
        const auto& part = found<QWidget>(name);
        const QRect place(part.mapTo(scrolled.viewport(), QPoint()), part.size());
        return scrolled.viewport()->rect().contains(place);
    };
    ASSERT_FALSE(inSight("columnDecimals")) << "there is more than has room";
    const auto& field = found<QWidget>("columnField");
    EXPECT_TRUE(inSight("columnField")) << field.width() << " in " << scrolled.viewport()->width();
    for (const char* name : {"columnPriority", "columnFormat", "columnDecimals", "columnField"}) {
        auto& part = found<QWidget>(name);
        window->activateWindow();
        part.setFocus(Qt::ShortcutFocusReason);
        ASSERT_TRUE(until([&] { return part.hasFocus(); })) << name;
        calm();
        EXPECT_TRUE(inSight(name)) << name;
    }
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
