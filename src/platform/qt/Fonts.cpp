#include "platform/qt/Fonts.h"

#include "platform/qt/Text.h"

#include <QFontInfo>

namespace platform::qt {

Font fromQt(const QFont& font) {
    const qreal points = font.pointSizeF() > 0 ? font.pointSizeF() : QFontInfo(font).pointSizeF();
    return {fromQt(font.family()), static_cast<float>(points)};
}

QFont toQt(const Font& font, const QFont& base) {
    QFont result = base;
    if (!font.Name.empty() && toQt(font.Name) != base.family()) result.setFamily(toQt(font.Name));
    if (font.Size > 0) result.setPointSizeF(static_cast<qreal>(font.Size));
    return result;
}

} // namespace platform::qt
