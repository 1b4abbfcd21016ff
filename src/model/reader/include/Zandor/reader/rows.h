#pragma once

#include <Zandor/platform/String.h>
#include <Zandor/reader/Result.h>
#include <Zandor/reader/export.h>

#include <QSqlDatabase>
#include <QSqlError>
#include <QSqlQuery>
#include <QVariant>

#include <functional>
#include <optional>

namespace zandor::reader {

ZANDOR_READER_EXPORT QString toQt(const platform::String& text);
ZANDOR_READER_EXPORT platform::String textAt(const QSqlQuery& row, int column);

/// Calls `use` for every row of a statement; the error when it fails. `failed` is what could not be
/// done then, without a full stop.
ZANDOR_READER_EXPORT std::optional<Error>
readRows(const QSqlDatabase& database, const model::Message& failed, const QString& statement,
         const QVariantList& parameters, const std::function<void(const QSqlQuery&)>& use);

/// The engine's words about a failure with what to do about it. `failed` is what could not be done,
/// without a full stop.
ZANDOR_READER_EXPORT Error databaseError(const QSqlDatabase& database, const model::Message& failed,
                                         const QSqlError& error);

} // namespace zandor::reader
