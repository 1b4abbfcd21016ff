#include "designer/tables/TableDropTarget.h"

#include "designer/DrawingArea.h"
#include "designer/tables/tableMime.h"

#include <QDropEvent>

namespace zandor::designer {

namespace {

/// Below, the grid covers the canvas.
int canvasHeight(DrawingArea& area) {
    return area.control().OnlyJoin() ? area.height() : area.height() / 2;
}

} // namespace

TableDropTarget::TableDropTarget(DrawingArea& area) : QObject(&area), mArea(area) {
    area.setAcceptDrops(true);
    area.installEventFilter(this);
}

bool TableDropTarget::eventFilter(QObject*, QEvent* event) {
    const auto type = event->type();
    if (type != QEvent::DragEnter && type != QEvent::DragMove && type != QEvent::Drop) return false;
    auto* const drag = static_cast<QDropEvent*>(event);
    if (!hasTables(*drag->mimeData())) return false;
    drag->setDropAction(Qt::CopyAction);
    drag->accept();
    if (type != QEvent::Drop) return true;
    const QPoint at = drag->position().toPoint();
    std::optional<QPoint> place;
    if (at.y() < canvasHeight(mArea)) place = mArea.canvasPlace(at);
    // Not within the drop: what comes may open a dialog, and the source of the drag waits.
    QMetaObject::invokeMethod(
        this,
        [this, tables = tablesOfMime(*drag->mimeData()), place] { emit dropped(tables, place); },
        Qt::QueuedConnection);
    return true;
}

} // namespace zandor::designer
