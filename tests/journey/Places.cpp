#include "Places.h"

#include "platform/qt/CanvasItems.h"
#include "platform/qt/ColumnListModel.h"
#include "platform/qt/GridWidget.h"
#include "platform/qt/TabuletWidget.h"
#include "platform/qt/Twips.h"
#include "platform/qt/ZandorWidget.h"

#include <QApplication>
#include <QComboBox>
#include <QDialog>
#include <QMenu>

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

TabuletWidget* tableOf(const ZandorWidget& widget, const QString& title) {
    for (QWidget* child : widget.findChildren<QWidget*>())
        if (auto* table = dynamic_cast<TabuletWidget*>(child); table && table->title() == title)
            return table;
    return nullptr;
}

Place entry(const TabuletWidget* table, const QString& column) {
    if (!table) return {};
    for (int row = 0; row < table->model().rowCount(); ++row)
        if (table->model().text(row) == column)
            return middle(table->list().viewport(),
                          table->list().visualRect(table->model().index(row)));
    return {};
}

Place join(const ZandorWidget& widget, const QString& number) {
    auto* const canvas =
        dynamic_cast<Canvas*>(widget.findChild<QWidget*>(QStringLiteral("fraTable")));
    if (!canvas) return {};
    for (const auto* item : canvas->items()) {
        const auto* line = dynamic_cast<const CanvasLine*>(item);
        if (!line || !line->visible() || line->name() != "linJoin(" + number + ")") continue;
        const QPointF at((line->X1() + line->X2()) / 2, (line->Y1() + line->Y2()) / 2);
        return canvas->mapToGlobal((at / twipsPerPixel).toPoint());
    }
    return {};
}

Place menu(const QString& name) {
    auto* const open = qobject_cast<QMenu*>(QApplication::activePopupWidget());
    if (!open) return {};
    for (QAction* action : open->actions())
        if (action->objectName() == name) return middle(open, open->actionGeometry(action));
    return {};
}

Place item(const QWidget* control, int number) {
    const auto* combo = qobject_cast<const QComboBox*>(control);
    if (!combo || !combo->view()->isVisible()) return {};
    return middle(combo->view()->viewport(),
                  combo->view()->visualRect(combo->model()->index(number, 0)));
}

} // namespace

QWidget* shownControl(const ZandorWidget& widget, const QString& name) {
    const QWidget* const dialog = QApplication::activeModalWidget();
    auto* const found = (dialog ? dialog : &widget)->findChild<QWidget*>(name);
    return found && found->isVisible() ? found : nullptr;
}

Place placeOf(const ZandorWidget& widget, const QStringList& words) {
    const QString& kind = words.value(0);
    const QString& name = words.value(1);
    if (kind == "entry") return entry(tableOf(widget, name), words.value(2));
    if (kind == "join") return join(widget, name);
    if (kind == "menu") return menu(name);
    const QWidget* const control = shownControl(widget, name);
    if (kind == "control") return control ? middle(control, control->rect()) : Place();
    if (kind == "item") return item(control, words.value(2).toInt());
    if (kind == "cell") {
        const auto* grid =
            dynamic_cast<GridWidget*>(widget.findChild<QWidget*>(QStringLiteral("sprColumn")));
        return grid ? middle(grid, grid->cellRect(name.toInt(), words.value(2).toInt())) : Place();
    }
    if (const auto* table = tableOf(widget, name)) {
        if (kind == "title") return middle(table, table->titleBar());
        if (kind == "close") return middle(&table->closeButton(), table->closeButton().rect());
    }
    return {};
}
