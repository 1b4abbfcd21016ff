#pragma once

#include <Zandor/comforts/Comforts.h>

#include <QPointer>
#include <QWidget>

#include <vector>

class QKeyEvent;

namespace zandor::platform::qt {

class CanvasLine;
class CanvasView;
class GridWidget;

/// The way of the keyboard through a control. Its stops are the tables in the order of their slots,
/// the join lines, the canvas where it has no lines, the grid and the home button; to the window
/// around it the control is a single stop.
class Navigation {
public:
    Navigation(QWidget& surface, CanvasView& view, const comforts::Comforts& comforts)
        : mSurface(&surface), mView(view), mComforts(comforts) {}

    void setGrid(GridWidget* grid);
    void setHomeButton(QWidget* button) { mHome = button; }

    /// Tab or Shift+Tab anywhere in the control. False when there is nowhere to go.
    bool goOn(bool next);
    /// The focus has come into the control by Tab or Shift+Tab.
    void enter(bool next);
    /// A key that none of the parts has taken. False when it means nothing here, either.
    bool keyPressed(const QKeyEvent& event);
    /// Whether a key has a meaning where the focus is, so that a shortcut of the host has to wait.
    bool claims(const QKeyEvent& event) const;

private:
    struct Stop {
        QWidget* widget;
        CanvasLine* line; ///< when the widget is the canvas
    };
    /// The stops before and after where the focus is; both outside when it is at no stop.
    struct Place {
        int previous;
        int next;
    };

    QWidget* focused() const;
    QWidget* grid() const;
    QWidget* editorAround(QWidget* widget) const;
    std::vector<Stop> stops() const;
    Place placeAmong(const std::vector<Stop>& all) const;
    void go(const Stop& stop, bool next);
    bool goOnInEditor(QWidget& editor, bool next);
    bool leave(bool next);
    bool changePane();
    bool scroll(const QKeyEvent& event);

    const QPointer<QWidget> mSurface; ///< goes before the rest, where the host takes it away
    CanvasView& mView;
    const comforts::Comforts& mComforts;
    QPointer<QWidget> mGrid;
    QPointer<QWidget> mHome;
    QPointer<QWidget> mLastTable; ///< that had the focus when F6 went to the grid
    // Where the control sent the focus on from a stop, Tab goes on from that stop all the same.
    QPointer<QWidget> mSentOnFrom;
    QPointer<QWidget> mSentOnTo;
};

} // namespace zandor::platform::qt
