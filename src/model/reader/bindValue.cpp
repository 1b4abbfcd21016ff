#include <Zandor/reader/bindValue.h>

#include <QByteArray>
#include <QString>

namespace zandor::reader {

QVariant bindValue(const model::sql::Value& value, model::sql::Dialect dialect) {
    using model::ColumnType;
    const QString text = QString::fromStdU16String(value.text);
    switch (value.type) {
    case ColumnType::Integer: return text.toLongLong();
    case ColumnType::Boolean: return value.text == u"true";
    case ColumnType::Blob: return QByteArray::fromHex(text.toLatin1());
    case ColumnType::Decimal:
        if (dialect == model::sql::Dialect::SQLite) return text.toDouble();
        break;
    default: break;
    }
    return text;
}

} // namespace zandor::reader
