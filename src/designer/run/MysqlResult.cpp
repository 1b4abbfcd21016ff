#include "designer/run/MysqlResult.h"

#include "designer/run/driverFunction.h"

#include <QSqlDatabase>
#include <QSqlDriver>
#include <QSqlError>
#include <QSqlField>
#include <QSqlRecord>
#include <QVariant>

#include <utility>

namespace zandor::designer {

/// MYSQL_FIELD, which has been the same in all versions of both libraries.
struct MysqlResult::Field {
    const char* names[7]; ///< first the one in the result
    unsigned long lengths[2];
    unsigned int nameLengths[7];
    unsigned int flags;
    unsigned int decimals;
    unsigned int characterSet;
    int type;
};

struct MysqlResult::Library {
    int (*query)(void*, const char*, unsigned long);
    void* (*useResult)(void*);
    int (*nextResult)(void*);
    unsigned int (*fieldCount)(void*);
    const Field* (*field)(void*, unsigned int);
    const char* const* (*row)(void*);
    const unsigned long* (*lengths)(void*);
    void (*freeResult)(void*);
    unsigned int (*number)(void*);
    const char* (*words)(void*);

    bool find(const QSqlDatabase& database) {
        return findInDriver(database, "mysql_real_query", query) &&
               findInDriver(database, "mysql_use_result", useResult) &&
               findInDriver(database, "mysql_next_result", nextResult) &&
               findInDriver(database, "mysql_field_count", fieldCount) &&
               findInDriver(database, "mysql_fetch_field_direct", field) &&
               findInDriver(database, "mysql_fetch_row", row) &&
               findInDriver(database, "mysql_fetch_lengths", lengths) &&
               findInDriver(database, "mysql_free_result", freeResult) &&
               findInDriver(database, "mysql_errno", number) &&
               findInDriver(database, "mysql_error", words);
    }
};

MysqlResult::Kind MysqlResult::kindOf(const Field& field) {
    constexpr unsigned int isUnsigned = 32;
    constexpr unsigned int noCharacters = 63; // the character set of what has none
    switch (field.type) {
    case 1:  // tinyint
    case 2:  // smallint
    case 3:  // int
    case 8:  // bigint
    case 9:  // mediumint
    case 13: // year
        return field.flags & isUnsigned ? Kind::natural : Kind::whole;
    case 0:   // decimal
    case 4:   // float
    case 5:   // double
    case 246: // decimal, since 5.0
        return Kind::number;
    case 16: return Kind::bits;
    case 6:   // null
    case 7:   // timestamp
    case 10:  // date
    case 11:  // time
    case 12:  // datetime
    case 245: // json
        return Kind::text;
    default: return field.characterSet == noCharacters ? Kind::bytes : Kind::text;
    }
}

QSqlResult* MysqlResult::over(const QSqlDatabase& database) {
    if (database.driverName() != QLatin1String("QMYSQL")) return nullptr;
    const QVariant handle = database.driver()->handle();
    void* const connection =
        handle.isValid() ? *static_cast<void* const*>(handle.constData()) : nullptr;
    auto library = std::make_unique<Library>();
    if (!connection || !library->find(database)) return nullptr;
    return new MysqlResult(database, connection, std::move(library));
}

MysqlResult::MysqlResult(const QSqlDatabase& database, void* connection,
                         std::unique_ptr<const Library> library)
    : QSqlResult(database.driver()), mConnection(connection), mLibrary(std::move(library)) {}

MysqlResult::~MysqlResult() { end(); }

bool MysqlResult::reset(const QString& statement) {
    end();
    const QByteArray text = statement.toUtf8();
    if (mLibrary->query(mConnection, text.constData(), static_cast<unsigned long>(text.size())))
        return failed(QStringLiteral("Unable to execute query"));
    mSent = true;
    const unsigned int columns = mLibrary->fieldCount(mConnection);
    mRows = mLibrary->useResult(mConnection); // which neither waits for all rows nor keeps them
    if (columns > 0 && !mRows) return failed(QStringLiteral("Unable to use result"));
    for (unsigned int i = 0; i < columns; ++i) mKinds.push_back(kindOf(*mLibrary->field(mRows, i)));
    setSelect(columns > 0);
    setActive(true);
    return true;
}

bool MysqlResult::fetchFirst() { return fetchNext(); }

bool MysqlResult::fetchNext() {
    mRow = mLibrary->row(mRows);
    if (!mRow && mLibrary->number(mConnection))
        return failed(QStringLiteral("Unable to fetch data"));
    if (!mRow) return false;
    mLengths = mLibrary->lengths(mRows);
    setAt(at() + 1);
    return true;
}

QVariant MysqlResult::data(int column) {
    if (isNull(column)) return {};
    const QByteArray bytes = bytesAt(column);
    switch (mKinds[static_cast<std::size_t>(column)]) {
    case Kind::whole: return bytes.toLongLong();
    case Kind::natural: return bytes.toULongLong();
    case Kind::bits: {
        quint64 number = 0;
        for (const char byte : bytes) number = number << 8 | static_cast<uchar>(byte);
        return number;
    }
    case Kind::bytes: return bytes;
    case Kind::number:
    case Kind::text: break;
    }
    return QString::fromUtf8(bytes); // the driver has set the connection to it
}

bool MysqlResult::isNull(int column) {
    return !mRow || column < 0 || static_cast<std::size_t>(column) >= mKinds.size() ||
           !mRow[column];
}

QByteArray MysqlResult::bytesAt(int column) const {
    return {mRow[column], static_cast<qsizetype>(mLengths[column])};
}

QSqlRecord MysqlResult::record() const {
    QSqlRecord record;
    for (std::size_t i = 0; i < mKinds.size(); ++i) {
        const Field* const field = mLibrary->field(mRows, static_cast<unsigned int>(i));
        const bool text = mKinds[i] == Kind::text || mKinds[i] == Kind::bytes;
        record.append(QSqlField(QString::fromUtf8(field->names[0], field->nameLengths[0]),
                                QMetaType(text ? QMetaType::QString : QMetaType::Double)));
    }
    return record;
}

bool MysqlResult::failed(const QString& what) {
    setLastError({what, QString::fromUtf8(mLibrary->words(mConnection)), QSqlError::StatementError,
                  QString::number(mLibrary->number(mConnection))});
    return false;
}

/// The connection takes no other statement before all results of this one are gone.
void MysqlResult::end() {
    mRow = nullptr;
    mKinds.clear();
    if (!std::exchange(mSent, false) || !driver() || !driver()->isOpen()) return;
    if (mRows) mLibrary->freeResult(mRows);
    while (mLibrary->nextResult(mConnection) == 0)
        if (void* const more = mLibrary->useResult(mConnection)) mLibrary->freeResult(more);
    mRows = nullptr;
}

} // namespace zandor::designer
