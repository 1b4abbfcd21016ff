#pragma once

#include <Zandor/QueryDocument.h>

namespace zandor::files {

/// The document that a file holds, with the files of its saved queries as absolute paths.
QueryDocument namedAbsolutely(QueryDocument document, const Path& file);

} // namespace zandor::files
