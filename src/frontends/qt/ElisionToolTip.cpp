#include "frontends/qt/ElisionToolTip.h"

#include "frontends/qt/ShownText.h"

#include <QFontMetrics>
#include <QHelpEvent>
#include <QToolTip>
#include <QWidget>

namespace zandor::platform::qt {

void showElisionToolTip(const QHelpEvent& event, QWidget& widget, const QString& text,
                        const QFont& font, const QRect& place) {
    const QString shown = asSigns(text);
    if (QFontMetrics(font).horizontalAdvance(shown) <= place.width())
        QToolTip::hideText();
    else
        QToolTip::showText(event.globalPos(), asToolTip(shown), &widget, place);
}

} // namespace zandor::platform::qt
