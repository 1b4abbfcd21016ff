#pragma once

#include "model/files/Error.h"

#include <QFile>

namespace designer {

/// A path as the system takes it.
inline files::Path pathOf(const QString& path) { return QFile::encodeName(path).toStdString(); }

} // namespace designer
