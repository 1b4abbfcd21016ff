#include "frontends/qt/Navigation.h"

#include "frontends/qt/Canvas.h"
#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/CanvasView.h"
#include "frontends/qt/Frames.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/KeyCodes.h"
#include "frontends/qt/PaneHandle.h"
#include "frontends/qt/TabuletWidget.h"

#include <QKeyEvent>

#include <algorithm>

namespace zandor::platform::qt {

namespace {

bool holds(const QWidget* outer, const QWidget* inner) {
    return outer && inner && (outer == inner || outer->isAncestorOf(inner));
}

bool takesTab(const QWidget& widget) {
    return (widget.focusPolicy() & Qt::TabFocus) == Qt::TabFocus && !widget.focusProxy() &&
           widget.isEnabled() && widget.isVisible();
}

Qt::FocusReason reason(bool next) { return next ? Qt::TabFocusReason : Qt::BacktabFocusReason; }

} // namespace

void Navigation::setGrid(GridWidget* grid) { mGrid = grid; }

QWidget* Navigation::focused() const {
    QWidget* const widget = mSurface ? mSurface->window()->focusWidget() : nullptr;
    return holds(mSurface, widget) ? widget : nullptr;
}

QWidget* Navigation::grid() const { return mGrid && mGrid->isVisible() ? mGrid.data() : nullptr; }

QWidget* Navigation::editorAround(QWidget* widget) const {
    while (widget && widget->parentWidget() != mSurface) widget = widget->parentWidget();
    return dynamic_cast<RowFrame*>(widget);
}

std::vector<Navigation::Stop> Navigation::stops() const {
    std::vector<Stop> all;
    if (Canvas* const canvas = mView.canvas(); canvas && canvas->isVisible()) {
        for (TabuletWidget* table : canvas->tables()) all.push_back({table, nullptr});
        const auto lines = canvas->lines();
        for (CanvasLine* line : lines) all.push_back({canvas, line});
        if (lines.empty()) all.push_back({canvas, nullptr});
    }
    if (grid()) {
        PaneHandle& handle = static_cast<GridWidget*>(grid())->handle();
        if (handle.isVisible()) all.push_back({&handle, nullptr});
        all.push_back({grid(), nullptr});
    }
    if (mHome && mHome->isVisible() && mHome->isEnabled()) all.push_back({mHome, nullptr});
    return all;
}

Navigation::Place Navigation::placeAmong(const std::vector<Stop>& all) const {
    const Canvas* const canvas = mView.canvas();
    QWidget* at = focused();
    if (at && at == mSentOnTo && mSentOnFrom) at = mSentOnFrom;
    const auto index = [&all](const auto& test) {
        const auto found = std::find_if(all.begin(), all.end(), test);
        return found == all.end() ? -1 : static_cast<int>(found - all.begin());
    };
    const int here = index([&](const Stop& stop) {
        return stop.widget == canvas ? at == canvas && stop.line == canvas->currentLine()
                                     : holds(stop.widget, at);
    });
    if (here >= 0) return {here - 1, here + 1};
    // On the canvas, with lines but on none of them: before the first.
    const int first = index([&](const Stop& stop) { return stop.widget == canvas; });
    if (at && at == canvas && first >= 0) return {first - 1, first};
    return {-1, 0};
}

bool Navigation::goOn(bool next) {
    if (QWidget* const editor = editorAround(focused())) return goOnInEditor(*editor, next);
    const auto all = stops();
    const Place place = placeAmong(all);
    const int to = next ? place.next : place.previous;
    if (to < 0 || to >= static_cast<int>(all.size())) return leave(next);
    go(all[static_cast<std::size_t>(to)], next);
    return true;
}

void Navigation::enter(bool next) {
    const auto all = stops();
    if (!all.empty()) go(next ? all.front() : all.back(), next);
}

void Navigation::go(const Stop& stop, bool next) {
    mSentOnFrom = mSentOnTo = nullptr;
    Canvas* const canvas = mView.canvas();
    if (stop.widget == canvas) return canvas->focusOn(stop.line, reason(next));
    const QPointer<QWidget> wanted = stop.widget;
    if (auto* const table = dynamic_cast<TabuletWidget*>(stop.widget)) {
        table->list(); // has the keys, and the focus in its place
        stop.widget->raise();
        mView.reveal(stop.widget->geometry());
    }
    stop.widget->setFocus(reason(next));
    if (!wanted || holds(wanted, focused())) return;
    mSentOnFrom = wanted;
    mSentOnTo = focused();
}

/// An open editor is a world of its own: Enter and Escape lead out of it.
bool Navigation::goOnInEditor(QWidget& editor, bool next) {
    std::vector<QWidget*> parts;
    for (auto* part : editor.findChildren<QWidget*>())
        if (part->focusPolicy() != Qt::NoFocus && part->isVisible() && part->isEnabled())
            parts.push_back(part);
    const auto here = std::find(parts.begin(), parts.end(), focused());
    if (parts.empty() || here == parts.end()) return false;
    const std::size_t at = static_cast<std::size_t>(here - parts.begin());
    parts[(at + (next ? 1 : parts.size() - 1)) % parts.size()]->setFocus(reason(next));
    return true;
}

bool Navigation::leave(bool next) {
    const auto step = [next](QWidget* widget) {
        return next ? widget->nextInFocusChain() : widget->previousInFocusChain();
    };
    if (!mSurface) return false;
    for (QWidget* widget = step(mSurface); widget != mSurface; widget = step(widget)) {
        if (mSurface->isAncestorOf(widget) || !takesTab(*widget)) continue;
        widget->setFocus(reason(next));
        return true;
    }
    // The control is alone in its window.
    enter(next);
    return true;
}

bool Navigation::changePane() {
    QWidget* const at = focused();
    Canvas* const canvas = mView.canvas();
    if (!canvas || !grid()) return false;
    if (!holds(grid(), at) && !editorAround(at)) {
        mLastTable = nullptr;
        for (TabuletWidget* table : canvas->tables())
            if (holds(table, at)) mLastTable = table;
        go({grid(), nullptr}, true);
        return true;
    }
    if (canvas->currentLine() && !mLastTable) {
        go({canvas, canvas->currentLine()}, true);
        return true;
    }
    const auto tables = canvas->tables();
    const auto isLast = [this](const auto* table) { return table == mLastTable; };
    const auto isCurrent = [](const auto* table) { return table->isCurrent(); };
    auto to = std::find_if(tables.begin(), tables.end(), isLast);
    if (to == tables.end()) to = std::find_if(tables.begin(), tables.end(), isCurrent);
    if (to == tables.end()) to = tables.begin();
    go(tables.empty() ? Stop{canvas, nullptr} : Stop{*to, nullptr}, true);
    return true;
}

bool Navigation::keyPressed(const QKeyEvent& event) {
    if (event.key() == Qt::Key_F6 && modifiersOf(event) == Qt::NoModifier) return changePane();
    const bool onCanvas = focused() && (focused() == mView.canvas() || focused() == mSurface);
    return onCanvas && scroll(event);
}

bool Navigation::scroll(const QKeyEvent& event) {
    const QRect seen = mView.seen();
    const bool withControl = modifiersOf(event) == Qt::ControlModifier;
    if (!withControl && modifiersOf(event) != Qt::NoModifier) return false;
    if (const QPoint arrow = arrowOf(event); !arrow.isNull() && !withControl) {
        mView.scrollByStep(arrow);
        return true;
    }
    switch (event.key()) {
    case Qt::Key_PageUp: mView.scrollBy({0, -seen.height()}); return true;
    case Qt::Key_PageDown: mView.scrollBy({0, seen.height()}); return true;
    case Qt::Key_Home:
        mView.scrollBy(withControl ? -seen.topLeft() : QPoint(-seen.left(), 0));
        return true;
    default: return false;
    }
}

bool Navigation::claims(const QKeyEvent& event) const {
    QWidget* const at = focused();
    Canvas* const canvas = mView.canvas();
    const bool inGrid = holds(grid(), at);
    const bool onLine = canvas && at == canvas && canvas->currentLine();
    const bool inTable = canvas && at != canvas && holds(canvas, at);
    if (!inGrid && !onLine && !inTable) return false;
    const Qt::KeyboardModifiers held = modifiersOf(event);
    if (isMenuKey(event)) return true;
    if (inGrid && held == Qt::AltModifier && arrowOf(event).x() != 0)
        return mComforts.flags().MovesColumns;
    if (!arrowOf(event).isNull()) return inTable && held & (Qt::AltModifier | Qt::ShiftModifier);
    if (inGrid && isTyping(event) &&
        (mComforts.flags().KeepsTyping || mComforts.flags().OffersFields))
        return true;
    if (held != Qt::NoModifier) return false;
    return event.key() == Qt::Key_Delete || (isEnter(event) && (inGrid || onLine)) ||
           (event.key() == Qt::Key_F2 && inGrid);
}

} // namespace zandor::platform::qt
