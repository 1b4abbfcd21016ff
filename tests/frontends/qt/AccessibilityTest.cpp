#include "frontends/qt/KeyDesk.h"

#include <QAccessible>
#include <QDeadlineTimer>
#include <QDialog>

#include <functional>

using namespace zandor;

// What a screen reader is told.

namespace {

struct Told {
    QAccessible::Event event;
    QAccessible::Role role;
    QString name;
};

QList<Told> told;

void listen(QAccessibleEvent* event) {
    if (event->type() != QAccessible::Focus) return;
    if (const auto* about = event->accessibleInterface())
        told += {event->type(), about->role(), about->text(QAccessible::Name)};
}

class Accessibility : public KeyDesk {
protected:
    Accessibility() {
        QAccessible::installUpdateHandler(listen);
        told.clear();
    }
    ~Accessibility() override { QAccessible::installUpdateHandler(nullptr); }

    static QAccessibleInterface* of(QWidget& widget) {
        return QAccessible::queryAccessibleInterface(&widget);
    }

    /// The accessible objects below one, itself included, that a test accepts.
    static QList<QAccessibleInterface*>
    all(QAccessibleInterface* from, const std::function<bool(QAccessibleInterface&)>& accepts) {
        QList<QAccessibleInterface*> found;
        if (accepts(*from)) found += from;
        for (int i = 0; i < from->childCount(); ++i) {
            QAccessibleInterface* const child = from->child(i);
            if (!child) continue;
            EXPECT_EQ(from->indexOfChild(child), i) << qPrintable(name(child));
            found += all(child, accepts);
        }
        return found;
    }
    static QAccessibleInterface* one(QAccessibleInterface* from, QAccessible::Role role,
                                     const QString& named) {
        const auto found = all(from, [&](QAccessibleInterface& object) {
            return object.role() == role && object.text(QAccessible::Name) == named;
        });
        EXPECT_EQ(found.size(), 1) << qPrintable(named);
        return found.isEmpty() ? nullptr : found.first();
    }
    static QString name(QAccessibleInterface* object) { return object->text(QAccessible::Name); }

    static QStringList namesOf(QAccessibleInterface* parent, QAccessible::Role role) {
        QStringList names;
        for (int i = 0; i < parent->childCount(); ++i)
            if (parent->child(i)->role() == role) names += name(parent->child(i));
        return names;
    }
};

} // namespace

TEST_F(Accessibility, NamesTheControlAndItsParts) {
    auto* control = of(*widget);
    EXPECT_EQ(control->role(), QAccessible::Grouping);
    EXPECT_EQ(name(control), "Query designer");
    one(control, QAccessible::Canvas, "Tables and joins");
    one(control, QAccessible::Table, "Output columns");
    one(control, QAccessible::ScrollBar, "Scroll across");
    one(control, QAccessible::ScrollBar, "Scroll down");
    EXPECT_EQ(name(of(child<QWidget>("cmdHome"))), "Back to the origin");
    EXPECT_EQ(all(control,
                  [](auto& object) {
                      return object.role() == QAccessible::Button &&
                             object.text(QAccessible::Name) == "Remove the table";
                  })
                  .size(),
              3);
}

TEST_F(Accessibility, HasTheTablesInTheOrderOfTheirSlotsAndThenTheLines) {
    table(1).raise();
    auto* canvas = of(this->canvas());
    EXPECT_EQ(canvas->childCount(), 5);
    EXPECT_EQ(namesOf(canvas, QAccessible::Window),
              QStringList({"ORDERS", "CUSTOMERS", "ORDER_LINES_OF_ALL_THE_YEARS_TOGETHER"}));
    EXPECT_EQ(namesOf(canvas, QAccessible::Graphic),
              QStringList({"Join ORDERS.CUSTOMER_ID = CUSTOMERS.CUSTOMER_ID",
                           "Join ORDERS.ORDER_ID = "
                           "ORDER_LINES_OF_ALL_THE_YEARS_TOGETHER.ORDER_ID, Left Outer"}));
}

TEST_F(Accessibility, TellsSidesOperatorAndTypeOfAJoinAsTheModelHasThem) {
    model->joinAt(1).compareOperator = 4;
    model->joinAt(1).joinType = 3;
    // The left table now stands east of the right one; left and right stay what they are.
    table(1).move(600, 40);
    auto* line = canvas().lines().front()->accessible();
    EXPECT_EQ(name(line), "Join ORDERS.CUSTOMER_ID <= CUSTOMERS.CUSTOMER_ID, Both Outer");
}

TEST_F(Accessibility, TellsTheEndsOfALineWhoseModelFails) {
    auto* line = canvas().lines().front()->accessible();
    model->fail("ZDJoin.LeftTable", platform::errors::invalidProcedureCall());
    EXPECT_EQ(name(line), "Join ORDERS.CUSTOMER_ID = CUSTOMERS.CUSTOMER_ID");
}

TEST_F(Accessibility, TellsOfEntriesWhatIsSeenOfThem) {
    table(1).list().setFocus();
    auto* list = one(of(table(1)), QAccessible::List, "ORDERS");
    ASSERT_NE(list, nullptr);
    ASSERT_EQ(list->childCount(), 10);
    EXPECT_EQ(list->child(1)->role(), QAccessible::ListItem);
    EXPECT_EQ(name(list->child(1)), "ORDER_ID");
    EXPECT_EQ(list->child(1)->text(QAccessible::Description), "key column");
    EXPECT_EQ(list->child(2)->text(QAccessible::Description), "");
    press(Qt::Key_Down);
    EXPECT_TRUE(list->child(1)->state().selected);
    EXPECT_TRUE(list->child(1)->state().focused);
    EXPECT_FALSE(list->child(2)->state().selected);
}

TEST_F(Accessibility, NamesCellsByRowFieldAndText) {
    auto* cells = one(of(*widget), QAccessible::Table, "Output columns");
    ASSERT_NE(cells, nullptr);
    const auto cell = [&](int row, int col) {
        return cells->tableInterface()->cellAt(row - 1, col - 1);
    };
    EXPECT_EQ(cell(4, 1)->role(), QAccessible::Cell);
    EXPECT_EQ(name(cell(4, 1)), "Criteria, ORDER_ID: > 1000");
    EXPECT_EQ(name(cell(2, 2)), "Sort, NAME: Ascending");
    EXPECT_EQ(name(cell(1, 2)), "Synonym, NAME");
    EXPECT_EQ(name(cell(7, 9)), "Or, column 9");
}

TEST_F(Accessibility, NamesAnEditorByItsCell) {
    Desk::press(2, 2);
    auto& combo = child<QWidget>("cobSortOrder");
    EXPECT_EQ(of(combo)->role(), QAccessible::ComboBox);
    EXPECT_EQ(of(combo)->text(QAccessible::Description), "Sort, NAME");
    Desk::press(4, 1);
    EXPECT_EQ(name(of(child<QWidget>("txtValue"))), "Criteria, ORDER_ID");
    EXPECT_EQ(name(of(child<QWidget>("cmdSetTextValue"))), "Set");
}

TEST_F(Accessibility, KnowsTheLineWithTheFocus) {
    auto* first = canvas().lines().front()->accessible();
    auto* second = canvas().lines().back()->accessible();
    EXPECT_TRUE(first->state().focusable);
    EXPECT_FALSE(first->state().focused);
    tabTo("linJoin(1)");
    EXPECT_TRUE(first->state().focused);
    EXPECT_FALSE(second->state().focused);
    EXPECT_EQ(of(canvas())->focusChild(), first);
    tab();
    EXPECT_EQ(of(canvas())->focusChild(), second);
    tab();
    EXPECT_FALSE(second->state().focused);
    EXPECT_NE(of(canvas())->focusChild(), second);
}

// Qt sends these only while a screen reader listens, or makes believe to (under X and D-Bus:
// QT_LINUX_ACCESSIBILITY_ALWAYS_ON=1).
TEST_F(Accessibility, TellsWhereTheFocusGoes) {
    if (qEnvironmentVariableIsSet("QT_LINUX_ACCESSIBILITY_ALWAYS_ON"))
        for (const QDeadlineTimer limit(5000); !QAccessible::isActive() && !limit.hasExpired();)
            qApp->processEvents(QEventLoop::WaitForMoreEvents, 50);
    if (!QAccessible::isActive()) GTEST_SKIP() << "nobody listens";
    tabTo("lstTable(3)");
    told.clear();
    tab();
    ASSERT_FALSE(told.isEmpty());
    EXPECT_EQ(told.back().role, QAccessible::Graphic);
    EXPECT_EQ(told.back().name, "Join ORDERS.CUSTOMER_ID = CUSTOMERS.CUSTOMER_ID");
    press(Qt::Key_Delete);
    EXPECT_EQ(told.back().name,
              "Join ORDERS.ORDER_ID = ORDER_LINES_OF_ALL_THE_YEARS_TOGETHER.ORDER_ID, Left Outer");
    grid().view().setCurrentIndex(grid().view().model()->index(0, 0));
    told.clear();
    tab();
    EXPECT_EQ(told.back().role, QAccessible::Table);
    press(Qt::Key_Right);
    EXPECT_EQ(told.back().role, QAccessible::Cell);
    EXPECT_EQ(told.back().name, "Synonym, NAME");
    tabTo("lstTable(2)");
    press(Qt::Key_Down);
    EXPECT_EQ(told.back().role, QAccessible::ListItem);
    EXPECT_EQ(told.back().name, "CUSTOMER_ID");
}

TEST_F(Accessibility, OpensTheDefinitionOfALineThatIsPressed) {
    int dialogs = 0;
    QTimer::singleShot(0, &host, [&dialogs] {
        if (auto* dialog = qobject_cast<QDialog*>(QApplication::activeModalWidget())) {
            ++dialogs;
            dialog->reject();
        }
    });
    auto* line = canvas().lines().back()->accessible();
    line->actionInterface()->doAction(QAccessibleActionInterface::pressAction());
    EXPECT_EQ(dialogs, 1);
    EXPECT_EQ(focus(), "linJoin(2)");
}

TEST_F(Accessibility, FindsALineOnTheScreen) {
    platform::qt::CanvasLine* const line = canvas().lines().front();
    const QPoint middle = canvas().mapToGlobal((line->at(0.5) / 15).toPoint());
    EXPECT_EQ(of(canvas())->childAt(middle.x(), middle.y()), line->accessible());
    EXPECT_TRUE(line->accessible()->rect().contains(middle));
}

TEST_F(Accessibility, ForgetsALineWithItsJoin) {
    const auto id = QAccessible::uniqueId(canvas().lines().front()->accessible());
    tabTo("linJoin(1)");
    press(Qt::Key_Delete);
    EXPECT_EQ(QAccessible::accessibleInterface(id), nullptr);
    EXPECT_EQ(of(canvas())->childCount(), 4);
}
