#include "designer/Banner.h"

#include "designer/Colours.h"
#include "frontends/qt/ShownText.h"

#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>
#include <QToolButton>

namespace zandor::designer {

Banner::Banner(QWidget* parent) : QFrame(parent), mText(new QLabel) {
    colour();
    setAutoFillBackground(true);

    mText->setTextFormat(Qt::PlainText);
    mText->setWordWrap(true);
    mText->setTextInteractionFlags(Qt::TextSelectableByMouse);
    auto* const close = new QToolButton;
    close->setObjectName(QStringLiteral("close"));
    close->setAutoRaise(true);
    close->setText(QStringLiteral("\u2715"));
    close->setToolTip(tr("Close"));
    close->setAccessibleName(tr("Close"));
    connect(close, &QToolButton::clicked, this, &QWidget::hide);

    auto* const layout = new QHBoxLayout(this);
    layout->setContentsMargins(10, 4, 6, 4);
    layout->addWidget(mText, 1);
    layout->addWidget(close);
    hide();
}

QPushButton* Banner::addButton(const QString& text, const QString& name) {
    auto* const button = new QPushButton(text);
    button->setObjectName(name);
    auto& layout = static_cast<QHBoxLayout&>(*this->layout());
    layout.insertWidget(layout.count() - 1, button);
    return button;
}

void Banner::say(const QString& text, const QString& toolTip) {
    mText->setText(platform::qt::asSigns(text));
    mText->setToolTip(platform::qt::asToolTip(toolTip));
    show();
}

QString Banner::text() const { return mText->text(); }

void Banner::colour() {
    const bool dark = areColoursDark();
    const QColor amber = dark ? QColor(0x5c, 0x4a, 0x1e) : QColor(0xff, 0xf0, 0xc2);
    if (palette().color(QPalette::Window) == amber) return; // it is this that has changed it
    QPalette own;
    own.setColor(QPalette::Window, amber);
    own.setColor(QPalette::WindowText, dark ? QColor(0xff, 0xee, 0xc8) : QColor(0x3c, 0x2f, 0x08));
    setPalette(own);
}

void Banner::changeEvent(QEvent* event) {
    QFrame::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) colour();
}

} // namespace zandor::designer
