#include "frontends/qt/Desk.h"

#include "frontends/qt/QtToolkit.h"
#include "frontends/qt/ZandorWindowMessage.h"

#include <QApplication>
#include <QHeaderView>
#include <QLineEdit>
#include <QMenu>
#include <QShortcut>
#include <QWheelEvent>

// What the user does with mouse and keyboard, where Qt has rules of its own.

namespace {

class Messages : public QObject {
public:
    bool eventFilter(QObject* watched, QEvent* event) override {
        if (event->type() == ZandorWindowMessage::typeOf("TALVIKDISABLEVELT")) {
            const auto& message = *static_cast<ZandorWindowMessage*>(event);
            names += message.name();
            parameters += static_cast<int>(message.wParam());
            scratch = scratch && message.lParam() != nullptr;
            receivers += watched;
        }
        return false;
    }

    QStringList names;
    QList<int> parameters;
    QObjectList receivers;
    bool scratch = true;
};

class Hands : public Desk {
protected:
    void wheel(QWidget& over, QPointF at, QPoint turn, Qt::KeyboardModifiers held = {}) {
        QWheelEvent event(at, over.mapToGlobal(at), QPoint(), turn, Qt::NoButton, held,
                          Qt::NoScrollPhase, false);
        QSpontaneKeyEvent::setSpontaneous(&event);
        qApp->notify(&over, &event);
    }

    QPointF entry(int index, int row) {
        auto& list = table(index).list();
        return QRectF(list.visualRect(list.model()->index(row, 0))).center();
    }

    /// Drags with a press on a row of a table; the carrier decides what becomes of it.
    void drag(int index, int row) {
        QWidget& viewport = *table(index).list().viewport();
        hands::mouse(viewport, QEvent::MouseButtonPress, entry(index, row), Qt::LeftButton,
                     Qt::LeftButton);
        hands::mouse(viewport, QEvent::MouseMove, entry(index, row) + QPointF(1, 1), Qt::NoButton,
                     Qt::LeftButton);
    }

    QStringList selected(int index) {
        QStringList texts;
        for (const auto& at : table(index).list().selectionModel()->selectedRows())
            texts += at.data().toString();
        texts.sort();
        return texts;
    }
};

} // namespace

TEST_F(Hands, ThatTurnTheWheelScrollTheCanvasBelowThem) {
    show();
    bind();
    auto& bar = child<QScrollBar>("vsbTable");
    wheel(child<QWidget>("fraTable"), {600, 200}, {0, -120});
    EXPECT_GT(bar.value(), 0);
    EXPECT_EQ(child<QWidget>("fraTable").y(), -bar.value() / 15);
    wheel(child<QWidget>("fraTable"), {600, 200}, {-120, 0});
    EXPECT_GT(child<QScrollBar>("hsbTable").value(), 0);
}

TEST_F(Hands, ThatTurnTheWheelAndHoldShiftScrollAcross) {
    show();
    bind();
    wheel(child<QWidget>("fraTable"), {600, 200}, {0, -120}, Qt::ShiftModifier);
    EXPECT_GT(child<QScrollBar>("hsbTable").value(), 0);
    EXPECT_EQ(child<QScrollBar>("vsbTable").value(), 0);
}

TEST_F(Hands, ThatTurnTheWheelScrollNothingWhereTheBarsAreOff) {
    show();
    bind();
    auto& bar = child<QScrollBar>("vsbTable");
    bar.setEnabled(false);
    wheel(child<QWidget>("fraTable"), {600, 200}, {0, -120});
    EXPECT_EQ(bar.value(), 0);
}

TEST_F(Hands, ThatTurnTheWheelOverATitleScrollNothing) {
    show();
    bind();
    table(1).list(); // with it the title is the box's own
    wheel(table(1), {60, 8}, {0, -120});
    EXPECT_EQ(child<QScrollBar>("vsbTable").value(), 0);
}

TEST_F(Hands, ThatTurnTheWheelOverAListScrollTheListOnly) {
    show();
    bind();
    auto& list = table(1).list();
    for (int i = 0; i < 20; ++i) wheel(*list.viewport(), {20, 20}, {0, -120});
    EXPECT_EQ(list.verticalScrollBar()->value(), list.verticalScrollBar()->maximum());
    EXPECT_GT(list.verticalScrollBar()->value(), 0);
    EXPECT_EQ(child<QScrollBar>("vsbTable").value(), 0);
}

TEST_F(Hands, ThatPressOneOfSeveralSelectedEntriesKeepThemUntilTheRelease) {
    show();
    bind();
    auto& list = table(1).list();
    QWidget& viewport = *list.viewport();
    for (const int row : {1, 2, 3})
        list.selectionModel()->select(list.model()->index(row, 0), QItemSelectionModel::Select);
    hands::mouse(viewport, QEvent::MouseButtonPress, entry(1, 2), Qt::LeftButton, Qt::LeftButton);
    EXPECT_EQ(selected(1), QStringList({"CUSTOMER_ID", "EMPLOYEE_ID", "ORDER_ID"}));
    hands::mouse(viewport, QEvent::MouseButtonRelease, entry(1, 2), Qt::LeftButton);
    EXPECT_EQ(selected(1), QStringList("CUSTOMER_ID"));
}

TEST_F(Hands, ThatPressTheRightButtonSelectAnUnselectedEntryAlone) {
    show();
    bind();
    auto& list = table(1).list();
    list.selectionModel()->select(list.model()->index(1, 0), QItemSelectionModel::Select);
    hands::mouse(*list.viewport(), QEvent::MouseButtonPress, entry(1, 4), Qt::RightButton,
                 Qt::RightButton);
    EXPECT_EQ(selected(1), QStringList("ORDERED_ON"));
}

TEST_F(Hands, ThatDragStartOneDragHoweverOftenTheMouseMoves) {
    show();
    bind();
    int started = 0;
    widget->toolkit().drags().setCarrier([&](QDrag&) {
        ++started;
        hands::mouse(*table(1).list().viewport(), QEvent::MouseMove, entry(1, 3), Qt::NoButton,
                     Qt::LeftButton);
        qApp->processEvents();
    });
    drag(1, 2);
    settle();
    EXPECT_EQ(started, 1);
}

TEST_F(Hands, ThatAreQuickDragTheEntryThatTheyPressed) {
    show();
    bind();
    QWidget& viewport = *table(2).list().viewport();
    int started = 0;
    widget->toolkit().drags().setCarrier([&](QDrag&) { ++started; });
    // The last entry, and the first move is reported from below it; then from beside the table.
    for (const QPointF way : {QPointF(0, 15), QPointF(0, 90), QPointF(-200, 0), QPointF(900, 9)}) {
        const QPointF start = entry(2, 3);
        hands::mouse(viewport, QEvent::MouseButtonPress, start, Qt::LeftButton, Qt::LeftButton);
        hands::mouse(viewport, QEvent::MouseMove, start + way, Qt::NoButton, Qt::LeftButton);
        hands::mouse(viewport, QEvent::MouseButtonRelease, start + way, Qt::LeftButton);
        EXPECT_EQ(selected(2), QStringList("TOWN"));
    }
    EXPECT_EQ(started, 4);
}

TEST_F(Hands, ThatPressAnEmptyPlaceOfAListDragNothing) {
    show();
    bind();
    QWidget& viewport = *table(2).list().viewport();
    int started = 0;
    widget->toolkit().drags().setCarrier([&](QDrag&) { ++started; });
    hands::click(viewport, entry(2, 1));
    const QPointF below(30, viewport.height() - 3.0);
    hands::mouse(viewport, QEvent::MouseButtonPress, below, Qt::LeftButton, Qt::LeftButton);
    EXPECT_EQ(selected(2), QStringList());
    hands::mouse(viewport, QEvent::MouseMove, entry(2, 1), Qt::NoButton, Qt::LeftButton);
    EXPECT_EQ(started, 0);
}

TEST_F(Hands, ThatHoldShiftSelectFromTheEntryClickedLast) {
    show();
    bind();
    QWidget& viewport = *table(1).list().viewport();
    const auto click = [&](int row, Qt::KeyboardModifiers held = {}) {
        for (const auto type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease})
            hands::mouse(viewport, type, entry(1, row), Qt::LeftButton,
                         type == QEvent::MouseButtonPress ? Qt::LeftButton : Qt::NoButton, held);
    };
    click(2);
    click(5, Qt::ControlModifier);
    click(2); // was selected already
    click(4, Qt::ShiftModifier);
    EXPECT_EQ(selected(1), QStringList({"CUSTOMER_ID", "EMPLOYEE_ID", "ORDERED_ON"}));
}

TEST_F(Hands, ThatDragShowThePickedNames) {
    show();
    bind();
    QPixmap picture;
    widget->toolkit().drags().setCarrier([&](QDrag& drag) { picture = drag.pixmap(); });
    drag(1, 2);
    ASSERT_FALSE(picture.isNull());
    EXPECT_GE(picture.width() / picture.devicePixelRatio(),
              widget->fontMetrics().horizontalAdvance("CUSTOMER_ID"));
}

TEST_F(Hands, ThatDragShowNamesAsTheyStandHoweverTheyWerePicked) {
    show();
    bind();
    std::vector<QImage> pictures;
    widget->toolkit().drags().setCarrier(
        [&](QDrag& drag) { pictures.push_back(drag.pixmap().toImage()); });
    auto& list = table(1).list();
    for (const auto& rows : {std::pair(2, 4), std::pair(4, 2)}) {
        list.clearSelection();
        for (const int row : {rows.first, rows.second})
            list.selectionModel()->select(list.model()->index(row, 0), QItemSelectionModel::Select);
        drag(1, 4);
        settle();
    }
    ASSERT_EQ(pictures.size(), 2U);
    EXPECT_EQ(pictures[0], pictures[1]);
}

TEST_F(Hands, ThatDropOnAnEntryJoinItWithTheDraggedColumn) {
    show();
    bind();
    const int before = model->joinCount();
    widget->toolkit().drags().setCarrier(
        [&](QDrag& drag) { hands::carry(drag, *table(3).list().viewport(), entry(3, 2)); });
    drag(1, 6);
    ASSERT_EQ(model->joinCount(), before + 1);
    EXPECT_EQ(model->joinAt(before + 1).leftColumn->Name(), u"FREIGHT");
    EXPECT_EQ(model->joinAt(before + 1).rightColumn->Name(),
              u"AMOUNT_OF_MONEY_INCLUDING_EVERY_TAX_THERE_IS");
}

TEST_F(Hands, ThatDropSeveralEntriesDropThemAsTheyStand) {
    show();
    bind();
    auto& list = table(1).list();
    for (const int row : {4, 2}) // from below
        list.selectionModel()->select(list.model()->index(row, 0), QItemSelectionModel::Select);
    widget->toolkit().drags().setCarrier(
        [&](QDrag& drag) { hands::carry(drag, grid(), grid().cellRect(1, 5).center()); });
    drag(1, 4);
    settle();
    ASSERT_EQ(model->definitionCount(), 5);
    EXPECT_EQ(model->definitionAt(4).column->Name(), u"CUSTOMER_ID");
    EXPECT_EQ(model->definitionAt(5).column->Name(), u"ORDERED_ON");
}

TEST_F(Hands, ThatOpenTheMenuAreToldOfToTheHostsFilter) {
    show();
    bind();
    Messages messages;
    widget->installEventFilter(&messages);
    QTimer::singleShot(0, [] {
        if (auto* menu = QApplication::activePopupWidget()) menu->close();
    });
    hands::mouse(child<QWidget>("fraTable"), QEvent::MouseButtonRelease, {600, 30},
                 Qt::RightButton);
    EXPECT_EQ(messages.names, QStringList({"TALVIKDISABLEVELT", "TALVIKDISABLEVELT"}));
    EXPECT_EQ(messages.parameters, QList<int>({0, 1}));
    EXPECT_EQ(messages.receivers, QObjectList({widget.get(), widget.get()}));
    EXPECT_TRUE(messages.scratch);
}

TEST_F(Hands, ThatNameAWindowMessageGetTheSameTypeForTheSameName) {
    EXPECT_EQ(ZandorWindowMessage::typeOf("A"), ZandorWindowMessage::typeOf("A"));
    EXPECT_NE(ZandorWindowMessage::typeOf("A"), ZandorWindowMessage::typeOf("B"));
    EXPECT_EQ(widget->toolkit().RegisterWindowMessage(u"A"),
              static_cast<std::uint32_t>(ZandorWindowMessage::typeOf("A")));
}

TEST_F(Hands, ThatPressEnterInAnEditorSetItsValueEvenWhereTheHostUsesEnter) {
    show();
    bind();
    int stolen = 0;
    QShortcut shortcut(Qt::Key_Return, widget.get());
    QObject::connect(&shortcut, &QShortcut::activated, [&stolen] { ++stolen; });
    press(1, 1);
    auto& text = child<QLineEdit>("txtValue");
    text.setText("Number");
    hands::key(text, Qt::Key_Return);
    EXPECT_EQ(model->definitionAt(1).synonym, u"Number");
    EXPECT_FALSE(child<QWidget>("fraValue").isVisible());
    EXPECT_EQ(stolen, 0);
}

TEST_F(Hands, ThatPressF2OpenTheEditorOfTheCurrentCell) {
    show();
    bind();
    grid().view().setFocus();
    grid().view().setCurrentIndex(grid().view().model()->index(1, 1));
    hands::key(grid().view(), Qt::Key_F2);
    settle();
    EXPECT_TRUE(child<QWidget>("fraSortOrder").isVisible());
}

TEST_F(Hands, ThatPullAHeaderChangeTheColumnsWidth) {
    show();
    bind();
    grid().view().horizontalHeader()->resizeSection(0, 222);
    EXPECT_EQ(grid().model().width(1), 222 * 15);
    settle();
    EXPECT_EQ(grid().view().horizontalHeader()->sectionSize(0), 222);
}

TEST_F(Hands, ThatScrollTheGridLeaveItsFixedCellsInPlace) {
    show();
    bind();
    const QRect label = grid().cellRect(2, 0);
    grid().view().horizontalScrollBar()->setValue(2);
    settle();
    EXPECT_EQ(grid().firstCol(), 3);
    EXPECT_EQ(grid().cellRect(2, 0), label);
    EXPECT_EQ(grid().cellRect(0, 3).left(), label.width());
    EXPECT_LT(grid().cellRect(0, 2).left(), label.width());
}
