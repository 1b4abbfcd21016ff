#pragma once

#include <Zandor/platform/Control.h>

#include <QFont>

namespace zandor::platform::qt {

Font fromQt(const QFont& font);

/// The font in the style of `base`: what a platform font does not say (weight, hinting, fallback
/// families) stays as the widget has it.
QFont toQt(const Font& font, const QFont& base);

/// Gives a widget a font. One that its surroundings have anyway it has from them, so that it
/// follows when theirs changes.
void setFont(QWidget& widget, const Font& font);

} // namespace zandor::platform::qt
