#include "designer/DrawingArea.h"

#include "designer/canvasSize.h"
#include "designer/document/Document.h"
#include "designer/statement/ModelWords.h"

#include <Zandor/qt/Text.h>

#include <QResizeEvent>

#include <algorithm>
#include <utility>

namespace zandor::designer {

using platform::qt::fromQt;
using platform::qt::toQt;

DrawingArea::DrawingArea(Document& document, QWidget* parent)
    : QWidget(parent), mDocument(document) {
    connect(&document, &Document::outdated, this, &DrawingArea::showAnew);
    // What the control did it has shown, but not all that came of it: it takes the columns of more
    // tables than one out of the grid, say, and leaves blank columns before one dropped far out.
    connect(&document, &Document::changed, this, [this] {
        growCanvas();
        mControl->showAnew();
    });
    makeControl();
}

// The control leaves its library's objects behind, so it goes before the library.
DrawingArea::~DrawingArea() {
    // Those that were shown before may still be there.
    qDeleteAll(findChildren<ZandorWidget*>(Qt::FindDirectChildrenOnly));
}

void DrawingArea::setOptions(const QVariantMap& options) {
    mOptions = options;
    makeControl();
}

void DrawingArea::showFindings(const model::Findings& findings) {
    mFindings.clear();
    for (const model::Finding& finding : findings)
        if (finding.row > 0)
            mFindings.push_back(
                {finding.definition, finding.row, fromQt(inWords(finding.message))});
    mControl->setFindings(mFindings);
}

void DrawingArea::setPaneShare(double share) {
    mPaneShare = share;
    mControl->setUpperPaneShare(share);
    fitCanvas();
}

QPoint DrawingArea::canvasPlace(QPoint at) const {
    return at * twipsPerPixel + QPoint(mControl->VisibleFrameLeft(), mControl->VisibleFrameTop());
}

void DrawingArea::showAnew() {
    // Nothing of a query stays in the drawing of another.
    if (mControl->model() != mDocument.query()) return makeControl();
    fitCanvas();
    mControl->control().UserControl_Resize();
    mControl->showAnew();
}

void DrawingArea::makeControl() {
    ZandorWidget* const before = mControl;
    mControl = new ZandorWidget(mLibrary, this);
    mControl->setDebugSwitch(0);
    mControl->setComforts(comforts::Flags::all());
    for (auto option = mOptions.begin(); option != mOptions.end(); ++option)
        mControl->setProperty(option.key().toLatin1().constData(), option.value());
    emit controlMade(mControl);
    mControl->setGeometry(rect());
    mControl->setUpperPaneShare(mPaneShare);
    fitCanvas();
    // After the texts, for it shows the grid's row titles.
    mControl->setOnlyJoin(mOptions.value(QStringLiteral("OnlyJoin"), false).toBool());
    mControl->setModel(mDocument.query());
    mControl->showAnew();
    mControl->setFindings(mFindings);
    mControl->show();
    if (before) {
        // The canvas may be smaller now than it was.
        mControl->setHorizontalScrollbarPos(
            std::min(before->HorizontalScrollbarPos(), mControl->HorizMaxScrollPos()));
        mControl->setVerticalScrollbarPos(
            std::min(before->VerticalScrollbarPos(), mControl->VertMaxScrollPos()));
        if (before->hasFocus() || before->isAncestorOf(focusWidget())) mControl->setFocus();
        before->setDebugSwitch(0); // it does not end: another one shows the same
        before->hide();
        // This may run within a signal of its own.
        before->deleteLater();
    }
    connect(mControl, &ZandorWidget::upperPaneShareChanged, this, [this](double share) {
        mPaneShare = share;
        fitCanvas();
        emit paneShareChanged(share);
    });
    connect(mControl, &ZandorWidget::renameRequested, this, &DrawingArea::renameRequested);
    const auto tell = [this](auto... events) {
        (connect(mControl, events, &mDocument, &Document::changedByControl), ...);
    };
    using Control = ZandorWidget;
    tell(&Control::TableDeleted, &Control::TableMoved, &Control::Activate, &Control::ColumnCreated,
         &Control::ColumnModified, &Control::ColumnRemoved, &Control::JoinCreated,
         &Control::JoinModified, &Control::JoinRemoved);
}

void DrawingArea::resizeEvent(QResizeEvent* event) {
    // Before the control lays itself out for its new size.
    fitCanvas();
    mControl->resize(event->size());
}

/// Lets the canvas reach to a table that was pulled behind the grid. It does not become smaller,
/// for what is seen of it would move under the user's hands.
void DrawingArea::growCanvas() {
    const std::pair before(mControl->MXHorzFrameSize(), mControl->MXVertFrameSize());
    fitCanvas();
    mControl->setMXHorzFrameSize(std::max(mControl->MXHorzFrameSize(), before.first));
    mControl->setMXVertFrameSize(std::max(mControl->MXVertFrameSize(), before.second));
    if (std::pair(mControl->MXHorzFrameSize(), mControl->MXVertFrameSize()) != before)
        mControl->control().UserControl_Resize();
}

/// Makes the canvas as large as its tables need, and never smaller than what can be seen of it.
void DrawingArea::fitCanvas() {
    const QSize needed = canvasNeeded(*mDocument.query());
    const QSize visible = size() * twipsPerPixel;
    // The grid covers the lower pane, yet the control scrolls a canvas only when it is higher than
    // both panes together.
    const bool scrolls = needed.height() > visible.height() * mPaneShare;
    const int scrolling = scrolls ? visible.height() + twipsPerPixel : visible.height();
    mControl->setMXHorzFrameSize(canvasLength(std::max(needed.width(), visible.width())));
    mControl->setMXVertFrameSize(canvasLength(std::max(needed.height(), scrolling)));
}

} // namespace zandor::designer
