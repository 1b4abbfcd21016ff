#pragma once

#include <Zandor/files/Error.h>
#include <Zandor/reader/Result.h>

#include <QString>

#include <optional>

namespace zandor::designer {

/// What the query model, a file or a reader has to say, in the designer's language. May be called
/// from any thread.
QString inWords(const model::Message& message);
QString inWords(const files::Error& error);
QString inWords(const reader::Error& error);
/// Of a file that could not be written; nothing for nothing.
std::optional<QString> inWords(const std::optional<files::Error>& error);

} // namespace zandor::designer
