#include "designer/database/ConnectionBanner.h"

#include "designer/Colours.h"
#include "designer/database/opening.h"
#include "designer/statement/ModelWords.h"

#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QStyle>
#include <QToolButton>

namespace designer {

ConnectionBanner::ConnectionBanner(Database& database, QWidget* parent)
    : QFrame(parent), mDatabase(database), mText(new QLabel) {
    colour();
    setAutoFillBackground(true);

    mText->setTextFormat(Qt::PlainText);
    mText->setWordWrap(true);
    mText->setTextInteractionFlags(Qt::TextSelectableByMouse);
    auto* const again = new QPushButton(tr("&Reconnect"));
    again->setObjectName(QStringLiteral("reconnect"));
    auto* const close = new QToolButton;
    close->setObjectName(QStringLiteral("close"));
    close->setAutoRaise(true);
    close->setText(QStringLiteral("\u2715"));
    close->setToolTip(tr("Close"));
    close->setAccessibleName(tr("Close"));

    auto* const layout = new QHBoxLayout(this);
    layout->setContentsMargins(10, 4, 6, 4);
    layout->addWidget(mText, 1);
    layout->addWidget(again);
    layout->addWidget(close);
    hide();

    connect(&database, &Database::lost, this, &ConnectionBanner::showLoss);
    connect(&database, &Database::opened, this, &QWidget::hide);
    connect(&database, &Database::found, this, &QWidget::hide);
    connect(again, &QPushButton::clicked, this, &ConnectionBanner::reconnect);
    connect(close, &QToolButton::clicked, this, &QWidget::hide);
}

void ConnectionBanner::colour() {
    const bool dark = areColoursDark();
    const QColor amber = dark ? QColor(0x5c, 0x4a, 0x1e) : QColor(0xff, 0xf0, 0xc2);
    if (palette().color(QPalette::Window) == amber) return; // it is this that has changed it
    QPalette own;
    own.setColor(QPalette::Window, amber);
    own.setColor(QPalette::WindowText, dark ? QColor(0xff, 0xee, 0xc8) : QColor(0x3c, 0x2f, 0x08));
    setPalette(own);
}

void ConnectionBanner::changeEvent(QEvent* event) {
    QFrame::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) colour();
}

void ConnectionBanner::showLoss(const QString& message) {
    mText->setText(tr("The connection to %1 is lost. Your query is kept.").arg(mDatabase.name()));
    mText->setToolTip(inWords(message));
    show();
}

void ConnectionBanner::reconnect() {
    const Opening opening = renewPatiently(mDatabase, window());
    if (opening.error.isEmpty()) return;
    mText->setText(inWords(opening.error));
    mText->setToolTip({});
}

} // namespace designer
