#include <QAbstractButton>
#include <QAbstractItemView>
#include <QAccessible>
#include <QApplication>
#include <QDropEvent>
#include <QGenericPlugin>
#include <QMenu>
#include <QMimeData>
#include <QMouseEvent>
#include <QTextStream>
#include <QTimer>
#include <QWindow>

#include <memory>

// Somebody who sits before a program that has only its user's side: Qt loads the plug-in into it
// (QT_QPA_GENERIC_PLUGINS=visitor), so that nothing in the program is there for its test. Once the
// windows are on the screen he does what ZANDOR_VISIT says, one deed after another with "," between
// them, and closes them:
//
//   see                    everything that the windows say, as a screen reader has it
//   say PROPERTY           of each query designer
//   set PROPERTY NUMBER    of the first one
//   press NAME             the first button of that name
//   choose ENTRY X Y       an entry of the menu that a right click there opens; it is looked for by
//                          its text, "&" and all
//   where NAME             where a part of that name stands in the first one
//   drop X Y               the first row of the program's own list onto a place of the first one
//
// He knows the designer by its class's name alone, as the program may have its libraries in itself.

namespace {

QTextStream& out() {
    static QTextStream stream(stdout);
    return stream;
}

class Visitor : public QObject {
public:
    Visitor() {
        // As soon as there is an event loop; until all windows stand it asks again.
        connect(&mClock, &QTimer::timeout, this, [this] {
            if (windowsStand()) visit();
        });
        QMetaObject::invokeMethod(
            this, [this] { mClock.start(20); }, Qt::QueuedConnection);
    }

private:
    static bool windowsStand() {
        const auto windows = QGuiApplication::topLevelWindows();
        return !windows.isEmpty() && std::ranges::all_of(windows, [](const QWindow* window) {
            return !window->isVisible() || window->isExposed();
        });
    }

    void visit() {
        mClock.stop();
        const QStringList deeds =
            qEnvironmentVariable("ZANDOR_VISIT").split(',', Qt::SkipEmptyParts);
        for (const QString& deed : deeds) {
            QStringList words = deed.split(' ', Qt::SkipEmptyParts);
            const QString verb = words.takeFirst();
            if (!act(verb, words)) out() << "cannot " << deed << "\n";
            // What follows from it comes by the event loop.
            for (int n = 0; n < 3; ++n) QCoreApplication::processEvents();
        }
        out().flush();
        QApplication::closeAllWindows();
    }

    bool act(const QString& verb, const QStringList& words) {
        const auto designers = shown<QWidget>("ZandorWidget");
        if (verb == u"see") return see();
        if (designers.isEmpty() || words.isEmpty()) return false;
        if (verb == u"say") {
            for (const QWidget* designer : designers)
                out() << words[0] << " " << designer->property(words[0].toLatin1()).toString()
                      << "\n";
            return true;
        }
        if (verb == u"set")
            return designers[0]->setProperty(words[0].toLatin1(), words.at(1).toInt());
        if (verb == u"choose") return choose(*designers[0], words);
        if (verb == u"press") {
            const QString name = words.join(' ');
            for (auto* button : shown<QAbstractButton>("QAbstractButton"))
                if (button->accessibleName() == name || button->text() == name)
                    return button->click(), true;
            return false;
        }
        if (verb == u"where") {
            for (const auto* part : designers[0]->findChildren<QWidget*>())
                if (part->isVisible() && part->accessibleName() == words.join(' ')) {
                    const QPoint at = part->mapTo(designers[0], QPoint());
                    out() << part->accessibleName() << " at " << at.x() << " " << at.y() << "\n";
                    return true;
                }
            return false;
        }
        return verb == u"drop" && drop(*designers[0], {words[0].toInt(), words.at(1).toInt()});
    }

    template <class T>
    static QList<T*> shown(const char* kind) {
        QList<T*> found;
        for (QWidget* window : QApplication::topLevelWidgets()) {
            QList<T*> all = window->findChildren<T*>();
            if (auto* itself = qobject_cast<T*>(window)) all.prepend(itself);
            for (T* each : all)
                if (each->isVisible() && each->inherits(kind)) found.push_back(each);
        }
        return found;
    }

    static bool see() {
        for (QWidget* window : QApplication::topLevelWidgets())
            if (window->isVisible()) tell(QAccessible::queryAccessibleInterface(window));
        return true;
    }

    static void tell(QAccessibleInterface* one) {
        if (!one) return;
        const QString name = one->text(QAccessible::Name), value = one->text(QAccessible::Value);
        // A cell's name has its text in it, if there is one.
        const bool isEmptyCell = one->role() == QAccessible::Cell && !name.contains(u':');
        const bool isBlank = value.isEmpty() && (name.isEmpty() || isEmptyCell);
        if (!isBlank) out() << name << (value.isEmpty() ? "" : ": ") << value << "\n";
        for (int n = 0; n < one->childCount(); ++n) tell(one->child(n));
    }

    /// The menu stands open until somebody chooses from it.
    static bool choose(QWidget& designer, QStringList words) {
        const int Y = words.takeLast().toInt(), X = words.takeLast().toInt();
        const QPoint at(X, Y);
        bool found = false;
        QTimer::singleShot(200, &designer, [&found, text = words.join(' ')] {
            auto* const menu = qobject_cast<QMenu*>(QApplication::activePopupWidget());
            if (!menu) return;
            for (QAction* action : menu->actions()) {
                if (action->text() != text || !action->isEnabled()) continue;
                found = true;
                menu->setActiveAction(action);
                QKeyEvent enter(QEvent::KeyPress, Qt::Key_Return, {});
                QCoreApplication::sendEvent(menu, &enter);
                return;
            }
            menu->close();
        });
        QWidget* const part = designer.childAt(at);
        // As a click of the user's does.
        for (QWidget* focused = part; focused; focused = focused->parentWidget()) {
            if (!(focused->focusPolicy() & Qt::ClickFocus)) continue;
            focused->setFocus(Qt::MouseFocusReason);
            break;
        }
        const QPoint inside = part->mapFrom(&designer, at);
        for (const auto type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
            const bool down = type == QEvent::MouseButtonPress;
            QMouseEvent click(type, inside, part->mapToGlobal(inside), Qt::RightButton,
                              down ? Qt::RightButton : Qt::NoButton, {});
            QCoreApplication::sendEvent(part, &click);
        }
        return found;
    }

    /// As the window system brings it: to the window, which looks for whoever takes it.
    static bool drop(QWidget& designer, QPoint at) {
        for (const auto* list : shown<QAbstractItemView>("QAbstractItemView")) {
            if (designer.isAncestorOf(list)) continue;
            const std::unique_ptr<QMimeData> data(
                list->model()->mimeData({list->model()->index(0, 0)}));
            QWindow* const window = designer.window()->windowHandle();
            const QPoint place = designer.mapTo(designer.window(), at);
            QDragEnterEvent enter(place, Qt::CopyAction, data.get(), Qt::LeftButton, {});
            QCoreApplication::sendEvent(window, &enter);
            QDragMoveEvent move(place, Qt::CopyAction, data.get(), Qt::LeftButton, {});
            QCoreApplication::sendEvent(window, &move);
            if (!move.isAccepted()) return false;
            QDropEvent drop(place, Qt::CopyAction, data.get(), Qt::NoButton, {});
            QCoreApplication::sendEvent(window, &drop);
            return drop.isAccepted();
        }
        return false;
    }

    QTimer mClock;
};

class VisitorPlugin : public QGenericPlugin {
    Q_OBJECT
    Q_PLUGIN_METADATA(IID QGenericPluginFactoryInterface_iid FILE "visitor.json")

public:
    QObject* create(const QString& name, const QString&) override {
        return name == u"visitor" ? new Visitor : nullptr;
    }
};

} // namespace

#include "Visitor.moc"
