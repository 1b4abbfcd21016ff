#include "designer/run/NativeResult.h"

#include "designer/run/driverFunction.h"
#include "designer/run/sharedSqlite.h"

#include <QSqlDatabase>
#include <QSqlQuery>
#include <QSqlResult>
#include <QVariant>

#include <cstring>
#include <sqlite3.h>

namespace zandor::designer {

NativeResult::NativeResult(const QSqlQuery& query, const QSqlDatabase& database) : mQuery(query) {
    const char* const type = query.result()->handle().typeName();
    if (!type || !handle()) return;
    mSqlite = std::strcmp(type, "sqlite3_stmt*") == 0 && sharedSqlite(database);
    if (std::strcmp(type, "pg_result*") == 0) findInDriver(database, "PQgetvalue", mGetValue);
    if (database.driverName() == QLatin1String("QODBC"))
        findInDriver(database, "SQLGetData", mGetData);
}

void* NativeResult::handle() const {
    const QVariant handle = mQuery.result()->handle();
    return handle.isValid() ? *static_cast<void* const*>(handle.constData()) : nullptr;
}

std::optional<QString> NativeResult::name(int column) const {
    if (!mSqlite) return {};
    const char* const name = sqlite3_column_name(static_cast<sqlite3_stmt*>(handle()), column);
    if (!name) return {};
    return QString::fromUtf8(name);
}

std::optional<QString> NativeResult::moment(int column) const {
    if (mGetValue) return momentOfPostgres(column);
    if (mGetData) return momentOfOdbc(column);
    return {};
}

std::optional<QString> NativeResult::momentOfPostgres(int column) const {
    const int row = mQuery.isForwardOnly() ? 0 : mQuery.at();
    const char* const value = mGetValue(handle(), row, column);
    if (!value) return {};
    return *value == '\0' ? QString() : QString::fromUtf8(value); // no moment is an empty text
}

std::optional<QString> NativeResult::momentOfOdbc(int column) const {
    constexpr short done = 0;
    constexpr short doneInPart = 1;
    constexpr short noMore = 100;
    constexpr short characters = 1;
    constexpr long null = -1;
    QByteArray text("");
    for (;;) {
        char part[64];
        long left = 0; // bytes, with those of this part
        const short how = mGetData(handle(), static_cast<unsigned short>(column + 1), characters,
                                   part, sizeof part, &left);
        if (how == noMore) break;
        if (how != done && how != doneInPart) return {};
        if (left == null) return QString();
        text += part;
        if (how == done || (left >= 0 && left < static_cast<long>(sizeof part))) break;
    }
    return QString::fromUtf8(text);
}

} // namespace zandor::designer
