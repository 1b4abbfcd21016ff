#include "designer/database/ErrorLine.h"

namespace designer {

ErrorLine::ErrorLine(QWidget* parent) : QLabel(parent) {
    setTextFormat(Qt::PlainText);
    setWordWrap(true);
    setTextInteractionFlags(Qt::TextSelectableByMouse | Qt::TextSelectableByKeyboard);
    setVisible(false);
    const bool dark = palette().color(QPalette::Window).lightness() < 128;
    QPalette own;
    own.setColor(QPalette::WindowText, dark ? QColor(0xff, 0x8a, 0x80) : QColor(0xb0, 0x1e, 0x1e));
    setPalette(own);
}

void ErrorLine::say(const QString& error) {
    setText(error);
    setVisible(!error.isEmpty());
}

} // namespace designer
