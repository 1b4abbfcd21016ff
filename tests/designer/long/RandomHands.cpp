#include "RandomHands.h"

#include "support/QtHands.h"

#include <QAction>
#include <QDialog>
#include <QDialogButtonBox>
#include <QFileDialog>
#include <QMenu>
#include <QMenuBar>
#include <QMessageBox>
#include <QPushButton>
#include <QTimer>

namespace {

constexpr int patience = 8; ///< looks at a dialog before it is left

bool isReady(const QWidget& widget) {
    return widget.isVisible() && widget.isEnabled() && widget.width() > 2 && widget.height() > 2;
}

} // namespace

RandomHands::RandomHands(QWidget& window, unsigned seed) : mWindow(window), mEngine(seed) {
    lookSoon();
}

void RandomHands::act() {
    ++mDone;
    const int what = below(100);
    if (what < 55)
        useMouse(mWindow);
    else if (what < 85)
        useKeys(mWindow);
    else
        chooseCommand();
    for (int n = 0; n < 2; ++n) {
        QCoreApplication::processEvents();
        QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    }
}

/// Each time by a timer of its own: one does not go off again while what it began goes on.
void RandomHands::lookSoon() {
    QTimer::singleShot(1, &mLooking, [this] { look(); });
}

/// Whether something stands in the way, and if so does something about it.
void RandomHands::look() {
    lookSoon();
    if (auto* const popup = QApplication::activePopupWidget()) return chooseIn(*popup);
    if (auto* const dialog = QApplication::activeModalWidget()) return answer(*dialog);
    mHeldUp = 0;
    if (chance(20)) QDrag::cancel();
}

void RandomHands::useMouse(QWidget& in) {
    QList<QWidget*> ready;
    for (QWidget* each : in.findChildren<QWidget*>())
        if (isReady(*each) && each->window() == &in) ready << each;
    if (ready.isEmpty()) return;
    const QPointer<QWidget> on = ready[below(static_cast<int>(ready.size()))];
    const QPoint at(below(on->width()), below(on->height()));
    const auto button = chance(20) ? Qt::RightButton : Qt::LeftButton;
    const auto held = chance(10)   ? Qt::ControlModifier
                      : chance(10) ? Qt::ShiftModifier
                                   : Qt::NoModifier;
    hands::mouse(*on, QEvent::MouseButtonPress, at, button, button, held);
    QPoint to = at;
    if (on && chance(30)) {
        for (int n = 0; n < 4 && on; ++n) {
            to += QPoint(below(81) - 40, below(81) - 40);
            hands::mouse(*on, QEvent::MouseMove, to, Qt::NoButton, button, held);
        }
    }
    if (on) hands::mouse(*on, QEvent::MouseButtonRelease, to, button, Qt::NoButton, held);
    if (on && button == Qt::RightButton) {
        QContextMenuEvent menu(QContextMenuEvent::Mouse, at, on->mapToGlobal(at));
        QCoreApplication::sendEvent(on, &menu);
    }
    if (!on || button != Qt::LeftButton || !chance(40)) return;
    hands::mouse(*on, QEvent::MouseButtonDblClick, to, button, button, held);
    if (on) hands::mouse(*on, QEvent::MouseButtonRelease, to, button, Qt::NoButton, held);
}

void RandomHands::useKeys(QWidget& in) {
    static constexpr int keys[] = {
        Qt::Key_Left,    Qt::Key_Right, Qt::Key_Up,     Qt::Key_Down, Qt::Key_Tab,
        Qt::Key_Backtab, Qt::Key_Enter, Qt::Key_Escape, Qt::Key_Home, Qt::Key_End,
        Qt::Key_Delete,  Qt::Key_Space, Qt::Key_F2,     Qt::Key_F6,   Qt::Key_Backspace,
    };
    static constexpr char letters[] = "abcxyz019 =<>'*#.()-";
    QWidget* const focused = QApplication::focusWidget();
    QWidget& on = focused && focused->window() == &in ? *focused : in;
    if (chance(40)) {
        const char letter = letters[below(sizeof letters - 1)];
        return hands::key(on, QChar(letter).toUpper().unicode(), QString(QChar(letter)));
    }
    const auto held = chance(15)   ? Qt::ControlModifier
                      : chance(15) ? Qt::ShiftModifier
                                   : Qt::NoModifier;
    hands::key(on, keys[below(std::size(keys))], {}, held);
}

bool RandomHands::mayBeChosen(const QAction& action) {
    // What ends the window, or leaves it for another program.
    static const QStringList never = {QStringLiteral("quit"), QStringLiteral("close"),
                                      QStringLiteral("manual"), QStringLiteral("website")};
    return action.isEnabled() && !action.isSeparator() && !action.menu() &&
           !never.contains(action.objectName());
}

void RandomHands::chooseCommand() {
    QList<QAction*> offered;
    for (QAction* each : mWindow.findChildren<QAction*>())
        if (mayBeChosen(*each) && !each->objectName().isEmpty()) offered << each;
    if (!offered.isEmpty()) offered[below(static_cast<int>(offered.size()))]->trigger();
}

void RandomHands::chooseIn(QWidget& popup) {
    auto* const menu = qobject_cast<QMenu*>(&popup);
    if (!menu || mLeaving || chance(40)) {
        popup.close();
        return;
    }
    const QList<QAction*> entries = menu->actions();
    QAction* const chosen =
        entries.isEmpty() ? nullptr : entries[below(static_cast<int>(entries.size()))];
    if (chosen && mayBeChosen(*chosen))
        hands::click(*menu, menu->actionGeometry(chosen).center());
    else
        menu->close();
}

void RandomHands::answer(QWidget& dialog) {
    if (mLeaving)
        for (auto* const box : dialog.findChildren<QDialogButtonBox*>())
            if (auto* const discard = box->button(QDialogButtonBox::Discard))
                return discard->click();
    if (mLeaving || ++mHeldUp > patience || qobject_cast<QFileDialog*>(&dialog)) {
        mHeldUp = 0;
        auto* const asking = qobject_cast<QDialog*>(&dialog);
        asking ? asking->reject() : static_cast<void>(dialog.close());
    } else if (chance(50)) {
        useMouse(dialog);
    } else {
        useKeys(dialog);
    }
}
