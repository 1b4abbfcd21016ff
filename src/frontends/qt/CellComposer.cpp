#include "frontends/qt/CellComposer.h"

#include <QCoreApplication>
#include <QInputMethodEvent>
#include <QLineEdit>

#include <utility>

namespace zandor::platform::qt {

bool CellComposer::begin(const std::function<void()>& open) {
    // What it opens may end the control, and this with it.
    const QPointer<FocusTracker> focus = &mFocus;
    focus->hold();
    open();
    if (!focus) return false;
    focus->letGo();
    mBox = focus->taker();
    const auto* const line = qobject_cast<const QLineEdit*>(mBox.data());
    mBefore = line ? line->text() : QString();
    if (mBox) mBox->installEventFilter(this);
    return mBox;
}

void CellComposer::goOn(QInputMethodEvent& event) {
    QCoreApplication::sendEvent(mBox, &event);
    if (!event.preeditString().isEmpty() || !mBox) return;
    QWidget* const box = std::exchange(mBox, nullptr);
    if (event.commitString().isEmpty()) giveUp(*box);
    if (box->isVisible()) mFocus.take(box);
}

void CellComposer::breakOff() {
    if (QWidget* const box = std::exchange(mBox, nullptr)) giveUp(*box);
}

bool CellComposer::eventFilter(QObject* watched, QEvent* event) {
    if (watched == mBox && event->type() == QEvent::Hide) mBox = nullptr;
    return false;
}

/// Where nothing has been composed yet, the cell has what it had.
void CellComposer::giveUp(QWidget& box) const {
    auto* const line = qobject_cast<QLineEdit*>(&box);
    if (!line || !line->text().isEmpty()) return;
    line->setText(mBefore);
    line->selectAll();
}

void CellComposer::answer(QInputMethodQueryEvent& query, const QWidget& asked) const {
    for (std::uint32_t bit = 1; bit != 0; bit <<= 1) {
        const auto one = static_cast<Qt::InputMethodQuery>(bit);
        if (!query.queries().testFlag(one)) continue;
        QVariant value = mBox->inputMethodQuery(one);
        if (one == Qt::ImEnabled) value = true;
        if (value.typeId() == QMetaType::QRect) {
            const QRect place = value.toRect();
            value = QRect(asked.mapFromGlobal(mBox->mapToGlobal(place.topLeft())), place.size());
        }
        query.setValue(one, value);
    }
    query.accept();
}

} // namespace zandor::platform::qt
