#pragma once

#include <Zandor/qt/export.h>

#include <QString>

/// Text of foreign origin (names from databases, paths, values) on its way to the screen.
namespace zandor::platform::qt {

/// A name as one line in which nothing is hidden: line breaks, control characters and characters
/// that change the direction of what follows or are not seen at all become signs. The joiners
/// U+200C and U+200D, which some scripts are written with, stay.
ZANDOR_WIDGETS_EXPORT QString asSigns(const QString& name);

/// How a name stands at the left of its place, its own script deciding the direction that it reads
/// in. A painter left to itself follows the application instead.
inline constexpr Qt::Alignment atTheLeft = Qt::AlignLeft | Qt::AlignVCenter | Qt::AlignAbsolute;
inline constexpr Qt::LayoutDirection asItReads = Qt::LayoutDirectionAuto;

/// A text as a tooltip: plain whatever it contains, at most 60 characters wide and 20 lines high,
/// with "…" for the rest. Its line breaks stay line breaks; the other characters above are signs.
/// To be handed to QToolTip or setToolTip as it comes.
ZANDOR_WIDGETS_EXPORT QString asToolTip(const QString& text);

} // namespace zandor::platform::qt
