#include "designer/GridHint.h"

#include "designer/DrawingArea.h"
#include "designer/document/Document.h"

#include <QEvent>

#include <algorithm>

namespace zandor::designer {

namespace {

constexpr int aroundWords = 10;   // logical pixels
constexpr int scrollBars = 20;    // below the cells and beside them
constexpr double left = 0.42;     // leaves the first columns their cells and their list of fields
constexpr int widestInWords = 60; // average characters

} // namespace

GridHint::GridHint(Document& document, DrawingArea& area)
    : QLabel(tr("Double-click a column of a table, or drag it here, to choose what comes out. "
                "Until then all columns do."),
             &area),
      mDocument(document), mArea(area) {
    setObjectName(QStringLiteral("gridHint"));
    setAttribute(Qt::WA_TransparentForMouseEvents);
    setTextFormat(Qt::PlainText);
    setWordWrap(true);
    setAlignment(Qt::AlignCenter);
    setMargin(aroundWords);
    setFrameShape(QFrame::StyledPanel);
    setAutoFillBackground(true);
    setBackgroundRole(QPalette::Base);
    setForegroundRole(QPalette::PlaceholderText);
    area.installEventFilter(this);
    connect(&document, &Document::changed, this, &GridHint::follow);
    connect(&area, &DrawingArea::paneShareChanged, this, &GridHint::place);
    // A new control comes to lie on top of what there is, and gets its options only then.
    connect(&area, &DrawingArea::controlMade, this, &QWidget::raise);
    connect(&area, &DrawingArea::controlMade, this, &GridHint::follow, Qt::QueuedConnection);
    follow();
}

bool GridHint::eventFilter(QObject* watched, QEvent* event) {
    if (watched == &mArea && event->type() == QEvent::Resize) place();
    return QLabel::eventFilter(watched, event);
}

void GridHint::follow() {
    model::Query& query = *mDocument.query();
    setVisible(!mArea.control().OnlyJoin() && query.Tables().Count() > 0 &&
               query.ColumnDefinitions().Count() == 0);
    place();
}

void GridHint::place() {
    const int top = static_cast<int>(mArea.height() * mArea.control().upperPaneShare());
    QRect cells(0, top, mArea.width() - scrollBars, mArea.height() - top - scrollBars);
    cells.setLeft(static_cast<int>(mArea.width() * left));
    const int width =
        std::min(cells.width() - aroundWords, fontMetrics().averageCharWidth() * widestInWords);
    QRect own(0, 0, width, std::min(heightForWidth(width), cells.height()));
    own.moveCenter(cells.center());
    setGeometry(own);
}

} // namespace zandor::designer
