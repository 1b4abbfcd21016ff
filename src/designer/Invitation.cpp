#include "designer/Invitation.h"

#include "designer/DrawingArea.h"
#include "designer/database/Database.h"
#include "designer/document/Document.h"

#include <QEvent>

namespace zandor::designer {

namespace {

constexpr int air = 24; // logical pixels
constexpr qreal larger = 1.2;

} // namespace

Invitation::Invitation(Document& document, Database& database, DrawingArea& area)
    : QLabel(&area), mDocument(document), mDatabase(database), mArea(area) {
    setObjectName(QStringLiteral("invitation"));
    setAttribute(Qt::WA_TransparentForMouseEvents);
    setTextFormat(Qt::PlainText);
    setWordWrap(true);
    setAlignment(Qt::AlignCenter);
    setMargin(air);
    setForegroundRole(QPalette::PlaceholderText);
    QFont font = this->font();
    font.setPointSizeF(font.pointSizeF() * larger);
    setFont(font);
    area.installEventFilter(this);
    connect(&document, &Document::changed, this, &Invitation::follow);
    connect(&database, &Database::opened, this, &Invitation::follow);
    // A new control comes to lie on top of what there is.
    connect(&area, &DrawingArea::controlMade, this, &QWidget::raise);
    // It gets its options only then.
    connect(&area, &DrawingArea::controlMade, this, &Invitation::place, Qt::QueuedConnection);
    follow();
}

bool Invitation::eventFilter(QObject* watched, QEvent* event) {
    if (watched == &mArea && event->type() == QEvent::Resize) place();
    return QLabel::eventFilter(watched, event);
}

void Invitation::follow() {
    setText(mDatabase.isOpen()
                ? tr("Drag a table here from the list of tables, or double-click it there.\n"
                     "Then drag its columns into the grid below.")
                : tr("Open a database to begin: see the menu \"Database\"."));
    setVisible(mDocument.query()->Tables().Count() == 0);
    place();
}

/// Over the canvas, which the grid leaves the upper half.
void Invitation::place() {
    const bool onlyCanvas = mArea.control().OnlyJoin();
    setGeometry(0, 0, mArea.width(), onlyCanvas ? mArea.height() : mArea.height() / 2);
}

} // namespace zandor::designer
