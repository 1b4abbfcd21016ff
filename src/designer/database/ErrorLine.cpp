#include "designer/database/ErrorLine.h"

#include "designer/Colours.h"
#include "frontends/qt/ShownText.h"

#include <QEvent>

namespace zandor::designer {

ErrorLine::ErrorLine(QWidget* parent) : QLabel(parent) {
    setTextFormat(Qt::PlainText);
    setWordWrap(true);
    setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    setVisible(false);
    colour();
}

void ErrorLine::colour() {
    const QColor red = areColoursDark() ? QColor(0xff, 0x8a, 0x80) : QColor(0xb0, 0x1e, 0x1e);
    if (palette().color(QPalette::WindowText) == red) return; // it is this that has changed it
    QPalette own;
    own.setColor(QPalette::WindowText, red);
    setPalette(own);
}

void ErrorLine::changeEvent(QEvent* event) {
    QLabel::changeEvent(event);
    if (event->type() == QEvent::PaletteChange) colour();
}

void ErrorLine::say(const QString& error) {
    setText(platform::qt::asSigns(error));
    setVisible(!error.isEmpty());
}

} // namespace zandor::designer
