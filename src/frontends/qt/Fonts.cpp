#include "frontends/qt/Fonts.h"

#include <Zandor/qt/Text.h>

#include <QFontInfo>
#include <QWidget>

namespace zandor::platform::qt {

Font fromQt(const QFont& font) {
    const qreal points = font.pointSizeF() > 0 ? font.pointSizeF() : QFontInfo(font).pointSizeF();
    return {fromQt(font.family()), static_cast<float>(points)};
}

QFont toQt(const Font& font, const QFont& base) {
    QFont result = base;
    if (!font.Name.empty() && toQt(font.Name) != base.family()) result.setFamily(toQt(font.Name));
    // A size in pixels stays one: in points and back it would be another.
    if (font.Size > 0 && font.Size != fromQt(base).Size)
        result.setPointSizeF(static_cast<qreal>(font.Size));
    return result;
}

void setFont(QWidget& widget, const Font& font) {
    const QWidget* around = widget.isWindow() ? nullptr : widget.parentWidget();
    if (around && fromQt(around->font()) == font)
        widget.setFont(QFont());
    else
        widget.setFont(toQt(font, widget.font()));
}

} // namespace zandor::platform::qt
