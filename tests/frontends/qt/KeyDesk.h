#pragma once

#include "frontends/qt/CanvasItems.h"
#include "frontends/qt/Desk.h"
#include "frontends/qt/QtToolkit.h"

#include <QLineEdit>
#include <QMenu>
#include <QVBoxLayout>

/// The menus that open, and what becomes of them.
class Menus : public QObject {
public:
    Menus() { qApp->installEventFilter(this); }

    bool eventFilter(QObject* watched, QEvent* event) override {
        auto* menu = event->type() == QEvent::Show ? qobject_cast<QMenu*>(watched) : nullptr;
        if (!menu) return false;
        ++opened;
        font = menu->font();
        enabled.clear();
        for (const QAction* action : menu->actions())
            if (action->isEnabled() && action->isVisible() && !action->isSeparator())
                enabled += action->objectName();
        QTimer::singleShot(0, menu, [this, menu] {
            at = menu->pos();
            const QAction* const active = menu->activeAction();
            highlighted = active ? active->objectName() : QString();
            for (QAction* action : menu->actions())
                if (action->objectName() == choice) menu->setActiveAction(action);
            hands::key(*menu, choice.isEmpty() ? Qt::Key_Escape : Qt::Key_Return);
        });
        return false;
    }

    QString choice; ///< the entry that the user takes; empty: none
    int opened = 0;
    QStringList enabled;
    QString highlighted; ///< the entry that Enter would take
    QPoint at;
    QFont font;
};

/// The control in a host's window, between two fields of the host's, and a user without a mouse.
class KeyDesk : public Desk {
protected:
    KeyDesk() {
        auto* column = new QVBoxLayout(&host);
        column->setContentsMargins(0, 0, 0, 0);
        column->addWidget(&before);
        column->addWidget(widget.get());
        column->addWidget(&after);
        before.setObjectName("before");
        after.setObjectName("after");
        host.resize(900, 700);
        host.show();
        host.activateWindow();
        waitForKeyboard(host);
        bind();
        before.setFocus();
    }

    ~KeyDesk() override { widget.reset(); }

    void press(int key, Qt::KeyboardModifiers held = {}, const QString& text = {}) {
        hands::key(*host.focusWidget(), key, text, held);
        calm();
    }
    void menuKey() {
        hands::menuKey(host);
        calm();
    }
    /// Lets queued work run, and the window be the active one again after a menu.
    void calm() {
        settle();
        if (host.isActiveWindow()) return;
        host.activateWindow();
        settle();
    }
    void repeat(int key, int times) {
        while (times-- > 0) press(key);
    }
    void tab() { press(Qt::Key_Tab); }
    void backtab() { press(Qt::Key_Backtab, Qt::ShiftModifier); }

    zandor::platform::qt::Canvas& canvas() {
        return child<zandor::platform::qt::Canvas>("fraTable");
    }

    /// Where the focus is: the name of the constituent, of the join line, of the host's field.
    QString focus() {
        QWidget* at = host.focusWidget();
        if (at == &canvas() && canvas().currentLine()) return canvas().currentLine()->name();
        while (at && at->objectName().isEmpty()) at = at->parentWidget();
        // Names that Qt gives to the parts of its own widgets are of no interest.
        while (at && at->objectName().startsWith("qt_")) at = at->parentWidget();
        return at ? at->objectName() : QString();
    }

    /// Gives the focus to a stop of the control by as many presses of Tab as it takes.
    void tabTo(const QString& name) {
        before.setFocus();
        for (int i = 0; i < 30 && focus() != name; ++i) tab();
        ASSERT_EQ(focus(), name);
    }

    QStringList selected(int index) {
        QStringList texts;
        for (const auto& at : table(index).list().selectionModel()->selectedRows())
            texts += at.data().toString();
        texts.sort();
        return texts;
    }

    /// Counts a signal of the widget from now on.
    template <class Signal>
    std::shared_ptr<int> count(Signal signal) {
        auto counted = std::make_shared<int>(0);
        QObject::connect(widget.get(), signal, [counted] { ++*counted; });
        return counted;
    }

    QWidget host;
    QLineEdit before, after;
    Menus menus;
};
