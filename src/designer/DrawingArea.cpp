#include "designer/DrawingArea.h"

#include "designer/document/Document.h"
#include "model/Layout.h"
#include "platform/KeyedCollection.h"

#include <QResizeEvent>

#include <algorithm>
#include <limits>

namespace designer {

namespace {

constexpr int twipsPerPixel = 15;

/// As much as the control's 16-bit sizes can say.
int canvasSize(int twips) {
    return std::clamp<int>(twips, 0, std::numeric_limits<std::int16_t>::max());
}

} // namespace

DrawingArea::DrawingArea(Document& document, QWidget* parent)
    : QWidget(parent), mDocument(document) {
    connect(&document, &Document::outdated, this, &DrawingArea::showAnew);
    showAnew();
}

// The control leaves its library's objects behind, so it goes before the library.
DrawingArea::~DrawingArea() { delete mControl; }

void DrawingArea::setOptions(const QVariantMap& options) {
    mOptions = options;
    showAnew();
}

QPoint DrawingArea::canvasPlace(QPoint at) const {
    return at * twipsPerPixel + QPoint(mControl->VisibleFrameLeft(), mControl->VisibleFrameTop());
}

void DrawingArea::showAnew() {
    ZandorWidget* const before = mControl;
    mControl = new ZandorWidget(mLibrary, this);
    mControl->setDebugSwitch(0);
    for (auto option = mOptions.begin(); option != mOptions.end(); ++option)
        mControl->setProperty(option.key().toLatin1().constData(), option.value());
    emit controlMade(mControl);
    mControl->setGeometry(rect());
    fitCanvas();
    // After the texts, for it shows the grid's row titles.
    mControl->setOnlyJoin(mOptions.value(QStringLiteral("OnlyJoin"), false).toBool());
    mControl->setModel(mDocument.query());
    mControl->show();
    if (before) {
        mControl->setHorizontalScrollbarPos(before->HorizontalScrollbarPos());
        mControl->setVerticalScrollbarPos(before->VerticalScrollbarPos());
        if (before->hasFocus() || before->isAncestorOf(focusWidget())) mControl->setFocus();
        before->hide();
        // This may run within a signal of its own.
        before->deleteLater();
    }
    for (const auto signal :
         {&ZandorWidget::TableDeleted, &ZandorWidget::TableMoved, &ZandorWidget::Activate})
        connect(mControl, signal, &mDocument, &Document::changedByControl);
    for (const auto signal : {&ZandorWidget::ColumnCreated, &ZandorWidget::ColumnModified,
                              &ZandorWidget::ColumnRemoved})
        connect(mControl, signal, &mDocument, &Document::changedByControl);
    for (const auto signal :
         {&ZandorWidget::JoinCreated, &ZandorWidget::JoinModified, &ZandorWidget::JoinRemoved})
        connect(mControl, signal, &mDocument, &Document::changedByControl);
}

void DrawingArea::resizeEvent(QResizeEvent* event) {
    // Before the control lays itself out for its new size.
    fitCanvas();
    mControl->resize(event->size());
}

/// Makes the canvas as large as its tables need, and never smaller than what can be seen of it.
void DrawingArea::fitCanvas() {
    int right = 0;
    int bottom = 0;
    for (const auto& table :
         platform::Each<TalvikZandorLib::ZDTable>(mDocument.query()->Tables())) {
        right = std::max(right, table->Left() + table->Width() + model::layout::margin);
        bottom = std::max(bottom, table->Top() + table->Height() + model::layout::margin);
    }
    const int visibleWidth = width() * twipsPerPixel;
    const int visibleHeight = height() * twipsPerPixel;
    // The grid covers the lower half, yet the control scrolls a canvas only when it is higher than
    // both halves together.
    const int scrolling =
        bottom > visibleHeight / 2 ? visibleHeight + twipsPerPixel : visibleHeight;
    mControl->setMXHorzFrameSize(canvasSize(std::max(right, visibleWidth)));
    mControl->setMXVertFrameSize(canvasSize(std::max(bottom, scrolling)));
}

} // namespace designer
