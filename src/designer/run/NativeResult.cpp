#include "designer/run/NativeResult.h"

#include "designer/run/sharedSqlite.h"

#include <QSqlQuery>
#include <QSqlResult>
#include <QVariant>

#include <cstring>
#include <dlfcn.h>
#include <sqlite3.h>

namespace zandor::designer {

namespace {

// The libraries are the drivers' and not this program's: their functions are looked up in what is
// loaded already.

template <class Function>
Function loaded(std::initializer_list<const char*> libraries, const char* name) {
    for (const char* library : libraries)
        if (void* const handle = dlopen(library, RTLD_LAZY | RTLD_NOLOAD))
            return reinterpret_cast<Function>(dlsym(handle, name));
    return nullptr;
}

/// MYSQL_FIELD, which has been the same in all versions of both libraries.
struct MysqlField {
    const char* names[7];
    unsigned long lengths[2];
    unsigned int nameLengths[7];
    unsigned int flags;
    unsigned int decimals;
    unsigned int characterSet;
    int type;
};

constexpr unsigned int bytes = 63; // the character set of what has none
constexpr int bit = 16;

const MysqlField* fieldAt(void* result, int column) {
    using Fetch = const MysqlField* (*)(void*, unsigned int);
    static const auto fetch =
        loaded<Fetch>({"libmariadb.so.3", "libmysqlclient.so.21", "libmysqlclient.so.24"},
                      "mysql_fetch_field_direct");
    return fetch ? fetch(result, static_cast<unsigned int>(column)) : nullptr;
}

const char* valueAt(void* result, int row, int column) {
    using GetValue = const char* (*)(const void*, int, int);
    static const auto getValue = loaded<GetValue>({"libpq.so.5"}, "PQgetvalue");
    return getValue ? getValue(result, row, column) : nullptr;
}

} // namespace

NativeResult::NativeResult(const QSqlQuery& query, const QSqlDatabase& database) : mQuery(query) {
    const char* const type = query.result()->handle().typeName();
    if (!type || !handle()) return;
    if (std::strcmp(type, "sqlite3_stmt*") == 0 && sharedSqlite(database)) mEngine = Engine::sqlite;
    if (std::strcmp(type, "pg_result*") == 0) mEngine = Engine::postgres;
    if (std::strcmp(type, "st_mysql_res*") == 0) mEngine = Engine::mysql;
}

void* NativeResult::handle() const {
    const QVariant handle = mQuery.result()->handle();
    return handle.isValid() ? *static_cast<void* const*>(handle.constData()) : nullptr;
}

std::optional<QString> NativeResult::name(int column) const {
    if (mEngine != Engine::sqlite) return {};
    const char* const name = sqlite3_column_name(static_cast<sqlite3_stmt*>(handle()), column);
    if (!name) return {};
    return QString::fromUtf8(name);
}

std::optional<QString> NativeResult::written(int column) const {
    if (mEngine != Engine::postgres) return {};
    const int row = mQuery.isForwardOnly() ? 0 : mQuery.at();
    const char* const value = valueAt(handle(), row, column);
    if (!value) return {};
    return QString::fromUtf8(value);
}

bool NativeResult::isText(int column) const {
    const MysqlField* const field = mEngine == Engine::mysql ? fieldAt(handle(), column) : nullptr;
    return field && field->characterSet != bytes;
}

bool NativeResult::isBits(int column) const {
    const MysqlField* const field = mEngine == Engine::mysql ? fieldAt(handle(), column) : nullptr;
    return field && field->type == bit;
}

} // namespace zandor::designer
