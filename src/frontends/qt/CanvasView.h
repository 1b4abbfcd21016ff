#pragma once

#include <Zandor/comforts/Comforts.h>

#include <QPoint>
#include <QPointer>
#include <QRect>
#include <QScrollBar>
#include <QString>

#include <functional>

class QMimeData;
class QWheelEvent;

namespace zandor::platform::qt {

class Canvas;
class CanvasLine;
class CanvasWindow;
class DragSession;
class KeyboardMenu;

/// What shows the canvas: the window and the scroll bars that move it behind that, and the services
/// that it has from the control around it.
class CanvasView {
public:
    using Namer = std::function<QString(const CanvasLine&)>;

    CanvasView(KeyboardMenu& menu, DragSession& drags, const comforts::Comforts& comforts)
        : mMenu(menu), mDrags(drags), mComforts(comforts) {}

    void setCanvas(Canvas* canvas, CanvasWindow* window);
    void setBar(QScrollBar* bar);
    /// Makes the spoken names of join lines.
    void setNamer(Namer namer) { mNamer = std::move(namer); }

    Canvas* canvas() const;
    KeyboardMenu& menu() const { return mMenu; }
    QString nameOf(const CanvasLine& line) const { return mNamer ? mNamer(line) : QString(); }
    bool readsJoins() const { return mComforts.flags().ReadsJoins; }
    /// Whether the data are those of a drag within this control.
    bool carries(const QMimeData* data) const;

    /// The part of the canvas that is not scrolled away, in its own coordinates; also the part that
    /// the grid or the host's window cuts off is not in it.
    QRect seen() const;
    /// Scrolls by logical pixels, as far as the bars go.
    void scrollBy(QPoint way);
    void scrollByWheel(QWheelEvent& event);
    /// One step of the keyboard, of a drag at the edge.
    void scrollByStep(QPoint direction) { scrollBy(direction * step); }
    /// Scrolls as little as shows a place of the canvas; of one larger than the view its beginning.
    void reveal(const QRect& place);

private:
    static constexpr int step = 16;

    KeyboardMenu& mMenu;
    DragSession& mDrags;
    const comforts::Comforts& mComforts;
    QPointer<QWidget> mCanvas;
    QPointer<QWidget> mWindow;
    QPointer<QScrollBar> mAcross;
    QPointer<QScrollBar> mDown;
    Namer mNamer;
};

} // namespace zandor::platform::qt
