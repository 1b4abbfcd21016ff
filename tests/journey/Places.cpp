#include "Places.h"

#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/CanvasView.h"
#include "frontends/qt/ColumnListModel.h"
#include "frontends/qt/GridWidget.h"
#include "frontends/qt/TabuletWidget.h"

#include <Zandor/qt/Twips.h>

#include <QAbstractButton>
#include <QAbstractItemView>
#include <QApplication>
#include <QComboBox>
#include <QDialog>
#include <QMenu>
#include <QMenuBar>

using namespace zandor;

using platform::qt::Canvas;
using platform::qt::CanvasLine;
using platform::qt::GridWidget;
using platform::qt::TabuletWidget;
using platform::qt::twipsPerPixel;

namespace {

using Place = std::optional<QPoint>;

/// The middle of the part of a rectangle of a widget that its parents leave to be seen.
Place middle(const QWidget* widget, const QRect& rect) {
    if (!widget || !widget->isVisible()) return {};
    QRect shown = rect & widget->rect();
    for (const QWidget* part = widget; !part->isWindow(); part = part->parentWidget()) {
        const QPoint origin = widget->mapFrom(part->parentWidget(), QPoint());
        shown &= part->parentWidget()->rect().translated(origin);
    }
    if (shown.isEmpty()) return {};
    return widget->mapToGlobal(shown.center());
}

/// The middle of what can be seen of a part of the drawing, which bars and grid lie over.
Place middleInDrawing(const QWidget* part, const QRect& rect) {
    for (const QWidget* at = part; at; at = at->parentWidget())
        if (const auto* canvas = dynamic_cast<const Canvas*>(at))
            return middle(part,
                          rect & canvas->view().seen().translated(part->mapFrom(canvas, QPoint())));
    return {};
}

TabuletWidget* tableOf(const QWidget& window, const QString& title) {
    for (QWidget* child : window.findChildren<QWidget*>())
        if (auto* table = dynamic_cast<TabuletWidget*>(child); table && table->title() == title)
            return table;
    return nullptr;
}

Place entry(const TabuletWidget* table, const QString& column) {
    if (!table) return {};
    for (int row = 0; row < table->model().rowCount(); ++row)
        if (table->model().text(row) == column)
            return middleInDrawing(table->list().viewport(),
                                   table->list().visualRect(table->model().index(row)) &
                                       table->list().viewport()->rect());
    return {};
}

Place join(const QWidget& window, const QString& number) {
    auto* const canvas =
        dynamic_cast<Canvas*>(window.findChild<QWidget*>(QStringLiteral("fraTable")));
    if (!canvas) return {};
    for (const auto* item : canvas->items()) {
        const auto* line = dynamic_cast<const CanvasLine*>(item);
        if (!line || !line->visible() || line->name() != "linJoin(" + number + ")") continue;
        const QPointF at((line->X1() + line->X2()) / 2, (line->Y1() + line->Y2()) / 2);
        return canvas->mapToGlobal((at / twipsPerPixel).toPoint());
    }
    return {};
}

/// By the action's name, in the open menu or else in the menu bar.
Place menu(const QWidget& window, const QString& name) {
    if (auto* const open = qobject_cast<QMenu*>(QApplication::activePopupWidget())) {
        for (QAction* action : open->actions())
            if (action->objectName() == name) return middle(open, open->actionGeometry(action));
        return {};
    }
    const auto* bar = window.findChild<QMenuBar*>();
    if (!bar) return {};
    for (QAction* action : bar->actions())
        if (action->menu() && action->menu()->objectName() == name)
            return middle(bar, bar->actionGeometry(action));
    return {};
}

Place item(const QWidget* control, int number) {
    const auto* combo = qobject_cast<const QComboBox*>(control);
    if (!combo || !combo->view()->isVisible()) return {};
    return middle(combo->view()->viewport(),
                  combo->view()->visualRect(combo->model()->index(number, 0)));
}

Place row(const QWidget* control, const QString& text) {
    const auto* view = qobject_cast<const QAbstractItemView*>(control);
    if (!view) return {};
    const auto* model = view->model();
    for (int row = 0; row < model->rowCount(view->rootIndex()); ++row) {
        const QModelIndex index = model->index(row, 0, view->rootIndex());
        if (index.data().toString() == text)
            return middle(view->viewport(), view->visualRect(index));
    }
    return {};
}

Place button(const QString& text) {
    const QWidget* const dialog = QApplication::activeModalWidget();
    if (!dialog) return {};
    for (const auto* button : dialog->findChildren<QAbstractButton*>())
        if (QString(button->text()).remove(u'&') == text) return middle(button, button->rect());
    return {};
}

Place canvasPlace(const QWidget& window, QPoint at) {
    const auto* canvas = window.findChild<QWidget*>(QStringLiteral("fraTable"));
    return canvas ? middle(canvas, QRect(at, QSize(1, 1))) : Place();
}

} // namespace

QWidget* shownControl(const QWidget& window, const QString& name) {
    const QWidget* const dialog = QApplication::activeModalWidget();
    auto* const found = (dialog ? dialog : &window)->findChild<QWidget*>(name);
    return found && found->isVisible() ? found : nullptr;
}

Place placeOf(const QWidget& window, const QStringList& words) {
    const QString& kind = words.value(0);
    const QString& name = words.value(1);
    if (kind == "entry") return entry(tableOf(window, name), words.value(2));
    if (kind == "join") return join(window, name);
    if (kind == "canvas") return canvasPlace(window, {name.toInt(), words.value(2).toInt()});
    if (kind == "menu") return menu(window, name);
    if (kind == "button") return button(words.mid(1).join(u' '));
    const QWidget* const control = shownControl(window, name);
    if (kind == "control") return control ? middle(control, control->rect()) : Place();
    if (kind == "item") return item(control, words.value(2).toInt());
    if (kind == "row") return row(control, words.mid(2).join(u' '));
    if (kind == "cell") {
        const auto* grid =
            dynamic_cast<GridWidget*>(window.findChild<QWidget*>(QStringLiteral("sprColumn")));
        if (!grid) return {};
        QRect cell = grid->cellRect(name.toInt(), words.value(2).toInt());
        if (name.toInt() > 0) cell &= grid->view().viewport()->geometry();
        return middle(grid, cell);
    }
    if (const auto* table = tableOf(window, name)) {
        if (kind == "title") return middleInDrawing(table, table->titleBar());
        if (kind == "close")
            return middleInDrawing(&table->closeButton(), table->closeButton().rect());
    }
    return {};
}
