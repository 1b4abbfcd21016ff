#pragma once

#include <QFont>
#include <QRect>
#include <QString>

class QHelpEvent;
class QWidget;

namespace zandor::platform::qt {

/// Shows the whole of a name as a tooltip where it is too wide for its place, and no tooltip where
/// it fits. Place is in the widget's coordinates.
void showElisionToolTip(const QHelpEvent& event, QWidget& widget, const QString& text,
                        const QFont& font, const QRect& place);

} // namespace zandor::platform::qt
