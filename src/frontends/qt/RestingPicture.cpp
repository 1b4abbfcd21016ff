#include "frontends/qt/RestingPicture.h"

#include "frontends/qt/OwnPixels.h"

#include <QChildEvent>
#include <QPaintEvent>

#include <utility>

namespace zandor::platform::qt {

namespace {

constexpr int paintingsAtRest = 2; ///< before it is worth while to keep a picture
constexpr int largest = 1 << 20;   ///< logical pixels of a box whose picture is kept

bool paintsAllOfItself(const QWidget& part) {
    return part.testAttribute(Qt::WA_OpaquePaintEvent) || part.autoFillBackground();
}

} // namespace

RestingPicture::RestingPicture(QWidget& box) : QObject(&box), mBox(box) { watch(box); }

void RestingPicture::watch(QWidget& part) {
    part.installEventFilter(this);
    for (QObject* child : part.children())
        if (auto* const inner = qobject_cast<QWidget*>(child)) watch(*inner);
}

void RestingPicture::drop() {
    mPaintings = 0;
    mPicture = QPixmap();
}

void RestingPicture::take() {
    if (!mPicture.isNull() || mPaintings < paintingsAtRest) return;
    const qreal scale = mBox.devicePixelRatioF();
    const QSizeF size = QSizeF(mBox.size()) * scale;
    if (!isWhole(size.width()) || !isWhole(size.height())) return;
    if (mBox.width() * mBox.height() > largest) return;
    QPixmap picture(size.toSize());
    picture.setDevicePixelRatio(scale);
    mPalette = mBox.palette();
    mTaking = true;
    mBox.render(&picture, {}, {}, QWidget::DrawChildren);
    mTaking = false;
    mPicture = picture;
}

bool RestingPicture::isRight() const {
    return !mPicture.isNull() && hasSameColours(mPalette, mBox.palette()) &&
           mPicture.devicePixelRatio() == mBox.devicePixelRatioF();
}

bool RestingPicture::eventFilter(QObject* watched, QEvent* event) {
    if (mTaking) return false;
    switch (event->type()) {
    case QEvent::Paint:
        if (!mPicture.isNull())
            return paint(static_cast<QWidget&>(*watched), static_cast<QPaintEvent&>(*event));
        // Not while the box itself is painted.
        if (watched == &mBox && ++mPaintings == paintingsAtRest)
            QMetaObject::invokeMethod(this, &RestingPicture::take, Qt::QueuedConnection);
        return false;
    case QEvent::Move:
    case QEvent::MouseMove:
    case QEvent::CursorChange:
        // A box that the mouse drags looks the same elsewhere; a part of it is another matter.
        if (watched == &mBox) return false;
        break;
    case QEvent::ChildAdded:
        if (auto* const part = qobject_cast<QWidget*>(static_cast<QChildEvent*>(event)->child()))
            watch(*part);
        break;
    default: break;
    }
    drop();
    return false;
}

/// False when the part has to paint itself.
bool RestingPicture::paint(QWidget& part, const QPaintEvent& event) {
    const bool isBox = &part == &mBox;
    // Whatever lets the box shine through is painted right after it.
    if (!isBox && !paintsAllOfItself(part)) return mShown;
    if (isBox) mShown = false;
    if (!isRight()) return false;
    const QPoint origin = part.mapFrom(&mBox, QPoint());
    QPainter painter(&part);
    if (!paintsOwnPixels(painter, part, origin)) return false;
    byRectangles(painter, event.region(),
                 [&](const QRect&) { painter.drawPixmap(origin, mPicture); });
    if (isBox) mShown = true;
    return true;
}

} // namespace zandor::platform::qt
