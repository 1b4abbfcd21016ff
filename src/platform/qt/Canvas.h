#pragma once

#include "platform/Intrinsic.h"

#include <QWidget>

#include <vector>

class QScrollBar;

namespace platform::qt {

class CanvasItem;

/// The drawing surface: paints lines and marks, which are no widgets, and holds the table lists.
class Canvas : public QWidget {
public:
    explicit Canvas(QWidget* parent);
    ~Canvas() override;

    void setEvents(FrameEvents events) { mEvents = std::move(events); }

    void add(CanvasItem& item);
    void remove(CanvasItem& item);
    const std::vector<CanvasItem*>& items() const { return mItems; }

protected:
    void paintEvent(QPaintEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    std::vector<CanvasItem*> mItems; ///< lines before marks
    FrameEvents mEvents;
};

} // namespace platform::qt
