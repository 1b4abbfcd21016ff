#include "frontends/qt/DragSession.h"

#include "frontends/qt/ShownText.h"

#include <QDrag>
#include <QGuiApplication>
#include <QMetaObject>
#include <QMimeData>
#include <QPainter>
#include <QUuid>
#include <QWidget>

#include <algorithm>

namespace zandor::platform::qt {

namespace {

constexpr char columnsMimeType[] = "application/x-talvik-zandor-columns";

/// A barred circle, legible on light and on dark; Qt takes pictures only for the cursors of a drag
/// over a place that takes drops.
QPixmap forbiddenCursor() {
    constexpr int side = 20;
    const qreal ratio = qApp->devicePixelRatio();
    QPixmap pixmap(QSize(side, side) * ratio);
    pixmap.setDevicePixelRatio(ratio);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    const QRectF circle(4, 4, side - 8, side - 8);
    const QPointF reach(circle.width() * 0.354, circle.width() * 0.354);
    for (const auto& [colour, width] : {std::pair{Qt::white, 5.0}, std::pair{Qt::darkRed, 2.5}}) {
        painter.setPen(QPen(colour, width));
        painter.drawEllipse(circle);
        painter.drawLine(circle.center() - reach, circle.center() + reach);
    }
    return pixmap;
}

} // namespace

DragSession::DragSession()
    : mIdentity(QUuid::createUuid().toRfc4122()),
      mCarrier([](QDrag& drag) { drag.exec(Qt::CopyAction); }) {}

void DragSession::request(QWidget* widget, Control* source, const QStringList& names) {
    if (mRunning) return;
    mRequestedBy = widget;
    mSource = source;
    mNames = names;
    // For a request that no mouse handler of ours follows up.
    QMetaObject::invokeMethod(
        this,
        [this] {
            if (QGuiApplication::mouseButtons() & Qt::LeftButton)
                runRequested();
            else
                mRequestedBy = nullptr; // the button has come up in between
        },
        Qt::QueuedConnection);
}

void DragSession::runRequested() {
    if (mRunning || !mRequestedBy) return;
    QWidget* const widget = std::exchange(mRequestedBy, nullptr);
    if (!mSource) return;

    const std::shared_ptr<void> kept = mKeeper.lock();
    const QPointer<DragSession> alive = this;
    mRunning = true;
    mGivenUp = false;
    const QPointer<QDrag> drag = new QDrag(widget);
    mDrag = drag;
    auto* data = new QMimeData;
    data->setData(QLatin1String(columnsMimeType), mIdentity);
    drag->setMimeData(data);
    drag->setPixmap(picture(*widget, mNames));
    drag->setHotSpot({-12, -8});
    mCarrier(*drag);
    if (drag) drag->deleteLater();
    if (!alive) return;
    mRunning = false;
    if (const auto deliver = std::exchange(mDrop, nullptr); deliver && mSource) deliver(!mGivenUp);
    if (alive) mSource = nullptr;
}

void DragSession::cancel() {
    mSource = nullptr;
    mRequestedBy = nullptr;
    if (mDrag) QDrag::cancel();
}

void DragSession::giveUp(const Control* source) {
    if (!source || mSource != source) return;
    mRequestedBy = nullptr;
    mGivenUp = true;
    // While it runs the source stays, until the drag has left what it is over.
    if (!mRunning) mSource = nullptr;
    if (mDrag) QDrag::cancel();
}

void DragSession::forget(const Control* source) {
    if (mSource == source) mSource = nullptr;
}

bool DragSession::accepts(const QMimeData* data) const {
    return mRunning && !mGivenUp && mSource && data &&
           data->data(QLatin1String(columnsMimeType)) == mIdentity;
}

void DragSession::showWhetherDropCounts(bool counts) {
    if (mDrag) mDrag->setDragCursor(counts ? QPixmap() : forbiddenCursor(), Qt::CopyAction);
}

QPixmap DragSession::picture(const QWidget& widget, const QStringList& names) {
    constexpr int margin = 6;
    constexpr int most = 8;
    constexpr int widest = 260;
    QStringList lines = names.mid(0, most);
    if (names.size() > most) lines += QStringLiteral("\u2026");
    const QFontMetrics metrics = widget.fontMetrics();
    int width = 0;
    for (QString& line : lines) {
        line = metrics.elidedText(asSigns(line), Qt::ElideRight, widest);
        width = std::max(width, metrics.horizontalAdvance(line));
    }
    const QSize size(width + 2 * margin,
                     static_cast<int>(lines.size()) * metrics.lineSpacing() + margin);
    const qreal ratio = widget.devicePixelRatioF();
    QPixmap pixmap(size * ratio);
    pixmap.setDevicePixelRatio(ratio);
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setFont(widget.font());
    painter.setPen(widget.palette().color(QPalette::Highlight));
    painter.setBrush(widget.palette().color(QPalette::Base));
    painter.drawRoundedRect(QRectF(QPointF(), size).adjusted(0.5, 0.5, -0.5, -0.5), 3, 3);
    painter.setPen(widget.palette().color(QPalette::Text));
    painter.drawText(QRect(QPoint(), size).adjusted(margin, margin / 2, -margin, -margin / 2),
                     Qt::AlignLeft | Qt::AlignVCenter, lines.join(u'\n'));
    return pixmap;
}

} // namespace zandor::platform::qt
