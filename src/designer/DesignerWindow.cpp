#include "designer/DesignerWindow.h"

#include "model/Layout.h"
#include "platform/KeyedCollection.h"

#include <QLabel>
#include <QResizeEvent>
#include <QStatusBar>

#include <algorithm>
#include <limits>

namespace designer {

namespace {

constexpr QSize newSize(1200, 800); // logical pixels
constexpr int twipsPerPixel = 15;
constexpr int besideCanvas = 24; // the scroll bar and the window's edges

/// As much as the control's 16-bit sizes can say.
std::int16_t canvasSize(int twips) {
    return static_cast<std::int16_t>(
        std::clamp<int>(twips, 0, std::numeric_limits<std::int16_t>::max()));
}

} // namespace

std::int32_t DesignerWindow::canvasWidth() {
    return (newSize.width() - besideCanvas) * twipsPerPixel;
}

DesignerWindow::DesignerWindow(const OpenedQuery& opened)
    : mQuery(opened.query), mDesigner(new ZandorWidget(mLibrary, this)) {
    setWindowTitle(opened.name + QStringLiteral(" \u2014 Zandor Designer"));
    mDesigner->setDebugSwitch(0);
    mDesigner->installEventFilter(this);
    setCentralWidget(mDesigner);
    statusBar()->addWidget(new QLabel(opened.message));
    resize(newSize);
    mDesigner->setOnlyJoin(false);
    mDesigner->setModel(mQuery);
}

// The control leaves its library's objects behind, so it goes before the library.
DesignerWindow::~DesignerWindow() { delete mDesigner; }

bool DesignerWindow::eventFilter(QObject* watched, QEvent* event) {
    // Before the control lays itself out for its new size.
    if (watched == mDesigner && event->type() == QEvent::Resize)
        fitCanvas(static_cast<QResizeEvent*>(event)->size());
    return QMainWindow::eventFilter(watched, event);
}

/// Makes the canvas as large as its tables need, and never smaller than what can be seen of it.
void DesignerWindow::fitCanvas(const QSize& visible) {
    int right = 0;
    int bottom = 0;
    for (const auto& table : platform::Each<TalvikZandorLib::ZDTable>(mQuery->Tables())) {
        right = std::max(right, table->Left() + table->Width() + model::layout::margin);
        bottom = std::max(bottom, table->Top() + table->Height() + model::layout::margin);
    }
    const int width = visible.width() * twipsPerPixel;
    const int height = visible.height() * twipsPerPixel;
    // The grid covers the lower half, yet the control scrolls a canvas only when it is higher than
    // both halves together.
    const int scrolling = bottom > height / 2 ? height + twipsPerPixel : height;
    mDesigner->setMXHorzFrameSize(canvasSize(std::max(right, width)));
    mDesigner->setMXVertFrameSize(canvasSize(std::max(bottom, scrolling)));
}

} // namespace designer
