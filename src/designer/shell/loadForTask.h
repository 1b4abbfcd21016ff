#pragma once

#include <Zandor/QueryDocument.h>

#include <QString>

namespace zandor::designer::shell {

/// A query file with the saved queries in it as their own files have them by now; a line of
/// complaint for each that is not.
files::Result<files::QueryDocument> loadForTask(const QString& path);

} // namespace zandor::designer::shell
