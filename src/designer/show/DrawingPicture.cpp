#include "designer/show/DrawingPicture.h"

#include "designer/canvasSize.h"

#include <QAbstractItemView>
#include <QBuffer>
#include <QImage>
#include <QPainter>
#include <QSvgGenerator>
#include <QSvgRenderer>

namespace designer {

namespace {

/// Room for the control's scroll bars, which are not part of the picture.
constexpr QSize besideCanvas(60, 60);
constexpr int pixelsPerInch = 96; // of logical pixels

} // namespace

DrawingPicture::DrawingPicture(const model::Query& query, const QVariantMap& options)
    : mControl(std::make_unique<ZandorWidget>(mLibrary)) {
    // A copy, for the control notes in its model what it shows and selects.
    const auto copy = model::Query::restored(query.record());
    mSize = pixels(canvasNeeded(*copy));
    mControl->setAttribute(Qt::WA_DontShowOnScreen);
    mControl->setDebugSwitch(0);
    for (auto option = options.begin(); option != options.end(); ++option)
        mControl->setProperty(option.key().toLatin1().constData(), option.value());
    mControl->setDebugSwitch(0); // a picture is no place for boxes
    mControl->resize(mSize + besideCanvas);
    mControl->setMXHorzFrameSize(twips(mControl->width()));
    mControl->setMXVertFrameSize(twips(mControl->height()));
    mControl->setOnlyJoin(true);
    mControl->setModel(copy);
    mControl->show();
    showWholeRows(*copy);
}

DrawingPicture::~DrawingPicture() = default;

/// SVG knows no clipping: an entry that a list shows half of would stand over the list's edge. So
/// lists that are too long for their entries end with a whole one.
void DrawingPicture::showWholeRows(model::Query& query) {
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(query.Tables()))
        for (const auto* list : mControl->findChildren<QAbstractItemView*>()) {
            const QRect box = list->parentWidget()->geometry();
            if (box.topLeft() != QPoint(table->Left(), table->Top()) / twipsPerPixel) continue;
            const int row = list->sizeHintForRow(0);
            const int height = list->viewport()->height();
            if (row > 0 && list->model()->rowCount() * row > height)
                table->Height(static_cast<float>(table->Height() - height % row * twipsPerPixel));
        }
    mControl->setModel(mControl->model());
}

void DrawingPicture::render(QPainter& painter) const {
    mControl->render(&painter, QPoint(), QRegion(QRect(QPoint(), mSize)));
}

QImage DrawingPicture::image(qreal scale) const {
    QImage result(mSize * scale, QImage::Format_ARGB32_Premultiplied);
    if (result.isNull()) return result;
    result.setDevicePixelRatio(scale);
    QPainter painter(&result);
    render(painter);
    return result;
}

QByteArray DrawingPicture::svg() const {
    QByteArray content;
    QBuffer buffer(&content);
    QSvgGenerator generator;
    generator.setOutputDevice(&buffer);
    generator.setResolution(pixelsPerInch);
    generator.setSize(mSize);
    generator.setViewBox(QRect(QPoint(), mSize));
    QPainter painter(&generator);
    render(painter);
    painter.end();
    return content;
}

// Through SVG: widgets count on a device that clips what they paint, and a page does not.
void DrawingPicture::paint(QPainter& painter, const QRectF& into) const {
    if (isEmpty() || into.isEmpty()) return;
    QRectF place(QPointF(), QSizeF(mSize).scaled(into.size(), Qt::KeepAspectRatio));
    place.moveCenter(into.center());
    QSvgRenderer(svg()).render(&painter, place);
}

} // namespace designer
