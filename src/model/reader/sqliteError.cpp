#include "model/reader/sqliteError.h"

namespace zandor::reader {

namespace {

/// By the result codes of SQLite.
QString advice(int code) {
    switch (code & 0xff) { // an extended code has the plain one in its low byte
    case 5:
    case 6: return QStringLiteral("another program is writing to it; try again in a moment");
    case 8:
    case 14:
        return QStringLiteral("see that you may read the file and its folder; a database in WAL "
                              "mode also needs permission to write to the folder");
    case 11: return QStringLiteral("the file is damaged; restore it from a copy");
    case 26: return QStringLiteral("it is damaged or encrypted; choose another file");
    default: return QStringLiteral("open the database afresh");
    }
}

} // namespace

Error sqliteError(const QString& failed, const QSqlError& error) {
    const QString said = error.databaseText().simplified();
    return {QStringLiteral("%1 (%2): %3.")
                .arg(failed, said.isEmpty() ? error.driverText().simplified() : said,
                     advice(error.nativeErrorCode().toInt()))};
}

} // namespace zandor::reader
