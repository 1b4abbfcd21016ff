#pragma once

#include <Zandor/reader/Result.h>
#include <Zandor/reader/export.h>

#include <QSqlError>

namespace zandor::reader {

/// An error of an engine behind a network: its own words in one line, and what to do about it as
/// far as the words tell. `failed` is what could not be done, without a full stop.
ZANDOR_READER_EXPORT Error serverError(const model::Message& failed, const QSqlError& error);

/// Whether an error of openDatabase says that the server wants a password, or another one.
ZANDOR_READER_EXPORT bool asksForPassword(const Error& error);

} // namespace zandor::reader
