#include "frontends/qt/GridCells.h"
#include "frontends/qt/KeyDesk.h"
#include "frontends/qt/PickListWidget.h"

#include <QAccessible>
#include <QComboBox>
#include <QHeaderView>
#include <QInputMethodEvent>
#include <QListView>
#include <QPushButton>
#include <QShortcut>
#include <QToolTip>

using namespace zandor;

// What only a real window shows of the comforts.

namespace {

/// Counts how often a widget paints itself.
class Paints : public QObject {
public:
    explicit Paints(QWidget& widget) { widget.installEventFilter(this); }
    bool eventFilter(QObject*, QEvent* event) override {
        seen += event->type() == QEvent::Paint;
        return false;
    }
    int seen = 0;
};

class Comforts : public KeyDesk {
protected:
    Comforts() {
        widget->setComforts(comforts::Flags::all());
        settle();
    }

    static constexpr int sortRow = 2, criteriaRow = 4;

    /// The list that has dropped down; nullptr without one.
    QAbstractItemView* list() {
        for (const char* name : {"cobSortOrder", "cobVisibility"})
            if (auto* const view = child<QComboBox>(name).view(); view->isVisible()) return view;
        return nullptr;
    }

    /// The list of an editor drops down once the mouse is up.
    void click(int row, int col) {
        Desk::press(row, col);
        EXPECT_FALSE(list());
        const QPoint at = grid().cellRect(row, col).center();
        QWidget& cells = *grid().view().viewport();
        hands::mouse(cells, QEvent::MouseButtonRelease, cells.mapFrom(&grid(), at), Qt::LeftButton);
        settle();
    }

    void standOn(int row, int col) {
        widget->takeOver();
        grid().setCurrentCell(row, col);
        grid().view().setFocus();
        settle();
        ASSERT_TRUE(grid().view().hasFocus());
    }

    /// What an input method sends to who has the focus.
    void compose(const char* preedit, const char* commit = nullptr) {
        QInputMethodEvent event(QString::fromUtf8(preedit), {});
        event.setCommitString(QString::fromUtf8(commit));
        QCoreApplication::sendEvent(widget->window()->focusWidget(), &event);
        calm();
    }

    /// Types into the criterion of the first column, which reads "> 1000".
    void startTyping() {
        Desk::press(criteriaRow, 1);
        hands::key(child<QWidget>("txtValue"), 0, "7");
        ASSERT_TRUE(child<QWidget>("fraValue").isVisible());
    }

    String criterion() { return model->definitionAt(1).criterion(u"4"); }

    platform::qt::PickListWidget& fields() {
        return child<platform::qt::PickListWidget>("lstFields");
    }
    void clickField(int col) {
        const QPoint at = grid().cellRect(0, col).center();
        QWidget* part = grid().childAt(at);
        hands::click(*part, part->mapFrom(&grid(), at));
        settle();
    }
};

} // namespace

TEST_F(Comforts, KeepWhatIsTypedBeforeAShortcutOfTheHostRuns) {
    String seen;
    QShortcut run(Qt::Key_F5, &host);
    QObject::connect(&run, &QShortcut::activated, &host, [&] { seen = criterion(); });
    startTyping();
    QShortcutEvent key(QKeySequence(Qt::Key_F5), 0);
    QCoreApplication::sendEvent(&run, &key);
    EXPECT_EQ(seen, u"7");
}

TEST_F(Comforts, KeepWhatIsTypedBeforeAButtonThatTakesNoFocus) {
    String seen;
    QPushButton run(&host);
    run.setFocusPolicy(Qt::NoFocus);
    run.setGeometry(0, 0, 40, 20);
    run.show();
    QObject::connect(&run, &QPushButton::clicked, &host, [&] { seen = criterion(); });
    startTyping();
    hands::click(run, QPointF(5, 5));
    EXPECT_EQ(seen, u"7");
}

TEST_F(Comforts, KeepWhatIsTypedWhenTheWindowCloses) {
    startTyping();
    host.close();
    EXPECT_EQ(criterion(), u"7");
}

TEST_F(Comforts, KeepTypingWhileAnotherWindowIsInFront) {
    startTyping();
    QWidget other;
    other.show();
    other.activateWindow();
    settle();
    EXPECT_EQ(criterion(), u"> 1000");
    EXPECT_TRUE(child<QWidget>("fraValue").isVisible());
}

TEST_F(Comforts, LetTheListenerOfAChangeDestroyTheWidget) {
    QObject::connect(widget.get(), &ZandorWidget::ColumnModified, &host,
                     [this] { widget.release()->deleteLater(); });
    startTyping();
    after.setFocus(Qt::MouseFocusReason);
    settle();
    EXPECT_EQ(widget, nullptr);
}

TEST_F(Comforts, AddTheCurrentEntryByEnter) {
    tabTo("lstTable(1)");
    repeat(Qt::Key_Down, 2);
    press(Qt::Key_Return);
    EXPECT_EQ(model->definitionCount(), 4);
    EXPECT_EQ(model->definitionAt(4).column.get(), orders->columnRef(u"CUSTOMER_ID").get());
}

TEST_F(Comforts, TellAReaderWhichEntriesComeOut) {
    auto* list = QAccessible::queryAccessibleInterface(&table(1).list());
    EXPECT_EQ(list->child(1)->text(QAccessible::Description), "key column, comes out");
    EXPECT_EQ(list->child(2)->text(QAccessible::Description), "");
    list = QAccessible::queryAccessibleInterface(&table(2).list());
    EXPECT_EQ(list->child(2)->text(QAccessible::Description), "comes out");
}

TEST_F(Comforts, LeadToTheFieldsByTheUpKeyAndFromThereToTheList) {
    tabTo("sprColumn");
    grid().setCurrentCell(1, 3);
    press(Qt::Key_Up);
    EXPECT_EQ(grid().currentRow(), 0);
    press(Qt::Key_Right);
    EXPECT_EQ(grid().currentCol(), 4);
    press(Qt::Key_End);
    EXPECT_EQ(grid().currentCol(), grid().model().cols() - 1);
    press(Qt::Key_Home);
    EXPECT_EQ(grid().currentCol(), 1);
    repeat(Qt::Key_Right, 3);
    press(Qt::Key_F2);
    ASSERT_TRUE(fields().isVisible());
    EXPECT_TRUE(fields().box().hasFocus());
    press(0, {}, "t");
    press(0, {}, "o");
    press(0, {}, "w");
    ASSERT_EQ(fields().list().model()->rowCount(), 1);
    press(Qt::Key_Return);
    EXPECT_EQ(model->definitionCount(), 4);
    EXPECT_EQ(grid().model().text(0, 4), "CUSTOMERS.TOWN");
    EXPECT_EQ(focus(), "sprColumn");
    EXPECT_EQ(grid().currentRow(), 0);
    press(Qt::Key_Down);
    EXPECT_EQ(grid().currentRow(), 1);
    EXPECT_EQ(grid().currentCol(), 4);
}

TEST_F(Comforts, OfferFieldsToAHandThatTrembles) {
    const QPoint place = grid().cellRect(0, 4).center();
    QWidget& part = *grid().childAt(place);
    const QPointF at = part.mapFrom(&grid(), place);
    hands::mouse(part, QEvent::MouseButtonPress, at, Qt::LeftButton, Qt::LeftButton);
    hands::mouse(part, QEvent::MouseMove, at + QPointF(2, 1), Qt::NoButton, Qt::LeftButton);
    hands::mouse(part, QEvent::MouseButtonRelease, at + QPointF(2, 1), Qt::LeftButton);
    settle();
    EXPECT_TRUE(fields().isVisible());
}

TEST_F(Comforts, OfferNoFieldsToAClickThatEndsOverAnotherField) {
    const QPoint place = grid().cellRect(0, 4).center();
    QWidget& part = *grid().childAt(place);
    hands::mouse(part, QEvent::MouseButtonPress, part.mapFrom(&grid(), place), Qt::LeftButton,
                 Qt::LeftButton);
    hands::mouse(part, QEvent::MouseButtonRelease,
                 part.mapFrom(&grid(), grid().cellRect(0, 3).center()), Qt::LeftButton);
    settle();
    const auto* const list = widget->findChild<QWidget*>("lstFields");
    EXPECT_FALSE(list && list->isVisible());
}

TEST_F(Comforts, FilterTheFieldsByEachWordTyped) {
    clickField(4);
    fields().box().setFocus();
    for (const char* letter : {"i", "d", " ", "c", "u", "s", "t"}) press(0, {}, letter);
    QStringList left;
    const auto& model = *fields().list().model();
    for (int row = 0; row < model.rowCount(); ++row) left += model.index(row, 0).data().toString();
    EXPECT_EQ(left, QStringList({"ORDERS.CUSTOMER_ID", "CUSTOMERS.CUSTOMER_ID"}));
    press(Qt::Key_Down);
    press(Qt::Key_Return);
    EXPECT_EQ(grid().model().text(0, 4), "CUSTOMERS.CUSTOMER_ID");
}

TEST_F(Comforts, CloseTheListOfFieldsByEscape) {
    clickField(4);
    ASSERT_TRUE(fields().isVisible());
    press(Qt::Key_Escape);
    EXPECT_FALSE(fields().isVisible());
    EXPECT_EQ(focus(), "sprColumn");
    EXPECT_EQ(model->definitionCount(), 3);
}

TEST_F(Comforts, TakeAFieldByAClickOnIt) {
    clickField(4);
    QListView& list = fields().list();
    hands::click(*list.viewport(), QRectF(list.visualRect(list.model()->index(1, 0))).center());
    settle();
    EXPECT_EQ(grid().model().text(0, 4), "ORDERS.ORDER_ID");
    EXPECT_FALSE(fields().isVisible());
}

TEST_F(Comforts, KeepTheListOfFieldsInsideTheWidgetAtEverySize) {
    for (const QSize size : {QSize(420, 300), QSize(900, 700), QSize(1600, 1000)}) {
        host.resize(size);
        settle();
        clickField(2);
        ASSERT_TRUE(fields().isVisible());
        EXPECT_TRUE(widget->rect().contains(fields().geometry())) << size.width();
        EXPECT_GE(fields().list().height(), fields().list().sizeHintForRow(0) * 3);
        press(Qt::Key_Escape);
    }
}

TEST_F(Comforts, LeaveTheBordersOfFieldsToTheirWidths) {
    auto& titles = dynamic_cast<platform::qt::FieldTitles&>(*grid().view().horizontalHeader());
    const int edge = titles.sectionViewportPosition(1);
    EXPECT_TRUE(titles.isOnBorder(edge));
    EXPECT_TRUE(titles.isOnBorder(edge - 2));
    EXPECT_FALSE(titles.isOnBorder(edge + titles.sectionSize(1) / 2));
    EXPECT_FALSE(titles.isOnBorder(1)) << "the first one has no border at the left";
}

TEST_F(Comforts, ShowAFindingAsPlainTextAndToAReader) {
    widget->setFindings({{u"x1", criteriaRow, u"<b>no</b> number"}});
    settle();
    const QPoint at = grid().cellRect(criteriaRow, 1).center();
    QWidget* const part = grid().view().viewport();
    QHelpEvent help(QEvent::ToolTip, part->mapFrom(&grid(), at), grid().mapToGlobal(at));
    QCoreApplication::sendEvent(part, &help);
    EXPECT_FALSE(Qt::mightBeRichText(QToolTip::text()) &&
                 QToolTip::text().contains(QLatin1String("<b>no")));
    EXPECT_TRUE(QToolTip::text().contains(QLatin1String("number")));
    QToolTip::hideText();
    auto* cells = QAccessible::queryAccessibleInterface(&grid().view())->tableInterface();
    EXPECT_EQ(cells->cellAt(criteriaRow - 1, 0)->text(QAccessible::Description),
              "<b>no</b> number");
}

TEST_F(Comforts, GoToTheCellOfAFinding) {
    before.setFocus();
    EXPECT_TRUE(widget->showCell("x2", criteriaRow));
    settle();
    EXPECT_EQ(focus(), "sprColumn");
    EXPECT_EQ(grid().currentRow(), criteriaRow);
    EXPECT_EQ(grid().currentCol(), 2);
    EXPECT_FALSE(widget->showCell("x77", criteriaRow));
}

TEST_F(Comforts, TakeAnItemOfADroppedListByArrowsAndEnter) {
    click(sortRow, 1);
    ASSERT_TRUE(list());
    hands::key(*list(), Qt::Key_Down);
    hands::key(*list(), Qt::Key_Return);
    calm();
    EXPECT_EQ(model->definitionAt(1).sortOrder, 1);
    EXPECT_FALSE(child<QWidget>("fraSortOrder").isVisible());
    EXPECT_EQ(focus(), "sprColumn");
}

TEST_F(Comforts, CloseADroppedListAndItsEditorByOneEscape) {
    click(sortRow, 1);
    ASSERT_TRUE(list());
    hands::key(*list(), Qt::Key_Down);
    hands::key(*list(), Qt::Key_Escape);
    calm();
    EXPECT_EQ(model->definitionAt(1).sortOrder, 0);
    EXPECT_FALSE(list());
    EXPECT_FALSE(child<QWidget>("fraSortOrder").isVisible());
}

TEST_F(Comforts, TakeAnItemOfADroppedListByTabAndGoOn) {
    click(sortRow, 2); // ascending
    ASSERT_TRUE(list());
    EXPECT_EQ(list()->currentIndex().row(), 1);
    hands::key(*list(), Qt::Key_Down);
    hands::key(*list(), Qt::Key_Tab);
    calm();
    EXPECT_EQ(model->definitionAt(2).sortOrder, 2);
    EXPECT_EQ(grid().currentCol(), 3);
    EXPECT_TRUE(child<QWidget>("fraSortOrder").isVisible());
}

TEST_F(Comforts, TakeNothingOfADroppedListByTheSecondOfTwoQuickClicks) {
    const int interval = QApplication::doubleClickInterval();
    QApplication::setDoubleClickInterval(60'000);
    click(sortRow, 2); // ascending
    ASSERT_TRUE(list());
    const QPoint at = grid().mapToGlobal(grid().cellRect(sortRow, 2).center());
    const auto clickList = [&](QPoint screen) {
        QWidget& items = *list()->viewport();
        hands::click(items, items.mapFromGlobal(screen));
        settle();
    };
    clickList(at);
    EXPECT_TRUE(list());
    EXPECT_TRUE(child<QWidget>("fraSortOrder").isVisible());
    // One that comes as soon, but is meant.
    const QRect item = list()->visualRect(list()->model()->index(2, 0));
    clickList(list()->viewport()->mapToGlobal(item.center()));
    EXPECT_EQ(model->definitionAt(2).sortOrder, 2);
    EXPECT_FALSE(child<QWidget>("fraSortOrder").isVisible());
    QApplication::setDoubleClickInterval(interval);
}

TEST_F(Comforts, OfferNoFieldWhereNoTableIs) {
    EXPECT_EQ(grid().offeredColumn(), 4);
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(library.newModel()));
    settle();
    EXPECT_EQ(grid().offeredColumn(), 0);
}

TEST_F(Comforts, OfferFieldsAsSoonAsATableIs) {
    const auto fresh = library.newModel();
    widget->setModel(std::shared_ptr<TalvikZandorLib::Zandor>(fresh));
    widget->showAnew();
    settle();
    Paints paints(*grid().view().horizontalHeader()->viewport());
    fresh->table(u"TOWNS", {u"*", u"NAME"})->place(300, 300, 2000, 2000);
    widget->showAnew();
    settle();
    EXPECT_EQ(grid().offeredColumn(), 1);
    EXPECT_GT(paints.seen, 0);
}

TEST_F(Comforts, LetAnInputMethodTypeInACell) {
    standOn(criteriaRow, 1);
    compose("か");
    const auto& box = child<QLineEdit>("txtValue");
    EXPECT_TRUE(box.isVisible());
    EXPECT_TRUE(grid().view().hasFocus()) << "a composition breaks off when the focus moves";
    compose("かん");
    compose(nullptr, "漢");
    EXPECT_TRUE(box.hasFocus());
    EXPECT_EQ(box.text(), "漢");
    hands::key(child<QWidget>("txtValue"), 0, "7");
    hands::key(child<QWidget>("txtValue"), Qt::Key_Return);
    calm();
    EXPECT_EQ(criterion(), u"漢7");
}

TEST_F(Comforts, TypeWhatAnInputMethodGivesAtOnce) {
    standOn(criteriaRow, 1);
    compose(nullptr, "漢字");
    EXPECT_EQ(child<QLineEdit>("txtValue").text(), "漢字");
    EXPECT_TRUE(child<QLineEdit>("txtValue").hasFocus());

    standOn(sortRow, 1);
    compose("D");
    EXPECT_FALSE(child<QWidget>("fraSortOrder").isVisible());
    compose(nullptr, "D");
    EXPECT_EQ(child<QComboBox>("cobSortOrder").currentText(), "Descending");
}

TEST_F(Comforts, LeaveACellAsItWasWhenAnInputMethodGivesUp) {
    standOn(criteriaRow, 1);
    compose("か");
    compose(nullptr);
    EXPECT_EQ(child<QLineEdit>("txtValue").text(), "> 1000");
    EXPECT_TRUE(child<QLineEdit>("txtValue").hasFocus());
    hands::key(child<QWidget>("txtValue"), Qt::Key_Return);
    calm();
    EXPECT_EQ(criterion(), u"> 1000");
}

TEST_F(Comforts, TypeInAnotherCellAfterAnInputMethodWasLeft) {
    standOn(criteriaRow, 1);
    compose("か");
    after.setFocus(Qt::MouseFocusReason);
    calm();
    standOn(criteriaRow, 2);
    press(Qt::Key_Up);
    EXPECT_EQ(grid().currentRow(), criteriaRow - 1) << "the key is the grid's";
    press(Qt::Key_Down);
    press(0, {}, "9");
    press(Qt::Key_Return);
    EXPECT_EQ(model->definitionAt(2).criterion(u"4"), u"9");
}

TEST_F(Comforts, LeaveACellAsItWasWhenAnInputMethodWasLeft) {
    standOn(criteriaRow, 1);
    compose("か");
    after.setFocus(Qt::MouseFocusReason);
    calm();
    EXPECT_EQ(child<QLineEdit>("txtValue").text(), "> 1000");
    widget->takeOver();
    EXPECT_EQ(criterion(), u"> 1000");
}

TEST_F(Comforts, WriteNothingIntoTheCellThatAnInputMethodIsLeftFor) {
    standOn(criteriaRow, 1);
    compose("か");
    Desk::press(criteriaRow, 2);
    EXPECT_EQ(child<QLineEdit>("txtValue").text(), "");
    widget->takeOver();
    EXPECT_EQ(model->definitionAt(2).criteria.Count(), 0);
}

TEST_F(Comforts, LeaveACellAsItWasWhenAnInputMethodIsLeftForAnotherCell) {
    standOn(criteriaRow, 1);
    compose("か");
    Desk::press(criteriaRow, 2);
    EXPECT_EQ(criterion(), u"> 1000");
    EXPECT_TRUE(grid().view().hasFocus() || child<QLineEdit>("txtValue").hasFocus());
}

TEST_F(Comforts, LeaveACellAsItWasWhenItsTypingIsTakenOverFromAnInputMethod) {
    standOn(criteriaRow, 1);
    compose("か");
    widget->takeOver();
    EXPECT_EQ(criterion(), u"> 1000");
}

TEST_F(Comforts, KnowNoEditorAnyMoreThatHasClosedOverAnInputMethod) {
    standOn(criteriaRow, 1);
    compose("か");
    compose("かん");
    widget->takeOver();
    Desk::press(criteriaRow, 2);
    after.setFocus(Qt::MouseFocusReason);
    calm();
    EXPECT_EQ(child<QLineEdit>("txtValue").text(), "");
    widget->takeOver();
    EXPECT_EQ(model->definitionAt(2).criteria.Count(), 0);
}

TEST_F(Comforts, LetAnInputMethodLookForAField) {
    standOn(0, 4);
    compose("to");
    compose(nullptr, "town");
    ASSERT_TRUE(fields().isVisible());
    EXPECT_TRUE(fields().box().hasFocus());
    EXPECT_EQ(fields().list().model()->rowCount(), 1);
}

TEST_F(Comforts, TellAnInputMethodWhereItsTextStands) {
    standOn(criteriaRow, 1);
    const auto ask = [&](Qt::InputMethodQuery what) {
        QInputMethodQueryEvent query(what);
        QCoreApplication::sendEvent(&grid().view(), &query);
        return query.value(what);
    };
    EXPECT_TRUE(ask(Qt::ImEnabled).toBool());
    const QRect cell(grid().view().mapFrom(&grid(), grid().cellRect(criteriaRow, 1).topLeft()),
                     grid().cellRect(criteriaRow, 1).size());
    EXPECT_EQ(ask(Qt::ImCursorRectangle).toRect(), cell);
    compose("か");
    auto& box = child<QLineEdit>("txtValue");
    const QRect place = ask(Qt::ImCursorRectangle).toRect();
    EXPECT_TRUE(QRect(grid().view().mapFromGlobal(box.mapToGlobal(QPoint())), box.size())
                    .contains(place.center()));
    compose(nullptr);
    standOn(criteriaRow, 1);
    widget->setComforts({});
    EXPECT_FALSE(ask(Qt::ImEnabled).toBool());
}

TEST_F(Comforts, AreOffUntilTheyAreAskedFor) {
    open();
    EXPECT_EQ(widget->comforts(), comforts::Flags());
}
