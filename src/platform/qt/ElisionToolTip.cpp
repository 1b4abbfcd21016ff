#include "platform/qt/ElisionToolTip.h"

#include <QFontMetrics>
#include <QHelpEvent>
#include <QToolTip>
#include <QWidget>

namespace platform::qt {

void showElisionToolTip(const QHelpEvent& event, QWidget& widget, const QString& text,
                        const QFont& font, const QRect& place) {
    if (QFontMetrics(font).horizontalAdvance(text) <= place.width())
        QToolTip::hideText();
    else
        QToolTip::showText(event.globalPos(), text.toHtmlEscaped(), &widget, place);
}

} // namespace platform::qt
