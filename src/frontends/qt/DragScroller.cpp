#include "frontends/qt/DragScroller.h"

#include <algorithm>

namespace zandor::platform::qt {

namespace {

constexpr int edge = 20; ///< logical pixels
constexpr int milliseconds = 60;

int direction(int at, int low, int high) {
    // In a small view something remains between the two edges.
    const int reach = std::min(edge, (high - low) / 4);
    return at < low + reach ? -1 : at > high - reach ? 1 : 0;
}

} // namespace

DragScroller::DragScroller(Qt::Orientations ways, Step step) : mWays(ways), mStep(std::move(step)) {
    mTimer.setInterval(milliseconds);
    connect(&mTimer, &QTimer::timeout, this, [this] { mStep(mDirection); });
}

bool DragScroller::hover(QPoint at, const QRect& view) {
    mDirection = {};
    if (view.contains(at)) {
        if (mWays & Qt::Horizontal) mDirection.setX(direction(at.x(), view.left(), view.right()));
        if (mWays & Qt::Vertical) mDirection.setY(direction(at.y(), view.top(), view.bottom()));
    }
    if (mDirection.isNull())
        stop();
    else if (!mTimer.isActive())
        mTimer.start();
    return !mDirection.isNull();
}

} // namespace zandor::platform::qt
