#include "designer/chart/ChartView.h"

#include "frontends/qt/ShownText.h"

#include <QAccessible>
#include <QKeyEvent>
#include <QPainter>
#include <QToolTip>

namespace zandor::designer {

namespace {

constexpr int aroundText = 24; // logical pixels

} // namespace

ChartView::ChartView(QWidget* parent) : QWidget(parent) {
    setObjectName(QStringLiteral("chart"));
    setAccessibleName(tr("Chart"));
    setFocusPolicy(Qt::StrongFocus);
    setMouseTracking(true);
    setContextMenuPolicy(Qt::ActionsContextMenu);
    setBackgroundRole(QPalette::Base);
    setAutoFillBackground(true);
    setMinimumSize(120, 80);
}

void ChartView::show(ChartData data) {
    mData = std::move(data);
    mWhy.clear();
    setAccessibleDescription(mData->note);
    layOutAnew();
}

void ChartView::say(const QString& why) {
    mData.reset();
    mWhy = why;
    setAccessibleDescription(why);
    layOutAnew();
}

void ChartView::layOutAnew() {
    mDrawing.reset();
    mCurrent = -1;
    update();
}

const ChartDrawing* ChartView::drawing() {
    if (!mDrawing && mData)
        mDrawing = std::make_unique<ChartDrawing>(*mData, ChartLook::of(palette(), font()), size());
    return mDrawing.get();
}

void ChartView::paintEvent(QPaintEvent*) {
    QPainter painter(this);
    if (const ChartDrawing* chart = drawing()) {
        chart->paint(painter);
        if (mCurrent >= 0)
            chart->highlight(painter, chart->marks()[static_cast<std::size_t>(mCurrent)]);
    } else {
        painter.setPen(palette().color(QPalette::PlaceholderText));
        painter.drawText(rect().adjusted(aroundText, 0, -aroundText, 0),
                         Qt::AlignCenter | Qt::TextWordWrap, mWhy);
    }
    if (!hasFocus()) return;
    painter.setPen(palette().color(QPalette::Highlight));
    painter.drawRect(rect().adjusted(0, 0, -1, -1));
}

void ChartView::changeEvent(QEvent* event) {
    if (event->type() == QEvent::PaletteChange || event->type() == QEvent::FontChange) layOutAnew();
    QWidget::changeEvent(event);
}

void ChartView::resizeEvent(QResizeEvent* event) {
    layOutAnew();
    QWidget::resizeEvent(event);
}

void ChartView::mouseMoveEvent(QMouseEvent* event) {
    if (!drawing()) return;
    const int found = mDrawing->markAt(event->position());
    if (found == mCurrent) return;
    setCurrent(found);
    tell(event->globalPosition().toPoint());
}

void ChartView::leaveEvent(QEvent* event) {
    setCurrent(-1);
    QWidget::leaveEvent(event);
}

void ChartView::keyPressEvent(QKeyEvent* event) {
    if (!drawing() || !step(event->key())) return QWidget::keyPressEvent(event);
    const ChartMark& mark = mDrawing->marks()[static_cast<std::size_t>(mCurrent)];
    tell(mapToGlobal(mark.area.center().toPoint()));
}

/// Left and Right go through the points of a series, Up and Down through the values of a point.
bool ChartView::step(int key) {
    const auto& marks = mDrawing->marks();
    const int count = static_cast<int>(marks.size());
    if (count == 0) return false;
    const int way = key == Qt::Key_Left || key == Qt::Key_Up ? -1 : 1;
    switch (key) {
    case Qt::Key_Home: setCurrent(0); return true;
    case Qt::Key_End: setCurrent(count - 1); return true;
    case Qt::Key_Left:
    case Qt::Key_Right:
    case Qt::Key_Up:
    case Qt::Key_Down: break;
    default: return false;
    }
    if (mCurrent < 0) return setCurrent(0), true;
    const ChartMark from = marks[static_cast<std::size_t>(mCurrent)];
    const bool along = key == Qt::Key_Left || key == Qt::Key_Right;
    for (int n = mCurrent + way; n >= 0 && n < count; n += way) {
        const ChartMark& mark = marks[static_cast<std::size_t>(n)];
        if (along ? mark.series == from.series : mark.point == from.point)
            return setCurrent(n), true;
    }
    return true;
}

void ChartView::setCurrent(int mark) {
    if (mark == mCurrent) return;
    mCurrent = mark;
    if (mark < 0) QToolTip::hideText();
    setAccessibleDescription(
        mark < 0 ? (mData ? mData->note : mWhy)
                 : mDrawing->words(mDrawing->marks()[static_cast<std::size_t>(mark)])
                       .replace(u'\n', QStringLiteral(", ")));
    QAccessibleEvent said(this, QAccessible::DescriptionChanged);
    QAccessible::updateAccessibility(&said);
    update();
}

void ChartView::tell(const QPoint& at) {
    if (mCurrent < 0) return;
    const ChartMark& mark = mDrawing->marks()[static_cast<std::size_t>(mCurrent)];
    QToolTip::showText(at, platform::qt::asToolTip(mDrawing->words(mark)), this);
}

bool ChartView::event(QEvent* event) {
    if (event->type() == QEvent::ToolTip) return true; // it has been told
    if (event->type() == QEvent::FocusIn || event->type() == QEvent::FocusOut) update();
    return QWidget::event(event);
}

} // namespace zandor::designer
