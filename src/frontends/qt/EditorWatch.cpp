#include "frontends/qt/EditorWatch.h"

#include <QApplication>
#include <QEvent>
#include <QPointer>

namespace zandor::platform::qt {

EditorWatch::EditorWatch(QWidget& editor, std::function<void()> left)
    : QObject(&editor), mEditor(editor), mLeft(std::move(left)) {
    editor.installEventFilter(this);
    connect(qApp, &QApplication::focusChanged, this,
            [this](const QWidget* from, const QWidget* to) {
                if (isInside(from) && to && !isInside(to) && to->window() == mEditor.window())
                    mLeft();
            });
}

bool EditorWatch::isInside(const QWidget* widget) const {
    return widget && (widget == &mEditor || mEditor.isAncestorOf(widget));
}

bool EditorWatch::leaves(QObject* watched, const QEvent& event) const {
    // A shortcut comes to an action, which belongs to no window.
    if (event.type() == QEvent::Shortcut) return mEditor.window()->isActiveWindow();
    const auto* const widget = qobject_cast<const QWidget*>(watched);
    if (!widget || widget->window() != mEditor.window()) return false;
    return event.type() == QEvent::Close ? widget->isWindow() : !isInside(widget);
}

bool EditorWatch::eventFilter(QObject* watched, QEvent* event) {
    switch (event->type()) {
    case QEvent::Show:
        // The whole application's events pass by only while the editor is open.
        if (watched == &mEditor) qApp->installEventFilter(this);
        break;
    case QEvent::Hide:
        if (watched == &mEditor) qApp->removeEventFilter(this);
        break;
    case QEvent::MouseButtonPress:
    case QEvent::Shortcut:
    case QEvent::Close: {
        if (!leaves(watched, *event)) break;
        // What comes of it may end whoever was to get the event.
        const QPointer<QObject> alive = watched;
        mLeft();
        if (!alive) return true;
        break;
    }
    default: break;
    }
    return false;
}

} // namespace zandor::platform::qt
