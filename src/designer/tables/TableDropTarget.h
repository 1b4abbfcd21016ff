#pragma once

#include <Zandor/DatabaseReader.h>

#include <QObject>
#include <QPoint>

#include <optional>

namespace zandor::designer {

class DrawingArea;

/// Takes tables that are dropped on the drawing. The control itself refuses what does not come from
/// it, and Qt then asks the widgets around it.
class TableDropTarget final : public QObject {
    Q_OBJECT

public:
    explicit TableDropTarget(DrawingArea& area);

    bool eventFilter(QObject* watched, QEvent* event) override;

signals:
    /// After the drop, in the event loop. `place` is in twips on the canvas; nothing when it was
    /// the grid that they were dropped on.
    void dropped(const std::vector<reader::TableId>& tables, std::optional<QPoint> place);

private:
    DrawingArea& mArea;
};

} // namespace zandor::designer
