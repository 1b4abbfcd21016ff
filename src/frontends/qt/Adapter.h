#pragma once

#include "frontends/qt/FocusTracker.h"

#include <Zandor/qt/Twips.h>

#include <QLayout>
#include <QPointer>
#include <QVariant>
#include <QWidget>

#include <optional>

namespace zandor::platform::qt {

/// The part that a widget plays in a container that lays its children out itself.
enum class Role { label, field, button, frame };

/// A constituent control that is a widget.
class WidgetHolder {
public:
    virtual ~WidgetHolder() = default;
    virtual QWidget* widget() const = 0;
    /// Takes a new child into the container's layout; a container without one leaves it alone.
    virtual void place(QWidget* child, Role role) {
        Q_UNUSED(child)
        Q_UNUSED(role)
    }
};

/// Says which control a widget belongs to, for whoever starts from the widget.
inline constexpr char controlProperty[] = "zandorControl";

/// A control of the platform interfaces over a widget. The widget lives in Qt's tree of parents
/// and may go before its adapter; it goes with it at the latest.
template <class Interface, class W>
class Adapter : public Interface, public WidgetHolder {
public:
    Adapter(W* widget, FocusTracker& focus) : mWidget(widget), mFocus(focus) {
        widget->setProperty(controlProperty,
                            QVariant::fromValue(static_cast<void*>(static_cast<Control*>(this))));
    }

    ~Adapter() override { dropWidget(); }

    QWidget* widget() const override { return mWidget; }

    Bounds bounds() const override {
        if (mBounds) return *mBounds;
        return mWidget ? toTwips(mWidget->geometry()) : Bounds();
    }

    void setBounds(const Bounds& bounds) override {
        mBounds = bounds;
        if (mWidget && !laidOut()) mWidget->setGeometry(toPixels(bounds));
    }

protected:
    /// Lets the widget go.
    void dropWidget() {
        const QPointer<W> widget = std::exchange(mWidget, nullptr);
        if (!widget) return;
        widget->setProperty(controlProperty, QVariant());
        widget->setObjectName(QString());
        mFocus.forget(widget);
        mFocus.release(widget);
        if (!widget) return;
        widget->hide();
        widget->blockSignals(true);
        // The widget may be in the middle of the very event that ends it.
        widget->deleteLater();
    }

    /// The container's layout places the widget, not the control.
    bool laidOut() const {
        const QWidget* parent = mWidget ? mWidget->parentWidget() : nullptr;
        return mWidget && !mWidget->isWindow() && parent && parent->layout();
    }

    /// Hidden or disabled widgets give the focus away first, so that Qt does not hand it to
    /// whatever follows in the tab order.
    void show(bool value) {
        if (!mWidget) return;
        if (!value) mFocus.release(mWidget);
        mWidget->setVisible(value);
    }

    void enable(bool value) {
        if (!mWidget || mWidget->isEnabled() == value) return;
        if (!value) mFocus.release(mWidget);
        mWidget->setEnabled(value);
    }

    QPointer<W> mWidget;
    FocusTracker& mFocus;
    std::optional<Bounds> mBounds;
};

} // namespace zandor::platform::qt
