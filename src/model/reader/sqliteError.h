#pragma once

#include <Zandor/reader/Result.h>

#include <QSqlError>

namespace zandor::reader {

/// `failed` is what could not be done, without a full stop; the driver's words and what to do about
/// it are put behind.
Error sqliteError(const model::Message& failed, const QSqlError& error);

} // namespace zandor::reader
