#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/KeyDesk.h"

#include <QDialog>
#include <QShortcut>

// All that the mouse does, done by keys.

namespace {

class Keyboard : public KeyDesk {
protected:
    using Names = QStringList;

    /// Closes the dialog that opens and tells how many there were.
    class Dialogs : public QObject {
    public:
        Dialogs() { qApp->installEventFilter(this); }
        bool eventFilter(QObject* watched, QEvent* event) override {
            auto* dialog =
                event->type() == QEvent::Show ? qobject_cast<QDialog*>(watched) : nullptr;
            if (!dialog) return false;
            titles += dialog->windowTitle();
            QTimer::singleShot(0, dialog, [dialog] { hands::key(*dialog, Qt::Key_Escape); });
            return false;
        }
        QStringList titles;
    };

    void currentCell(int row, int col) { grid().setCurrentCell(row, col); }
};

} // namespace

TEST_F(Keyboard, WalksEntriesAndTellsTheControlWhatIsSelected) {
    tabTo("lstTable(1)");
    repeat(Qt::Key_Down, 2);
    EXPECT_EQ(selected(1), Names("CUSTOMER_ID"));
    EXPECT_EQ(orders->column(u"CUSTOMER_ID").activatedValue, 1);
    EXPECT_EQ(orders->column(u"ORDER_ID").activatedValue, 0);
    press(Qt::Key_Down, Qt::ShiftModifier);
    EXPECT_EQ(selected(1), Names({"CUSTOMER_ID", "EMPLOYEE_ID"}));
    EXPECT_EQ(orders->column(u"EMPLOYEE_ID").activatedValue, 1);
}

TEST_F(Keyboard, SelectsSingleEntriesWithControlAndSpace) {
    tabTo("lstTable(1)");
    press(Qt::Key_Space, {}, " ");
    press(Qt::Key_Down, Qt::ControlModifier);
    EXPECT_EQ(selected(1), Names("*"));
    press(Qt::Key_Down, Qt::ControlModifier);
    press(Qt::Key_Space, Qt::ControlModifier);
    EXPECT_EQ(selected(1), Names({"*", "CUSTOMER_ID"}));
    EXPECT_EQ(orders->column(u"CUSTOMER_ID").activatedValue, 1);
    press(Qt::Key_Space, Qt::ControlModifier);
    EXPECT_EQ(selected(1), Names("*"));
    EXPECT_EQ(orders->column(u"CUSTOMER_ID").activatedValue, 0);
}

TEST_F(Keyboard, OpensTheMenuOfATableAtItsCurrentEntry) {
    tabTo("lstTable(1)");
    repeat(Qt::Key_Down, 2);
    for (const bool shiftF10 : {false, true}) {
        menus.at = {};
        if (shiftF10)
            press(Qt::Key_F10, Qt::ShiftModifier);
        else
            menuKey();
        EXPECT_EQ(menus.enabled, Names({"mnuTableDefinitionCopy", "mnuTableDefinitionDelete"}));
        auto& list = table(1).list();
        const QRect row = list.visualRect(list.model()->index(2, 0));
        EXPECT_EQ(menus.at, list.viewport()->mapToGlobal(row.center()));
    }
    EXPECT_EQ(menus.opened, 2);
}

TEST_F(Keyboard, HighlightsTheFirstEntryThatCanBeTaken) {
    tabTo("linJoin(2)");
    menuKey();
    EXPECT_EQ(menus.highlighted, "mnuJoinShowDefinition");
    tabTo("lstTable(1)");
    menuKey();
    EXPECT_EQ(menus.highlighted, "mnuTableDefinitionCopy");
    canvas().focusOn(nullptr, Qt::TabFocusReason);
    menuKey();
    EXPECT_EQ(menus.highlighted, "");
    // Whoever opens it with the mouse goes on with the mouse.
    hands::mouse(canvas(), QEvent::MouseButtonRelease, {600, 30}, Qt::RightButton);
    EXPECT_EQ(menus.highlighted, "");
    EXPECT_EQ(menus.opened, 4);
}

TEST_F(Keyboard, OpensMenusInTheFontOfTheControl) {
    QFont large = widget->font();
    large.setPointSizeF(large.pointSizeF() + 7);
    widget->setFont(large);
    tabTo("lstTable(1)");
    menuKey();
    EXPECT_EQ(menus.font.pointSizeF(), large.pointSizeF());
}

TEST_F(Keyboard, OpensTheMenuOfATableWithoutEntries) {
    auto empty = library.newModel();
    empty->table(u"EMPTY")->place(300, 300, 1800, 1500);
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(empty));
    settle();
    tabTo("lstTable(1)");
    press(Qt::Key_F10, Qt::ShiftModifier);
    EXPECT_EQ(menus.enabled, Names({"mnuTableDefinitionCopy", "mnuTableDefinitionDelete"}));
    press(Qt::Key_Delete);
    EXPECT_EQ(empty->tableCount(), 0);
}

TEST_F(Keyboard, OpensTheMenuOfALineAtItsMiddle) {
    tabTo("linJoin(2)");
    press(Qt::Key_F10, Qt::ShiftModifier);
    EXPECT_EQ(menus.enabled, Names({"mnuJoinShowDefinition", "mnuJoinDelete"}));
    const QPointF middle = canvas().currentLine()->at(0.5) / 15;
    EXPECT_EQ(menus.at, canvas().mapToGlobal(middle.toPoint()));
    menuKey();
    EXPECT_EQ(menus.opened, 2);
}

TEST_F(Keyboard, OpensTheMenuOfTheLineWithTheFocusWhereTwoCross) {
    auto crossing = library.newModel();
    const auto add = [&](const String& name, float left, float top) {
        auto added = crossing->table(name, {u"X"});
        added->place(left, top, 1500, 900);
        return added;
    };
    const auto a = add(u"A", 300, 300), b = add(u"B", 6000, 2700);
    const auto c = add(u"C", 300, 2700), d = add(u"D", 6000, 300);
    crossing->join(a, u"X", b, u"X");
    crossing->join(c, u"X", d, u"X");
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(crossing));
    settle();
    tabTo("linJoin(2)");
    press(Qt::Key_Delete);
    ASSERT_EQ(crossing->joinCount(), 1);
    EXPECT_EQ(crossing->joinAt(1).leftTable->Name(), u"A");
}

TEST_F(Keyboard, OpensTheMenuOfTheGridAtTheCurrentCell) {
    tabTo("sprColumn");
    currentCell(2, 3);
    press(Qt::Key_F10, Qt::ShiftModifier);
    EXPECT_EQ(menus.enabled, Names("mnuColumnDefinitionDelete"));
    EXPECT_EQ(menus.at, grid().mapToGlobal(QRectF(grid().cellRect(2, 3)).center().toPoint()));
    currentCell(2, 4);
    menuKey();
    EXPECT_EQ(menus.enabled, Names());
    EXPECT_EQ(menus.opened, 2);
}

TEST_F(Keyboard, OpensTheMenuOfTheCanvasWithNothingToDo) {
    canvas().focusOn(nullptr, Qt::TabFocusReason);
    press(Qt::Key_F10, Qt::ShiftModifier);
    EXPECT_EQ(menus.opened, 1);
    EXPECT_EQ(menus.enabled, Names());
}

TEST_F(Keyboard, OpensTheMenuOfTheMouseAtTheMouse) {
    tabTo("lstTable(1)");
    press(Qt::Key_Delete); // a choice by key leaves nothing behind
    QCursor::setPos(host.mapToGlobal(QPoint(600, 60)));
    hands::mouse(canvas(), QEvent::MouseButtonRelease, {600, 30}, Qt::RightButton);
    EXPECT_EQ(menus.opened, 1);
    EXPECT_EQ(menus.at, QCursor::pos());
}

TEST_F(Keyboard, DeletesTheTableWithTheFocus) {
    const auto deleted = count(&ZandorWidget::TableDeleted);
    const auto activated = count(&ZandorWidget::Activate);
    tabTo("lstTable(2)");
    press(Qt::Key_Delete);
    EXPECT_EQ(*deleted, 1);
    EXPECT_EQ(*activated, 1) << "as with the menu";
    EXPECT_EQ(widget->DeletedTable(), "CUSTOMERS");
    EXPECT_EQ(model->tableCount(), 2);
    EXPECT_EQ(menus.opened, 0);
}

TEST_F(Keyboard, DeletesNothingWhoseEntryTheHostHides) {
    widget->setLNGMnuDelTableVis(false);
    widget->setLNGMnuDelJoinVis(false);
    widget->setLNGMnuDelColVis(false);
    widget->setLNGMnuShowJoinDefVis(false);
    bind();
    Dialogs dialogs;
    tabTo("lstTable(2)");
    press(Qt::Key_Delete);
    tabTo("linJoin(1)");
    press(Qt::Key_Delete);
    press(Qt::Key_Return);
    tabTo("sprColumn");
    currentCell(1, 1);
    press(Qt::Key_Delete);
    EXPECT_EQ(model->tableCount(), 3);
    EXPECT_EQ(model->joinCount(), 2);
    EXPECT_EQ(model->definitionCount(), 3);
    EXPECT_EQ(dialogs.titles, Names());
}

TEST_F(Keyboard, DeletesOneLineAfterTheOther) {
    const auto removed = count(&ZandorWidget::JoinRemoved);
    tabTo("linJoin(1)");
    press(Qt::Key_Delete);
    EXPECT_EQ(*removed, 1);
    ASSERT_EQ(model->joinCount(), 1);
    EXPECT_EQ(model->joinAt(1).leftColumn->Name(), u"ORDER_ID");
    EXPECT_EQ(focus(), "linJoin(2)");
    press(Qt::Key_Delete);
    EXPECT_EQ(model->joinCount(), 0);
}

TEST_F(Keyboard, DeletesTheLineThatTheMouseHasChosen) {
    const QPointF middle = canvas().lines().back()->at(0.5) / 15;
    hands::click(canvas(), middle);
    EXPECT_EQ(focus(), "linJoin(2)");
    press(Qt::Key_Delete);
    ASSERT_EQ(model->joinCount(), 1);
    EXPECT_EQ(model->joinAt(1).leftColumn->Name(), u"CUSTOMER_ID");
}

TEST_F(Keyboard, DeletesTheOutputColumnOfTheCurrentCell) {
    const auto removed = count(&ZandorWidget::ColumnRemoved);
    tabTo("sprColumn");
    currentCell(4, 2);
    press(Qt::Key_Delete);
    EXPECT_EQ(*removed, 1);
    ASSERT_EQ(model->definitionCount(), 2);
    EXPECT_EQ(model->definitionAt(2).column->Name(),
              u"AMOUNT_OF_MONEY_INCLUDING_EVERY_TAX_THERE_IS");
    currentCell(1, 9);
    press(Qt::Key_Delete);
    EXPECT_EQ(model->definitionCount(), 2);
}

TEST_F(Keyboard, DeletesAColumnThatIsScrolledOutOfView) {
    tabTo("sprColumn");
    currentCell(1, 1);
    grid().view().horizontalScrollBar()->setValue(20);
    settle();
    press(Qt::Key_Delete);
    ASSERT_EQ(model->definitionCount(), 2);
    EXPECT_EQ(model->definitionAt(1).column->Name(), u"NAME");
}

TEST_F(Keyboard, OpensTheDefinitionOfALineWithEnter) {
    Dialogs dialogs;
    tabTo("linJoin(1)");
    press(Qt::Key_Return);
    EXPECT_EQ(dialogs.titles, Names(widget->LNGJoinForm()));
    EXPECT_EQ(menus.opened, 0);
    EXPECT_EQ(focus(), "linJoin(1)");
}

TEST_F(Keyboard, JoinsTwoTables) {
    tabTo("lstTable(1)");
    repeat(Qt::Key_Down, 6);
    menus.choice = "mnuTableDefinitionCopy";
    press(Qt::Key_F10, Qt::ShiftModifier);
    tab();
    repeat(Qt::Key_Down, 2);
    menus.choice = "mnuTableDefinitionPaste";
    press(Qt::Key_F10, Qt::ShiftModifier);
    ASSERT_EQ(model->joinCount(), 3);
    EXPECT_EQ(model->joinAt(3).leftColumn->Name(), u"FREIGHT");
    EXPECT_EQ(model->joinAt(3).rightTable->Name(), u"CUSTOMERS");
    EXPECT_EQ(model->joinAt(3).rightColumn->Name(), u"NAME");
    tabTo("linJoin(3)");
}

TEST_F(Keyboard, PutsAColumnIntoTheGridAndEditsIt) {
    tabTo("lstTable(1)");
    repeat(Qt::Key_Down, 6);
    menus.choice = "mnuTableDefinitionCopy";
    press(Qt::Key_F10, Qt::ShiftModifier);
    tabTo("sprColumn");
    currentCell(1, 1);
    repeat(Qt::Key_Right, 3);
    menus.choice = "mnuColumnDefinitionPaste";
    press(Qt::Key_F10, Qt::ShiftModifier);
    ASSERT_EQ(model->definitionCount(), 4);
    EXPECT_EQ(model->definitionAt(4).column->Name(), u"FREIGHT");
    currentCell(1, 4);
    press(Qt::Key_Down);
    press(Qt::Key_Return);
    EXPECT_EQ(focus(), "cobSortOrder");
    press(Qt::Key_Down);
    press(Qt::Key_Return);
    EXPECT_EQ(model->definitionAt(4).sortOrder, 1);
    EXPECT_EQ(focus(), "sprColumn");
    EXPECT_EQ(grid().currentRow(), 2);
}

TEST_F(Keyboard, MovesTheTableByItsTitle) {
    const auto moved = count(&ZandorWidget::TableMoved);
    tabTo("lstTable(2)");
    const auto row = table(2).list().currentIndex();
    press(Qt::Key_Right, Qt::AltModifier);
    EXPECT_EQ(customers->left, 5250);
    EXPECT_EQ(customers->top, 450);
    press(Qt::Key_Down, Qt::AltModifier | Qt::KeypadModifier);
    EXPECT_EQ(customers->top, 600);
    press(Qt::Key_Up, Qt::AltModifier);
    press(Qt::Key_Left, Qt::AltModifier);
    EXPECT_EQ(customers->left, 5100);
    EXPECT_EQ(customers->top, 450);
    EXPECT_EQ(*moved, 4);
    EXPECT_EQ(table(2).list().currentIndex(), row);
    EXPECT_EQ(customers->width, 2400);
}

TEST_F(Keyboard, ResizesTheTableByItsCorner) {
    const auto moved = count(&ZandorWidget::TableMoved);
    tabTo("lstTable(2)");
    press(Qt::Key_Right, Qt::ShiftModifier | Qt::ControlModifier);
    EXPECT_EQ(customers->width, 2550);
    press(Qt::Key_Down, Qt::ShiftModifier | Qt::AltModifier);
    EXPECT_EQ(customers->height, 1950);
    press(Qt::Key_Left, Qt::ShiftModifier | Qt::AltModifier);
    EXPECT_EQ(customers->width, 2400);
    EXPECT_EQ(customers->left, 5100);
    EXPECT_EQ(*moved, 0);
    for (int i = 0; i < 30; ++i) press(Qt::Key_Up, Qt::ShiftModifier | Qt::ControlModifier);
    EXPECT_EQ(table(2).height(), table(2).smallest().height());
}

TEST_F(Keyboard, ScrollsTheCanvas) {
    tabTo("linJoin(1)");
    auto& down = child<QScrollBar>("vsbTable");
    auto& across = child<QScrollBar>("hsbTable");
    press(Qt::Key_Down);
    EXPECT_EQ(down.value(), 16 * 15);
    press(Qt::Key_Right);
    EXPECT_EQ(across.value(), 16 * 15);
    press(Qt::Key_PageDown);
    EXPECT_GT(down.value(), 16 * 15 + 100 * 15);
    press(Qt::Key_Home, Qt::ControlModifier);
    EXPECT_EQ(down.value(), 0);
    EXPECT_EQ(across.value(), 0);
    EXPECT_EQ(focus(), "linJoin(1)");
}

TEST_F(Keyboard, ComesBeforeTheShortcutsOfTheHostWhereItActs) {
    int stolen = 0;
    for (const QKeySequence& keys :
         {QKeySequence(Qt::Key_Delete), QKeySequence(Qt::ALT | Qt::Key_Right)}) {
        auto* shortcut = new QShortcut(keys, &host);
        QObject::connect(shortcut, &QShortcut::activated, [&stolen] { ++stolen; });
    }
    tabTo("linJoin(1)");
    press(Qt::Key_Delete);
    EXPECT_EQ(model->joinCount(), 1);
    tabTo("lstTable(2)");
    press(Qt::Key_Right, Qt::AltModifier);
    EXPECT_EQ(customers->left, 5250);
    EXPECT_EQ(stolen, 0);
}

TEST_F(Keyboard, LeavesDeleteToTheHostWhereThereIsNothingToDelete) {
    struct : QObject {
        bool eventFilter(QObject*, QEvent* event) override {
            keys += event->type() == QEvent::KeyPress;
            return false;
        }
        int keys = 0;
    } filter;
    host.installEventFilter(&filter);
    canvas().focusOn(nullptr, Qt::TabFocusReason);
    press(Qt::Key_Delete);
    EXPECT_EQ(filter.keys, 1);
    EXPECT_EQ(menus.opened, 0);
}

TEST_F(Keyboard, DeletesNoColumnWhileControlIsHeld) {
    tabTo("sprColumn");
    currentCell(4, 2);
    press(Qt::Key_Delete, Qt::ControlModifier);
    EXPECT_EQ(model->definitionCount(), 3);
}

TEST_F(Keyboard, KeepsATableInViewThatItMoves) {
    tabTo("lstTable(2)");
    for (int i = 0; i < 50; ++i) press(Qt::Key_Right, Qt::AltModifier);
    EXPECT_GT(table(2).x(), 800);
    EXPECT_TRUE(widget->toolkit().view().seen().contains(table(2).geometry()));
}

TEST_F(Keyboard, SelectsAnEntryThatGoesMeanwhile) {
    tabTo("lstTable(1)");
    repeat(Qt::Key_Down, 9);
    bool gone = false;
    model->calls->onPass = [&](const std::string& call) {
        if (call != "ZDColumn.activated=" || std::exchange(gone, true)) return;
        orders->columns.items.Remove(u"kPRIORITY");
        widget->showAnew();
    };
    press(Qt::Key_Space, Qt::ControlModifier);
    model->calls->onPass = {};
    EXPECT_TRUE(gone);
    EXPECT_EQ(table(1).model().rowCount(), 9);
}
