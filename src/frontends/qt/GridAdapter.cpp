#include "frontends/qt/GridAdapter.h"

#include "frontends/qt/DragSession.h"
#include "frontends/qt/Fonts.h"
#include "frontends/qt/GridModel.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/KeyboardMenu.h"

#include <Zandor/platform/RuntimeError.h>
#include <Zandor/qt/Text.h>

#include <QComboBox>
#include <QCoreApplication>
#include <QInputMethodEvent>
#include <QKeyEvent>

namespace zandor::platform::qt {

namespace {

/// Row and column of the current cell as one index pair is what every cell member works on.
QRect currentCell(const GridWidget& grid) {
    return grid.cellRect(grid.currentRow(), grid.currentCol());
}

} // namespace

GridAdapter::GridAdapter(GridWidget* widget, FocusTracker& focus, DragSession& drags,
                         KeyboardMenu& menu, comforts::Comforts& comforts,
                         MSFlexGridLib::GridEvents events)
    : Adapter(widget, focus), mDrags(drags), mMenu(menu), mComforts(comforts),
      mEvents(std::move(events)) {
    widget->setListener(this);
    widget->hide();
}

GridAdapter::~GridAdapter() {
    if (mWidget) mWidget->setListener(nullptr);
}

GridWidget& GridAdapter::grid() const {
    if (!mWidget) throw errors::objectNotSet();
    return *mWidget;
}

void GridAdapter::mustBeRow(std::int32_t row) const {
    if (row < 0 || row >= Rows()) throw errors::invalidRow();
}

void GridAdapter::mustBeCol(std::int32_t col) const {
    if (col < 0 || col >= Cols()) throw errors::invalidCol();
}

void GridAdapter::mustBeCell(std::int32_t row, std::int32_t col) const {
    if (row < 0 || row >= Rows() || col < 0 || col >= Cols())
        throw errors::invalidPropertyArrayIndex();
}

void GridAdapter::Font(const platform::Font& value) { setFont(grid(), value); }

void GridAdapter::SetFocus() {
    // Tables that go together with their closed window ask for it.
    if (mFocus.onScreen()) mFocus.take(&grid().view());
}

void GridAdapter::Row(std::int32_t value) {
    mustBeRow(value);
    grid().setCurrentCell(value, Col());
}

void GridAdapter::Col(std::int32_t value) {
    mustBeCol(value);
    grid().setCurrentCell(Row(), value);
}

String GridAdapter::Text() const { return TextMatrix(Row(), Col()); }

void GridAdapter::Text(const String& value) { TextMatrix(Row(), Col(), value); }

void GridAdapter::CellAlignment(std::int16_t value) {
    if (value < 0 || value > 9) throw errors::invalidPropertyValue();
    grid().model().setAlignment(Row(), Col(), value);
    grid().touch();
}

float GridAdapter::CellLeft() const { return toTwips(currentCell(grid()).left()); }

float GridAdapter::CellTop() const { return toTwips(currentCell(grid()).top()); }

float GridAdapter::CellWidth() const { return toTwips(currentCell(grid()).width()); }

float GridAdapter::CellHeight() const { return toTwips(currentCell(grid()).height()); }

String GridAdapter::TextMatrix(std::int32_t row, std::int32_t col) const {
    mustBeCell(row, col);
    return fromQt(grid().model().text(row, col));
}

void GridAdapter::TextMatrix(std::int32_t row, std::int32_t col, const String& value) {
    mustBeCell(row, col);
    grid().model().setText(row, col, toQt(value));
    grid().touch();
}

void GridAdapter::CellNote(std::int32_t row, std::int32_t col, const String& value) {
    mustBeCell(row, col);
    const QString& before = grid().model().note(row, col);
    if (value.empty() && before.isEmpty()) return;
    const QString note = toQt(value);
    if (before == note) return;
    grid().model().setNote(row, col, note);
    grid().touch();
}

float GridAdapter::ColPos(std::int32_t col) const {
    mustBeCol(col);
    return toTwips(grid().cellRect(0, col).left());
}

float GridAdapter::RowPos(std::int32_t row) const {
    mustBeRow(row);
    return toTwips(grid().cellRect(row, 0).top());
}

float GridAdapter::ColWidth(std::int32_t col) const {
    mustBeCol(col);
    if (col == 0) {
        grid().view();
        grid().bringUpToDate();
    }
    return grid().model().width(col);
}

void GridAdapter::ColWidth(std::int32_t col, float value) {
    mustBeCol(col);
    if (!(value >= 0)) throw errors::invalidPropertyValue();
    if (col == 0)
        grid().setLabelWidth(value);
    else
        grid().model().setWidth(col, value);
    grid().touch();
}

void GridAdapter::ColPosition(std::int32_t col, std::int32_t position) {
    mustBeCol(col);
    mustBeCol(position);
    grid().model().move(col, position);
    grid().touch();
}

std::int32_t GridAdapter::Rows() const { return grid().model().rows(); }

std::int32_t GridAdapter::Cols() const { return grid().model().cols(); }

std::int32_t GridAdapter::ColData(std::int32_t col) const {
    mustBeCol(col);
    return grid().model().columnData(col);
}

void GridAdapter::ColData(std::int32_t col, std::int32_t value) {
    mustBeCol(col);
    grid().model().setColumnData(col, value);
}

void GridAdapter::borderDragged(int col) {
    mComforts.borderDragged(col, grid().model().width(col));
}

void GridAdapter::pressed(Qt::MouseButton button, Qt::KeyboardModifiers modifiers, QPointF at) {
    if (mComforts.gridPressed(buttonState(button), toTwips(at.x()), toTwips(at.y()))) return;
    if (mEvents.MouseDown)
        mEvents.MouseDown(buttonState(button), shiftState(modifiers), toTwips(at.x()),
                          toTwips(at.y()));
}

void GridAdapter::released(Qt::MouseButton button, Qt::KeyboardModifiers modifiers, QPointF at) {
    if (mEvents.MouseUp)
        mEvents.MouseUp(buttonState(button), shiftState(modifiers), toTwips(at.x()),
                        toTwips(at.y()));
}

void GridAdapter::scrolled() {
    if (mEvents.Scroll) mEvents.Scroll();
}

void GridAdapter::menuKey(QPointF at, QPoint screen) {
    mMenu.openAt(screen, [&] { clickWithRightButton(at); });
}

void GridAdapter::deleteKey(QPointF at) {
    mMenu.choose(menuentry::deleteColumn, [&] { clickWithRightButton(at); });
}

bool GridAdapter::typed(QKeyEvent& event) {
    const QPointer<GridWidget> alive = mWidget;
    if (!mComforts.cellTyped(fromQt(event.text()))) return false;
    // A list that has opened looks for an item that begins so.
    auto* const list = alive ? qobject_cast<QComboBox*>(alive->window()->focusWidget()) : nullptr;
    if (list) QCoreApplication::sendEvent(list, &event);
    return true;
}

bool GridAdapter::composed(QInputMethodEvent& event) {
    if (!mComposer.isComposing()) {
        if (event.preeditString().isEmpty()) {
            if (event.commitString().isEmpty()) return false;
            QKeyEvent key(QEvent::KeyPress, Qt::Key_unknown, Qt::NoModifier, event.commitString());
            return typed(key);
        }
        if (!mComposer.begin([this] { mComforts.cellTyped({}); })) return true;
    }
    mComposer.goOn(event);
    return true;
}

void GridAdapter::asked(QInputMethodQueryEvent& query) {
    if (mComposer.isComposing()) return mComposer.answer(query, grid().view());
    const auto& flags = mComforts.flags();
    query.setValue(Qt::ImEnabled, flags.KeepsTyping || flags.OffersFields);
    const QRect cell = currentCell(grid());
    query.setValue(Qt::ImCursorRectangle, cell.translated(-grid().view().pos()));
    query.accept();
}

void GridAdapter::clickWithRightButton(QPointF at) {
    const QPointer<GridWidget> alive = mWidget;
    pressed(Qt::RightButton, Qt::NoModifier, at);
    if (alive) released(Qt::RightButton, Qt::NoModifier, at);
}

bool GridAdapter::dragAccepted(const QMimeData* data) { return mDrags.accepts(data); }

bool GridAdapter::dropped(const QMimeData* data, QPointF at) {
    if (!mDrags.accepts(data)) return false;
    mDrags.drop([this, alive = mWidget, at](bool counts) {
        if (counts && alive && alive->property(controlProperty).isValid() && mEvents.DragDrop)
            mEvents.DragDrop(mDrags.source(), toTwips(at.x()), toTwips(at.y()));
    });
    return true;
}

} // namespace zandor::platform::qt
