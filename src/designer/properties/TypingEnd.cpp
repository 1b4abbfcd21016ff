#include "designer/properties/TypingEnd.h"

#include <QApplication>
#include <QKeyEvent>
#include <QWidget>

namespace zandor::designer {

namespace {

/// Keys that text is not made of.
bool isCommand(const QKeyEvent& key) {
    const bool functionKey = key.key() >= Qt::Key_F1 && key.key() <= Qt::Key_F35;
    return functionKey || (key.modifiers() & (Qt::ControlModifier | Qt::AltModifier));
}

/// What the text knows itself, its own undoing among it.
bool isOfText(QKeyEvent& key) {
    for (const auto own : {QKeySequence::Copy, QKeySequence::Cut, QKeySequence::Paste,
                           QKeySequence::SelectAll, QKeySequence::Undo, QKeySequence::Redo})
        if (key.matches(own)) return true;
    return false;
}

} // namespace

TypingEnd::TypingEnd(QWidget& panel, std::function<void()> ended)
    : QObject(&panel), mPanel(panel), mEnded(std::move(ended)) {
    qApp->installEventFilter(this);
    connect(qApp, &QApplication::focusChanged, this, [this](QWidget* before, QWidget* now) {
        // Neither another window nor a list of the panel's own takes the keyboard for good.
        const QWidget* const list = QApplication::activePopupWidget();
        if (!now || (list && isOwn(list))) return;
        if (before && mPanel.isAncestorOf(before)) mEnded();
    });
}

/// A part of the panel, or a list that belongs to one.
bool TypingEnd::isOwn(const QWidget* part) const {
    while (part && part != &mPanel)
        part = part->parentWidget() ? part->parentWidget() : part->focusProxy();
    return part;
}

bool TypingEnd::isTyping() const {
    const QWidget* const focus = QApplication::focusWidget();
    return focus && mPanel.isAncestorOf(focus);
}

bool TypingEnd::eventFilter(QObject* watched, QEvent* event) {
    if (event->type() == QEvent::ShortcutOverride) {
        auto* const key = static_cast<QKeyEvent*>(event);
        if (watched == QApplication::focusWidget() && isTyping() && isCommand(*key) &&
            !isOfText(*key))
            mEnded();
    } else if (event->type() == QEvent::MouseButtonPress || event->type() == QEvent::Close) {
        const auto* const at = qobject_cast<QWidget*>(watched);
        if (at && at->window() == mPanel.window() && !mPanel.isAncestorOf(at) && isTyping())
            mEnded();
    }
    return false;
}

} // namespace zandor::designer
