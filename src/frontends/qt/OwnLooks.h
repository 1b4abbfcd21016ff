#pragma once

#include <QApplication>
#include <QStyle>
#include <QWidget>

#include <algorithm>
#include <initializer_list>

namespace zandor::platform::qt {

/// Whether widgets of some kinds may look otherwise inside a widget than it does itself: by a
/// style sheet, or by fonts and colours that the application or the desktop has for a kind.
inline bool haveOwnLooks(const QWidget& around, std::initializer_list<const char*> kinds) {
    return around.style()->inherits("QStyleSheetStyle") ||
           std::any_of(kinds.begin(), kinds.end(), [](const char* kind) {
               return QApplication::font(kind) != QApplication::font() ||
                      QApplication::palette(kind) != QApplication::palette();
           });
}

} // namespace zandor::platform::qt
