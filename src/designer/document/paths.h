#pragma once

#include <Zandor/files/Error.h>

#include <QFile>

namespace zandor::designer {

/// A path as the system takes it.
inline files::Path pathOf(const QString& path) { return QFile::encodeName(path).toStdString(); }

} // namespace zandor::designer
