#pragma once

#include <QHash>
#include <QObject>
#include <QPointer>
#include <QWidget>

#include <functional>

namespace zandor::platform::qt {

/// Which constituent control has the focus, as the control understands it: a message box or
/// another window in front takes no focus away, and its closing gives none back.
class FocusTracker : public QObject {
public:
    explicit FocusTracker(QWidget& surface);

    /// Calls `gotFocus` whenever the focus comes to the widget from another one.
    void watch(QWidget* widget, const std::function<void()>& gotFocus);

    /// Nobody is told about the widget any more.
    void forget(QWidget* widget);

    /// Gives the widget the focus; error 5 when it is hidden or disabled. A window that is not the
    /// active one (a message box has just closed) gets the notice all the same, and at once.
    void take(QWidget* widget);

    /// From now on the focus stays where it is; who takes it is remembered.
    void hold() { mHolds = true, mTaker = nullptr; }
    /// Who has taken the focus since it is held; nobody: nullptr.
    QWidget* taker() const { return mTaker; }
    void letGo() { mHolds = false; }

    /// Whether there is a focus to be had: not before the control's window is shown, nor after it
    /// was closed.
    bool onScreen() const { return mSurface && mSurface->isVisible(); }

    /// If the focus is inside the widget, moves it to the fallback, or else to the control's own
    /// surface; nobody is told.
    void release(QWidget* widget);

    /// Where the focus goes from a control that is hidden, while the fallback is visible itself.
    void setFallback(QWidget* widget) { mFallback = widget; }

    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    void enter(QWidget* widget);

    const QPointer<QWidget> mSurface;
    QPointer<QWidget> mFallback;
    QPointer<QWidget> mOwner;
    QPointer<QWidget> mTaker;
    bool mHolds = false;
    QHash<QObject*, std::function<void()>> mNotices;
};

} // namespace zandor::platform::qt
