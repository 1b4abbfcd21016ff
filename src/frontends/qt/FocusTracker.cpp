#include "frontends/qt/FocusTracker.h"

#include <Zandor/platform/RuntimeError.h>

#include <QFocusEvent>
#include <QWidget>

namespace zandor::platform::qt {

FocusTracker::FocusTracker(QWidget& surface) : mSurface(&surface) {}

void FocusTracker::watch(QWidget* widget, const std::function<void()>& gotFocus) {
    mNotices.insert(widget, gotFocus);
    widget->installEventFilter(this);
    connect(widget, &QObject::destroyed, this, [this](QObject* gone) { mNotices.remove(gone); });
}

void FocusTracker::forget(QWidget* widget) {
    mNotices.remove(widget);
    widget->removeEventFilter(this);
    if (mOwner == widget) mOwner = nullptr;
}

void FocusTracker::take(QWidget* widget) {
    if (!widget || !widget->isVisible() || !widget->isEnabled())
        throw errors::invalidProcedureCall();
    if (mHolds) {
        mTaker = widget;
        return;
    }
    const QPointer<QWidget> alive = widget;
    widget->setFocus(Qt::OtherFocusReason);
    if (alive && mNotices.contains(widget) && widget->window()->focusWidget() == widget)
        enter(widget);
}

void FocusTracker::release(QWidget* widget) {
    if (!mSurface) return;
    const QWidget* focused = mSurface->window()->focusWidget();
    if (!focused || (focused != widget && !widget->isAncestorOf(focused))) return;
    const bool toFallback = mFallback && mFallback->isVisible() && mFallback != widget &&
                            !widget->isAncestorOf(mFallback);
    (toFallback ? mFallback : mSurface)->setFocus(Qt::OtherFocusReason);
}

bool FocusTracker::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::FocusIn) {
        enter(static_cast<QWidget*>(watched));
    } else if (event->type() == QEvent::FocusOut) {
        const auto reason = static_cast<QFocusEvent*>(event)->reason();
        if (watched == mOwner && reason != Qt::ActiveWindowFocusReason &&
            reason != Qt::PopupFocusReason)
            mOwner = nullptr;
    }
    return QObject::eventFilter(watched, event);
}

void FocusTracker::enter(QWidget* widget) {
    if (mOwner == widget) return;
    mOwner = widget;
    const auto notice = mNotices.value(widget);
    if (notice) notice();
}

} // namespace zandor::platform::qt
