#include "model/reader/sqliteError.h"

namespace zandor::reader {

using model::say;

namespace {

/// By the result codes of SQLite.
model::Message advice(int code) {
    switch (code & 0xff) { // an extended code has the plain one in its low byte
    case 5:
    case 6: return say<MessageCode::databaseBusy>();
    case 8:
    case 14: return say<MessageCode::checkPermissions>();
    case 11: return say<MessageCode::databaseDamaged>();
    case 26: return say<MessageCode::databaseUnreadable>();
    default: return say<MessageCode::openAfresh>();
    }
}

} // namespace

Error sqliteError(const model::Message& failed, const QSqlError& error) {
    const QString said = error.databaseText().simplified();
    const QString words = said.isEmpty() ? error.driverText().simplified() : said;
    return say<MessageCode::refusedByEngine>(failed, words.toStdU16String(),
                                             advice(error.nativeErrorCode().toInt()));
}

} // namespace zandor::reader
