#pragma once

#include <QCoreApplication>

namespace zandor::designer {

/// The words of functions that belong to no class.
inline QString tr(const char* text) {
    return QCoreApplication::translate("zandor::designer", text);
}

} // namespace zandor::designer
