#include "designer/run/Cell.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QLocale>
#include <QSqlField>
#include <QSqlQuery>
#include <QSqlRecord>

#include <limits>

namespace zandor::designer {

namespace {

/// With as many digits behind the seconds as there are.
QString clockFormat(const QTime& time) {
    return time.msec() == 0 ? QStringLiteral("HH:mm:ss") : QStringLiteral("HH:mm:ss.zzz");
}

/// A moment that Qt cannot hold, such as "infinity" or one before our era.
QString unknownMoment() {
    return QCoreApplication::translate("zandor::designer::CellReader", "(outside the calendar)");
}

bool isNumber(const QMetaType& type) {
    switch (type.id()) {
    case QMetaType::Double:
    case QMetaType::Float:
    case QMetaType::Int:
    case QMetaType::UInt:
    case QMetaType::LongLong:
    case QMetaType::ULongLong:
    case QMetaType::Short:
    case QMetaType::UShort:
    case QMetaType::Char:
    case QMetaType::SChar:
    case QMetaType::UChar: return true;
    default: return false;
    }
}

bool isMoment(const QMetaType& type) {
    return type.id() == QMetaType::QDate || type.id() == QMetaType::QTime ||
           type.id() == QMetaType::QDateTime;
}

QString momentText(const QVariant& value) {
    if (value.typeId() == QMetaType::QDate) return value.toDate().toString(Qt::ISODate);
    if (value.typeId() == QMetaType::QTime) {
        const QTime time = value.toTime();
        return time.toString(clockFormat(time));
    }
    const QDateTime moment = value.toDateTime();
    return moment.toString(QStringLiteral("yyyy-MM-dd ") + clockFormat(moment.time()));
}

} // namespace

CellReader::CellReader(const QSqlQuery& query, const QSqlDatabase& database)
    // SQLite has no exact decimals, and shows as many digits as a sum of prices has without noise.
    : mQuery(query), mNative(query, database),
      mDigits(database.driverName() == QStringLiteral("QSQLITE")
                  ? std::numeric_limits<double>::digits10
                  : static_cast<int>(QLocale::FloatingPointShortest)) {
    const QSqlRecord record = query.record();
    for (int i = 0; i < record.count(); ++i) {
        mColumns << mNative.name(i).value_or(record.fieldName(i));
        mNumbers.push_back(isNumber(record.field(i).metaType()));
        mMoments.push_back(isMoment(record.field(i).metaType()));
    }
    mRow.resize(mNumbers.size());
}

const Row& CellReader::row() {
    for (std::size_t i = 0; i < mRow.size(); ++i) mRow[i] = cell(static_cast<int>(i));
    return mRow;
}

Cell CellReader::cell(int column) const {
    std::optional<QString> moment;
    if (mMoments[static_cast<std::size_t>(column)]) moment = mNative.moment(column);
    // Also where it is not needed, for behind ODBC the driver reads all columns up to the asked
    // one.
    const QVariant value = mQuery.value(column);
    if (moment) return moment->isNull() ? Cell{} : Cell{Cell::Kind::text, *moment};
    // The statement knows it; a value that Qt cannot hold calls itself null as well.
    if (mQuery.isNull(column)) return {};
    switch (value.typeId()) {
    case QMetaType::QByteArray: return {Cell::Kind::blob, {}, value.toByteArray()};
    case QMetaType::Bool:
        return {Cell::Kind::boolean,
                value.toBool() ? QStringLiteral("true") : QStringLiteral("false")};
    case QMetaType::QDate:
    case QMetaType::QTime:
    case QMetaType::QDateTime: {
        const QString text = momentText(value);
        return {Cell::Kind::text, text.isEmpty() ? unknownMoment() : text};
    }
    case QMetaType::Double:
    case QMetaType::Float:
        return {Cell::Kind::number, QString::number(value.toDouble(), 'g', mDigits)};
    case QMetaType::QString: {
        // Exact decimals come as text.
        const bool number = mNumbers[static_cast<std::size_t>(column)];
        return {number ? Cell::Kind::number : Cell::Kind::text, value.toString()};
    }
    default:
        return {isNumber(value.metaType()) ? Cell::Kind::number : Cell::Kind::text,
                value.toString()};
    }
}

} // namespace zandor::designer
