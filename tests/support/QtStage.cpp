#include "frontends/qt/Adapter.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/MessageBox.h"
#include "frontends/qt/PickListWidget.h"
#include "frontends/qt/QtToolkit.h"
#include "frontends/qt/TabuletWidget.h"
#include "frontends/qt/ZandorWindowMessage.h"
#include "support/QtHands.h"
#include "support/QtLook.h"
#include "support/Stage.h"
#include "support/StageEvents.h"

#include <Zandor/ZandorWidget.h>
#include <Zandor/qt/Text.h>

#include <QAbstractItemView>
#include <QApplication>
#include <QComboBox>
#include <QDialog>
#include <QLabel>
#include <QLineEdit>
#include <QListView>
#include <QMenu>
#include <QMessageBox>
#include <QPaintEvent>
#include <QPushButton>
#include <QScrollBar>
#include <QTimer>

#include <QtCore/qtestsupport_core.h>

#include <gtest/gtest.h>

using namespace zandor;

namespace {

using platform::qt::Canvas;
using platform::qt::CanvasItem;
using platform::qt::CanvasLine;
using platform::qt::CanvasShape;
using platform::qt::fromQt;
using platform::qt::GridWidget;
using platform::qt::TabuletWidget;
using platform::qt::toQt;
using platform::qt::twipsPerPixel;

Qt::MouseButtons buttonsOf(std::int16_t state) {
    Qt::MouseButtons buttons;
    if (state & 1) buttons |= Qt::LeftButton;
    if (state & 2) buttons |= Qt::RightButton;
    if (state & 4) buttons |= Qt::MiddleButton;
    return buttons;
}

Qt::MouseButton buttonOf(std::int16_t state) {
    return static_cast<Qt::MouseButton>(buttonsOf(state).toInt());
}

QPointF pixels(float x, float y) {
    return {static_cast<double>(x) / twipsPerPixel, static_cast<double>(y) / twipsPerPixel};
}

/// A place somewhere in a widget.
struct Spot {
    QWidget* widget = nullptr;
    QPointF at;
};

class QtStage final : public QObject, public Stage {
public:
    explicit QtStage(TalvikZandorLib::Library& library)
        : mEvents(*this), mWidget(std::make_unique<ZandorWidget>(library)) {
        qApp->installEventFilter(this);
        listen();
        // The platform without a screen carries no drags.
        mWidget->toolkit().drags().setCarrier([this](QDrag& drag) {
            if (mDragOver.widget) hands::carryOver(drag, *mDragOver.widget, mDragOver.at);
            if (!mDropAt.widget) return;
            if (onHeld && !mDragOver.widget) hands::carryOver(drag, *mDropAt.widget, mDropAt.at);
            held();
            hands::carry(drag, *mDropAt.widget, mDropAt.at, mDragOver.widget || onHeld);
        });
        mHostField.move(-1000, -1000); // out of the way
        mWidget->resize(800, 600);
        mWidget->show();
        settle();
    }

    ~QtStage() override { closeControl(); }

    TalvikDBxZandor::Zandor& control() override { return mWidget->control(); }
    platform::Toolkit& toolkit() override { return mWidget->toolkit(); }
    comforts::Comforts& comforts() override { return mWidget->toolkit().comforts(); }
    void closeControl() override {
        mWidget.reset();
        qApp->processEvents();
    }

    bool exists(const std::string& name) override {
        return findWidget(name) || findItem(name) || findAction(name);
    }
    Seen look(const std::string& name) override;
    String cell(std::int32_t row, std::int32_t col) override {
        return fromQt(grid().model().text(row, col));
    }

    void resizeControl(float width, float height) override {
        mWidget->resize(pixels(width, 0).toPoint().x(), pixels(0, height).toPoint().y());
        settle();
    }
    void repaint() override {
        // The canvas covers the widget's own surface, so nothing that is shown would do.
        QPaintEvent event(mWidget->rect());
        QCoreApplication::sendEvent(mWidget.get(), &event);
        settle();
    }
    void clickButton(const std::string& name) override {
        QWidget& button = widget<QAbstractButton>(name);
        hands::click(button, QRectF(button.rect()).center());
        settle();
    }
    void focus(const std::string& name) override {
        focusable(widget<QWidget>(name)).setFocus(Qt::TabFocusReason);
        settle();
    }
    void scrollBarTo(const std::string& name, std::int16_t value) override {
        auto& bar = widget<QScrollBar>(name);
        bar.setFocus(Qt::MouseFocusReason);
        if (bar.isEnabled()) bar.setSliderPosition(value);
        settle();
    }
    void moveTable(std::int16_t index, float left, float top) override {
        const platform::Bounds from = look(tableName(index)).bounds;
        TabuletWidget& box = table(index);
        gesture(box, QRectF(box.titleBar()).center(), pixels(left - from.Left, top - from.Top));
    }
    void resizeTable(std::int16_t index, float width, float height) override {
        const platform::Bounds from = look(tableName(index)).bounds;
        TabuletWidget& box = table(index);
        gesture(box, QPointF(box.width() - 2, box.height() - 2),
                pixels(width - from.Width, height - from.Height));
    }
    void closeTable(std::int16_t index) override {
        QWidget& close = table(index).closeButton();
        hands::click(close, QRectF(close.rect()).center());
        settle();
    }
    void scrollList(std::int16_t index, std::int32_t firstEntry) override {
        auto& list = table(index).list();
        list.verticalScrollBar()->setValue((firstEntry - 1) * list.rowHeight());
        settle();
    }
    void scrollGrid(std::int32_t topRow, std::int32_t leftCol) override {
        grid().bringUpToDate();
        grid().view().verticalScrollBar()->setValue(topRow - 1);
        grid().view().horizontalScrollBar()->setValue(leftCol - 1);
        settle();
    }
    void selectEntries(std::int16_t index, const std::vector<std::int32_t>& entries) override {
        auto& list = table(index).list();
        list.selectionModel()->clearSelection();
        for (const std::int32_t entry : entries)
            list.selectionModel()->select(list.model()->index(entry - 1, 0),
                                          QItemSelectionModel::Select);
    }
    void pressEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        send(entrySpot(index, entry), QEvent::MouseButtonPress, button, buttonsOf(button));
    }
    void releaseEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        send(entrySpot(index, entry), QEvent::MouseButtonRelease, button, Qt::NoButton);
    }
    void moveOverEntry(std::int16_t index, std::int32_t entry, std::int16_t button) override {
        send(entrySpot(index, entry), QEvent::MouseMove, 0, buttonsOf(button));
    }
    void doubleClickEntry(std::int16_t index, std::int32_t entry) override {
        const Spot spot = entrySpot(index, entry);
        send(spot, QEvent::MouseButtonPress, 1, Qt::LeftButton);
        send(spot, QEvent::MouseButtonRelease, 1, Qt::NoButton);
        send(spot, QEvent::MouseButtonDblClick, 1, Qt::LeftButton);
        send(spot, QEvent::MouseButtonRelease, 1, Qt::NoButton);
    }
    void dragToEntry(std::int16_t from, std::int32_t entry, std::int16_t to,
                     std::int32_t target) override {
        drag(from, entry, entrySpot(to, target));
    }
    void dragAcross(std::int16_t from, std::int32_t entry, std::int16_t across, std::int32_t passed,
                    std::int32_t row, std::int32_t col) override {
        mDragOver = entrySpot(across, passed);
        drag(from, entry, cellSpot(row, col));
        mDragOver = {};
    }
    void dragToCell(std::int16_t from, std::int32_t entry, std::int32_t row,
                    std::int32_t col) override {
        drag(from, entry, cellSpot(row, col));
    }
    void pressCanvas(std::int16_t button, float x, float y) override {
        send({&widget<Canvas>("fraTable"), pixels(x, y)}, QEvent::MouseButtonPress, button,
             buttonsOf(button));
    }
    void releaseCanvas(std::int16_t button, float x, float y) override {
        send({&widget<Canvas>("fraTable"), pixels(x, y)}, QEvent::MouseButtonRelease, button,
             Qt::NoButton);
    }
    void pressCell(std::int16_t button, std::int32_t row, std::int32_t col) override {
        send(cellSpot(row, col), QEvent::MouseButtonPress, button, buttonsOf(button));
    }
    void releaseCell(std::int16_t button, std::int32_t row, std::int32_t col) override {
        send(cellSpot(row, col), QEvent::MouseButtonRelease, button, Qt::NoButton);
    }
    void type(const std::string& name, const String& text) override {
        auto& input = widget<QLineEdit>(name);
        input.setFocus(Qt::MouseFocusReason);
        input.selectAll();
        if (text.empty()) hands::key(input, Qt::Key_Delete);
        for (const QChar letter : toQt(text)) hands::key(input, 0, letter);
        settle();
    }
    void choose(const std::string& name, std::int16_t listIndex) override {
        auto& combo = widget<QComboBox>(name);
        if (!combo.isEnabled()) return;
        combo.setFocus(Qt::MouseFocusReason);
        hands::key(combo, Qt::Key_Home);
        for (std::int16_t i = 0; i < listIndex; ++i) hands::key(combo, Qt::Key_Down);
        settle();
    }
    void pick(const std::string& name, std::int16_t listIndex) override {
        auto& combo = widget<QComboBox>(name);
        // A list that has just opened takes no click for as long as a double click may last.
        QApplication::setDoubleClickInterval(1);
        hands::click(combo, QRectF(combo.rect()).center());
        QTest::qWait(10);
        QAbstractItemView& list = *combo.view();
        const QPointF at = QRectF(list.visualRect(list.model()->index(listIndex, 0))).center();
        hands::mouse(*list.viewport(), QEvent::MouseMove, at, Qt::NoButton);
        hands::click(*list.viewport(), at);
        settle();
    }
    void typeInGrid(const String& text) override {
        QWidget& view = grid().view();
        view.setFocus(Qt::TabFocusReason);
        for (const QChar letter : toQt(text)) hands::key(*view.window()->focusWidget(), 0, letter);
        settle();
    }
    void pickField(const String& text) override {
        auto& list = widget<platform::qt::PickListWidget>("lstFields");
        for (const QChar letter : toQt(text)) hands::key(list.box(), 0, letter);
        hands::key(list.box(), Qt::Key_Return);
        settle();
    }
    void clickField(std::int32_t col) override {
        pressCell(1, 0, col);
        releaseCell(1, 0, col);
    }
    void dragField(std::int32_t col, std::int32_t to) override {
        const Spot from = cellSpot(0, col);
        // Past the middle of the other column, so that this one takes its place.
        const QRect target = grid().cellRect(0, to);
        const int x = to > col ? target.right() - 6 : target.left() + 6;
        const Spot end{from.widget, from.widget->mapFrom(&grid(), QPointF(x, target.center().y()))};
        send(from, QEvent::MouseButtonPress, 1, Qt::LeftButton);
        send(end, QEvent::MouseMove, 0, Qt::LeftButton);
        held();
        send(end, QEvent::MouseButtonRelease, 1, Qt::NoButton);
    }
    void dragBorder(std::int32_t col, float width) override {
        const QRect cell = grid().cellRect(0, col);
        Spot border = cellSpot(0, col);
        border.at = border.widget->mapFrom(&grid(), QPointF(cell.right(), cell.center().y()));
        Spot end = border;
        if (width > 0) end.at += QPointF(width / twipsPerPixel - cell.width(), 0);
        send(border, width > 0 ? QEvent::MouseButtonPress : QEvent::MouseButtonDblClick, 1,
             Qt::LeftButton);
        if (width > 0) {
            send(end, QEvent::MouseMove, 0, Qt::LeftButton);
            held();
        }
        send(end, QEvent::MouseButtonRelease, 1, Qt::NoButton);
    }
    void editCell() override {
        QWidget& view = grid().view();
        view.setFocus(Qt::TabFocusReason);
        hands::key(view, Qt::Key_F2);
        settle();
    }
    void moveCurrentColumn(std::int32_t step) override {
        QWidget& view = grid().view();
        view.setFocus(Qt::TabFocusReason);
        hands::key(view, step < 0 ? Qt::Key_Left : Qt::Key_Right, {}, Qt::AltModifier);
        settle();
    }
    String note(std::int32_t row, std::int32_t col) override {
        return fromQt(grid().model().note(row, col));
    }
    void leaveControl() override {
        mHostField.setFocus(Qt::MouseFocusReason);
        settle();
    }
    void key(const std::string& name, std::int16_t keyCode, std::int16_t shift) override {
        QWidget& input = focusable(widget<QWidget>(name));
        input.setFocus(Qt::MouseFocusReason);
        int key = keyCode;
        if (keyCode == 27) key = Qt::Key_Escape;
        if (keyCode == 13) key = Qt::Key_Return;
        if (keyCode == 9) key = shift == 1 ? Qt::Key_Backtab : Qt::Key_Tab;
        if (keyCode >= 37 && keyCode <= 40) key = Qt::Key_Left + keyCode - 37;
        if (keyCode == 35 || keyCode == 36) key = keyCode == 36 ? Qt::Key_Home : Qt::Key_End;
        Qt::KeyboardModifiers held;
        held.setFlag(Qt::ShiftModifier, shift & 1);
        held.setFlag(Qt::ControlModifier, shift & 2);
        held.setFlag(Qt::AltModifier, shift & 4);
        hands::key(input, key, {}, held);
        settle();
    }

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    static std::string tableName(int index) { return "lstTable(" + std::to_string(index) + ")"; }
    static QWidget& focusable(QWidget& given) {
        if (const auto* table = dynamic_cast<TabuletWidget*>(&given)) return table->list();
        return given.focusProxy() ? *given.focusProxy() : given;
    }

    void listen();

    /// Lets queued work run, and the window be the active one again after a box.
    void settle() {
        if (mWidget && !QApplication::activeModalWidget() && !QApplication::activePopupWidget() &&
            !mWidget->isActiveWindow())
            mWidget->activateWindow();
        qApp->processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }

    QWidget* findWidget(const std::string& name) const;
    CanvasItem* findItem(const std::string& name) const;
    QAction* findAction(const std::string& name) const;
    template <class W>
    W& widget(const std::string& name) const {
        if (auto* found = dynamic_cast<W*>(findWidget(name))) return *found;
        throw std::logic_error("there is no " + name);
    }
    TabuletWidget& table(int index) const { return widget<TabuletWidget>(tableName(index)); }
    GridWidget& grid() const { return widget<GridWidget>("sprColumn"); }

    Spot entrySpot(int index, std::int32_t entry) const;
    Spot cellSpot(std::int32_t row, std::int32_t col) const;
    void send(const Spot& spot, QEvent::Type type, std::int16_t button, Qt::MouseButtons held);
    void gesture(TabuletWidget& box, QPointF grip, QPointF way);
    void drag(std::int16_t from, std::int32_t entry, const Spot& to);
    void held() const {
        if (onHeld) onHeld();
    }
    void boxOpened(QMessageBox& box);
    void menuOpened(QMenu& menu);
    void dialogOpened(QDialog& dialog);

    StageEvents mEvents;
    Spot mDragOver; ///< what such a drag passes; no widget: nothing
    Spot mDropAt;   ///< where a drag that begins now ends; no widget: it is given up at once
    std::unique_ptr<ZandorWidget> mWidget;
    QLineEdit& mHostField = *new QLineEdit(mWidget.get());
};

void QtStage::listen() {
    using TalvikDBxZandor::Event;
    using Widget = ZandorWidget;
    const auto plain = [this](auto signal, Event event) {
        connect(mWidget.get(), signal, this, [this, event] { mEvents.Raise(event, {}); });
    };
    plain(&Widget::TableDeleted, Event::TableDeleted);
    plain(&Widget::TableMoved, Event::TableMoved);
    plain(&Widget::Activate, Event::Activate);
    const auto column = [this](auto signal, Event event) {
        connect(mWidget.get(), signal, this, [this, event](const auto& definition) {
            mEvents.Raise(event, {.Definition = definition, .Join = {}, .Text = {}});
        });
    };
    column(&Widget::ColumnCreated, Event::ColumnCreated);
    column(&Widget::ColumnModified, Event::ColumnModified);
    column(&Widget::ColumnRemoved, Event::ColumnRemoved);
    const auto join = [this](auto signal, Event event) {
        connect(mWidget.get(), signal, this, [this, event](const auto& changed) {
            mEvents.Raise(event, {.Definition = {}, .Join = changed, .Text = {}});
        });
    };
    join(&Widget::JoinCreated, Event::JoinCreated);
    join(&Widget::JoinModified, Event::JoinModified);
    join(&Widget::JoinRemoved, Event::JoinRemoved);
    connect(mWidget.get(), &Widget::Error, this, [this](const QString& text, int number) {
        mEvents.Raise(Event::Error,
                      {.Definition = {}, .Join = {}, .Text = fromQt(text), .Number = number});
    });
}

QWidget* QtStage::findWidget(const std::string& name) const {
    const QString wanted = QString::fromStdString(name);
    for (QWidget* window : QApplication::topLevelWidgets())
        if (auto* dialog = qobject_cast<QDialog*>(window); dialog && dialog->isVisible()) {
            if (dialog->objectName() == wanted) return dialog;
            if (auto* found = dialog->findChild<QWidget*>(wanted)) return found;
        }
    return mWidget ? mWidget->findChild<QWidget*>(wanted) : nullptr;
}

CanvasItem* QtStage::findItem(const std::string& name) const {
    const auto* canvas = mWidget ? mWidget->findChild<QWidget*>("fraTable") : nullptr;
    if (!canvas) return nullptr;
    for (CanvasItem* item : static_cast<const Canvas*>(canvas)->items())
        if (item->name().toStdString() == name) return item;
    return nullptr;
}

QAction* QtStage::findAction(const std::string& name) const {
    for (QWidget* window : QApplication::topLevelWidgets())
        if (window->objectName() == QLatin1String("mnuZandor"))
            for (QAction* action : window->actions())
                if (action->objectName().toStdString() == name) return action;
    return nullptr;
}

Stage::Seen QtStage::look(const std::string& name) {
    settle();
    Seen seen;
    if (const QAction* action = findAction(name)) {
        seen.text = action->isSeparator() ? u"-" : fromQt(action->text());
        seen.enabled = action->isEnabled();
        seen.visible = action->isVisible();
    } else if (const CanvasItem* item = findItem(name)) {
        seen.visible = item->visible();
        seen.enabled = true;
        if (const auto* line = dynamic_cast<const CanvasLine*>(item)) {
            seen.X1 = line->X1();
            seen.Y1 = line->Y1();
            seen.X2 = line->X2();
            seen.Y2 = line->Y2();
            seen.borderWidth = line->borderWidth();
        } else if (const auto* shape = dynamic_cast<const CanvasShape*>(item)) {
            seen.bounds = shape->bounds();
            seen.shape = shape->shapeStyle();
        }
    } else if (QWidget* widget = findWidget(name)) {
        const auto* control = static_cast<const platform::Control*>(
            widget->property(platform::qt::controlProperty).value<void*>());
        if (control) seen.bounds = control->bounds();
        // What the control takes for its place is what stands on the screen.
        const bool placed = control && !widget->isWindow() && !widget->parentWidget()->layout();
        if (placed && widget->isVisible()) {
            EXPECT_EQ(widget->geometry(), platform::qt::toPixels(seen.bounds)) << name;
        }
        seen.visible = widget->isVisible();
        seen.enabled = widget->isEnabled();
        seen.focused = widget->window()->focusWidget() == &focusable(*widget);
        seen.font = fromQt(widget->font().family());
        hands::lookAtKind(*widget, seen);
    } else {
        ADD_FAILURE() << "there is no " << name;
    }
    return seen;
}

Spot QtStage::entrySpot(int index, std::int32_t entry) const {
    auto& list = table(index).list();
    QWidget* const viewport = list.viewport();
    if (entry == 0) return {viewport, QPointF(viewport->width() / 2.0, viewport->height() - 4)};
    const QRect row = list.visualRect(list.model()->index(entry - 1, 0));
    const QRect shown = row & viewport->rect();
    if (shown.isEmpty()) throw std::logic_error("the entry is scrolled out of view");
    return {viewport, QRectF(shown).center()};
}

Spot QtStage::cellSpot(std::int32_t row, std::int32_t col) const {
    const QRect cell = grid().cellRect(row, col) & grid().rect();
    QWidget* const part = grid().childAt(cell.center());
    if (cell.isEmpty() || !part) throw std::logic_error("the cell is scrolled out of view");
    return {part, part->mapFrom(&grid(), QRectF(cell).center())};
}

void QtStage::send(const Spot& spot, QEvent::Type type, std::int16_t button,
                   Qt::MouseButtons held) {
    // Cells are left out: an editor opened over one cell may cover its neighbours.
    if (type == QEvent::MouseButtonPress && !grid().isAncestorOf(spot.widget)) {
        const QPoint at = spot.widget->mapTo(mWidget.get(), spot.at.toPoint());
        EXPECT_TRUE(!mWidget->rect().contains(at) || mWidget->childAt(at) == spot.widget)
            << "something covers the place pressed";
    }
    hands::mouse(*spot.widget, type, spot.at, buttonOf(button), held);
    settle();
}

void QtStage::gesture(TabuletWidget& box, QPointF grip, QPointF way) {
    // The mouse moves on the screen while the box moves below it.
    const QPointF start = box.mapToGlobal(grip);
    hands::mouse(box, QEvent::MouseButtonPress, grip, Qt::LeftButton, Qt::LeftButton);
    const QPointer<QWidget> alive = &box;
    for (const double part : {0.5, 1.0})
        if (alive)
            hands::mouse(box, QEvent::MouseMove, box.mapFromGlobal(start + part * way),
                         Qt::NoButton, Qt::LeftButton);
    held();
    if (alive)
        hands::mouse(box, QEvent::MouseButtonRelease, box.mapFromGlobal(start + way),
                     Qt::LeftButton);
    settle();
}

void QtStage::drag(std::int16_t from, std::int32_t entry, const Spot& to) {
    const Spot start = entrySpot(from, entry);
    send(start, QEvent::MouseButtonPress, 1, Qt::LeftButton);
    mDropAt = to;
    send(start, QEvent::MouseMove, 0, Qt::LeftButton);
    mDropAt = {};
}

bool QtStage::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::Show) {
        if (auto* box = qobject_cast<QMessageBox*>(watched))
            boxOpened(*box);
        else if (auto* dialog = qobject_cast<QDialog*>(watched))
            dialogOpened(*dialog);
        else if (auto* menu = qobject_cast<QMenu*>(watched))
            menuOpened(*menu);
    } else if (watched == mWidget.get() &&
               event->type() == ZandorWindowMessage::typeOf("TALVIKDISABLEVELT")) {
        const auto& message = static_cast<const ZandorWindowMessage&>(*event);
        messages.push_back({fromQt(message.name()), message.wParam(),
                            QApplication::activePopupWidget() != nullptr});
        transcript.push_back("message:" + std::to_string(message.wParam()));
    }
    return QObject::eventFilter(watched, event);
}

void QtStage::boxOpened(QMessageBox& box) {
    const Box seen{fromQt(box.property(platform::qt::promptProperty).toString()),
                   fromQt(box.windowTitle()), box.property(platform::qt::styleProperty).toInt()};
    boxes.push_back(seen);
    transcript.push_back("box:" + platform::toUtf8(seen.text));
    QTimer::singleShot(0, &box, [&box] {
        QWidget& ok = *box.button(QMessageBox::Ok);
        hands::click(ok, QRectF(ok.rect()).center());
    });
}

void QtStage::menuOpened(QMenu& menu) {
    transcript.push_back("menu");
    QTimer::singleShot(0, &menu, [this, &menu] {
        std::vector<Entry> entries;
        for (const QAction* action : menu.actions())
            entries.push_back({fromQt(action->objectName()),
                               action->isSeparator() ? u"-" : fromQt(action->text()),
                               action->isEnabled(), action->isVisible()});
        const String chosen = onMenu ? onMenu(entries) : String();
        for (QAction* action : menu.actions())
            if (!chosen.empty() && fromQt(action->objectName()) == chosen)
                hands::click(menu, QRectF(menu.actionGeometry(action)).center());
        // An entry that is disabled leaves the menu open.
        if (menu.isVisible()) hands::key(menu, Qt::Key_Escape);
    });
}

void QtStage::dialogOpened(QDialog& dialog) {
    transcript.push_back("dialog");
    QTimer::singleShot(0, &dialog, [this, open = QPointer<QDialog>(&dialog)] {
        if (onDialog) onDialog();
        if (open && open->isVisible()) hands::key(*open, Qt::Key_Escape);
    });
}

} // namespace

std::unique_ptr<Stage> Stage::open(TalvikZandorLib::Library& library) {
    return std::make_unique<QtStage>(library);
}

int main(int argc, char** argv) {
    qputenv("QT_QPA_PLATFORM", "offscreen");
    QApplication application(argc, argv);
    // The platform without a screen complains of what it lacks; nothing here depends on it.
    qInstallMessageHandler([](QtMsgType, const QMessageLogContext&, const QString& text) {
        if (!text.startsWith("This plugin does not support"))
            std::fprintf(stderr, "%s\n", qPrintable(text));
    });
    testing::InitGoogleTest(&argc, argv);
    return RUN_ALL_TESTS();
}
