#pragma once

#include <Zandor/platform/String.h>

#include <QString>

#include <functional>

namespace zandor::reader {

/// Calls `use` for each text of a JSON array of texts. As such an array an engine hands out the
/// names of thousands of tables in a fraction of the time that a row for each takes.
void forEachName(const QString& array, const std::function<void(platform::String)>& use);

} // namespace zandor::reader
