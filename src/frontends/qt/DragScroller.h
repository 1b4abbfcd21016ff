#pragma once

#include <QObject>
#include <QPoint>
#include <QRect>
#include <QTimer>

#include <functional>

namespace zandor::platform::qt {

/// Scrolls a view while a drag hovers near one of its edges.
class DragScroller : public QObject {
public:
    /// One step across and down, -1, 0 or 1 each.
    using Step = std::function<void(QPoint direction)>;

    DragScroller(Qt::Orientations ways, Step step);

    /// The drag is at a point; the view is given in the same coordinates. True near an edge.
    bool hover(QPoint at, const QRect& view);
    void stop() { mTimer.stop(); }

private:
    const Qt::Orientations mWays;
    const Step mStep;
    QPoint mDirection;
    QTimer mTimer;
};

} // namespace zandor::platform::qt
