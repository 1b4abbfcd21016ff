#include "frontends/qt/KeyDesk.h"

#include <QComboBox>
#include <QTableView>

using namespace zandor;

using platform::qt::TabuletWidget;

namespace {

/// What the host has done to its model before it shows it anew.
enum class Host { changedNothing, changedMuch };

void PrintTo(Host host, std::ostream* out) {
    *out << (host == Host::changedNothing ? "nothing changed" : "much changed");
}

class AModelShownAnew : public KeyDesk, public testing::WithParamInterface<Host> {
protected:
    AModelShownAnew() {
        widget->setComforts(comforts::Flags::all());
        for (int n = 0; n < 8; ++n) model->definition(orders, u"FREIGHT");
        lines->place(18000, 12000, 2550, 1650); // far out, so that there is something to scroll
        widget->showAnew();
        settle();
    }

    void showAnew() {
        if (GetParam() == Host::changedMuch) change();
        widget->showAnew();
        settle();
    }

    /// A table and a join come, an output column, and at first a table and an entry, go, and what
    /// stays is called and placed otherwise.
    void change() {
        const String n = platform::decimal(++mChanges);
        if (mChanges == 1) {
            model->joins.items.Remove(u"j2");
            definitions().Remove(u"x3");
            model->tables.items.Remove(lines->key);
            orders->columns.items.Remove(u"kREMARKS");
        }
        definitions().Remove(
            definitions().Item(definitions().Item(1)->Key() == u"x2" ? 2 : 1)->Key());
        const auto added = model->table(u"ADDED" + n, {u"*", u"ID"});
        added->place(9000, 600, 1800, 1500);
        model->join(orders, u"EMPLOYEE_ID", added, u"ID", 2);
        orders->name = u"SALES" + n;
        orders->place(orders->left + 150, orders->top + 150, 2400, 2700);
    }

    platform::KeyedCollection<TalvikZandorLib::ZDColumnDefinition>& definitions() {
        return model->definitions.items;
    }

    /// The titles of the tables, the one that lies over the others last.
    QStringList stack() {
        QStringList titles;
        for (QObject* each : canvas().children())
            if (const auto* box = dynamic_cast<TabuletWidget*>(each)) titles += box->title();
        return titles;
    }

    void raise(int index) {
        hands::click(table(index), QRectF(table(index).titleBar()).center());
        settle();
    }

    void selectEntries(int index, std::initializer_list<int> rows) {
        auto& list = table(index).list();
        Qt::KeyboardModifiers held;
        for (const int row : rows) {
            const QPointF at = QRectF(list.visualRect(list.model()->index(row, 0))).center();
            QWidget& view = *list.viewport();
            hands::mouse(view, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton, held);
            hands::mouse(view, QEvent::MouseButtonRelease, at, Qt::LeftButton, {}, held);
            held = Qt::ControlModifier;
        }
        settle();
    }

    /// The cell of a definition in a row.
    QRect cell(int row, int number) { return grid().cellRect(row, columnOf(number)); }
    /// The grid column that shows the definition with a number.
    int columnOf(int number) {
        int col = 1;
        while (col < 20 && grid().model().columnData(col) != number) ++col;
        return col;
    }

private:
    int mChanges = 0;
};

} // namespace

TEST_P(AModelShownAnew, LeavesTheKeyboardWhereItIs) {
    grid().setCurrentCell(4, columnOf(2));
    for (const QString& part : {QStringLiteral("lstTable(1)"), QStringLiteral("lstTable(2)"),
                                QStringLiteral("linJoin(1)"), QStringLiteral("sprColumn")}) {
        tabTo(part);
        QWidget* const had = host.focusWidget();
        showAnew();
        EXPECT_EQ(host.focusWidget(), had);
        EXPECT_EQ(focus(), part);
    }
    after.setFocus();
    showAnew();
    EXPECT_EQ(host.focusWidget(), &after) << "the host keeps what is the host's";
}

TEST_P(AModelShownAnew, LeavesTheTablesOverEachOtherAsTheyLie) {
    for (const int onTop : {1, 2}) {
        raise(onTop == 1 ? 2 : 1);
        raise(onTop);
        const QStringList before = stack();
        ASSERT_EQ(before.last(), table(onTop).title());
        const auto* const top = &table(onTop);
        const auto* const below = &table(3 - onTop);
        showAnew();
        EXPECT_EQ(&table(onTop), top);
        EXPECT_LT(stack().indexOf(below->title()), stack().indexOf(top->title()));
        EXPECT_TRUE(top->isCurrent());
        if (GetParam() == Host::changedNothing) {
            EXPECT_EQ(stack(), before);
        }
    }
}

TEST_P(AModelShownAnew, StaysScrolledWhereItIs) {
    host.resize(700, 500);
    settle();
    widget->setHorizontalScrollbarPos(150);
    widget->setVerticalScrollbarPos(300);
    auto& list = *table(1).list().verticalScrollBar();
    table(1).resize(table(1).width(), table(1).smallest().height() + 20);
    settle();
    list.setValue(table(1).list().visualRect(table(1).list().model()->index(0, 0)).height() + 3);
    auto& across = *grid().view().horizontalScrollBar();
    auto& down = *grid().view().verticalScrollBar();
    across.setValue(2);
    down.setValue(2);
    settle();
    const int scrolled = list.value();
    ASSERT_GT(scrolled, 0);
    ASSERT_EQ(down.value(), 2);
    const QPoint box = table(2).mapTo(widget.get(), QPoint());

    showAnew();
    EXPECT_EQ(widget->HorizontalScrollbarPos(), 150);
    EXPECT_EQ(widget->VerticalScrollbarPos(), 300);
    EXPECT_EQ(table(2).mapTo(widget.get(), QPoint()), box);
    EXPECT_EQ(across.value(), 2);
    EXPECT_EQ(down.value(), 2);
    if (GetParam() == Host::changedNothing) {
        EXPECT_EQ(list.value(), scrolled);
    }
}

TEST_P(AModelShownAnew, KeepsWhatIsSelected) {
    selectEntries(1, {1, 3});
    selectEntries(2, {2});
    ASSERT_EQ(selected(1), QStringList({"EMPLOYEE_ID", "ORDER_ID"}));
    showAnew();
    EXPECT_EQ(selected(1), QStringList({"EMPLOYEE_ID", "ORDER_ID"}));
    EXPECT_EQ(selected(2), QStringList("NAME"));
    EXPECT_EQ(table(2).list().currentIndex().row(), 2);
}

TEST_P(AModelShownAnew, KeepsTheCurrentCellOnItsDefinition) {
    tabTo("sprColumn");
    grid().setCurrentCell(4, columnOf(2));
    showAnew();
    EXPECT_EQ(grid().currentRow(), 4);
    EXPECT_EQ(grid().currentCol(), columnOf(2));
    EXPECT_EQ(grid().model().columnData(grid().currentCol()), 2);
    EXPECT_EQ(grid().view().currentIndex().column(), columnOf(2) - 1);
    EXPECT_EQ(grid().view().currentIndex().row(), 3);
}

TEST_P(AModelShownAnew, LeavesAnEditorOpenWithTheTextThatIsHalfTyped) {
    Desk::press(4, columnOf(2));
    auto& text = child<QLineEdit>("txtValue");
    for (const QChar letter : QStringLiteral("> 1234"))
        hands::key(text, letter.toUpper().unicode(), letter);
    for (int n = 0; n < 3; ++n) hands::key(text, Qt::Key_Left);
    hands::key(text, Qt::Key_Left, {}, Qt::ShiftModifier);
    ASSERT_EQ(text.text(), "> 1234");
    ASSERT_EQ(text.selectedText(), "1");

    showAnew();
    EXPECT_TRUE(text.isVisible());
    EXPECT_EQ(text.text(), "> 1234");
    EXPECT_EQ(text.selectedText(), "1");
    EXPECT_EQ(text.cursorPosition(), 2);
    EXPECT_EQ(host.focusWidget(), &text);
    const auto& frame = child<QWidget>("fraValue");
    EXPECT_TRUE(frame.geometry().contains(cell(4, 2).translated(grid().pos()).center()));

    hands::key(text, Qt::Key_Return); // what was typed is for the definition of then
    settle();
    const auto written = std::dynamic_pointer_cast<fake::Definition>(definitions().Item(u"x2"));
    EXPECT_EQ(written->criterion(u"4"), u"> 1234");
}

TEST_P(AModelShownAnew, LeavesAListOpenWithTheChoiceThatIsNotMadeYet) {
    for (const auto& [row, frame, list] : {std::tuple{2, "fraSortOrder", "cobSortOrder"},
                                           std::tuple{3, "fraVisibility", "cobVisibility"}}) {
        widget->setComforts({});
        Desk::press(row, columnOf(2));
        auto& box = child<QComboBox>(list);
        ASSERT_TRUE(box.isVisible()) << list;
        const int other = box.currentIndex() == 0 ? 1 : 0;
        box.setCurrentIndex(other);
        box.setFocus(Qt::TabFocusReason);
        showAnew();
        EXPECT_TRUE(box.isVisible()) << list;
        EXPECT_EQ(box.currentIndex(), other) << list;
        EXPECT_EQ(host.focusWidget(), &box) << list;
        const auto& around = child<QWidget>(frame);
        EXPECT_TRUE(around.geometry().contains(cell(row, 2).translated(grid().pos()).center()))
            << list;
    }
}

INSTANTIATE_TEST_SUITE_P(Of, AModelShownAnew,
                         testing::Values(Host::changedNothing, Host::changedMuch));

using AModelWithoutATable = KeyDesk;

TEST_F(AModelWithoutATable, PassesTheKeyboardOfThatTableOnWithinTheControl) {
    tabTo("lstTable(2)");
    for (std::int32_t n = model->joinCount(); n >= 1; --n)
        if (model->joinAt(n).rightTable == customers)
            model->joins.items.Remove(model->joinAt(n).key);
    model->definitions.items.Remove(u"x2");
    model->tables.items.Remove(customers->key);
    widget->showAnew();
    settle();
    EXPECT_TRUE(widget->isAncestorOf(host.focusWidget())) << focus().toStdString();
    EXPECT_NE(host.focusWidget(), widget.get()) << "which does nothing with keys";
}

TEST_F(AModelWithoutATable, KeepsTheKeyboardInTheControlWhereverItWas) {
    for (const bool gridShown : {true, false})
        for (const char* const part : {"lstTable(1)", "lstTable(2)", "lstTable(3)", "linJoin(1)"}) {
            bind();
            widget->setOnlyJoin(!gridShown);
            tabTo(part);
            for (std::int32_t n = model->joinCount(); n >= 1; --n)
                model->joins.items.Remove(model->joinAt(n).key);
            for (std::int32_t n = model->definitionCount(); n >= 1; --n)
                model->definitions.items.Remove(model->definitionAt(n).key);
            for (std::int32_t n = model->tableCount(); n >= 1; --n)
                model->tables.items.Remove(model->tableAt(n).key);
            widget->showAnew();
            settle();
            QWidget* const has = host.focusWidget();
            EXPECT_TRUE(has && (has == widget.get() || widget->isAncestorOf(has)))
                << part << (gridShown ? ", with the grid" : ", without") << ": "
                << focus().toStdString();
        }
}
