#include "designer/run/writtenOut.h"

#include <Zandor/sql/Dialect.h>

namespace zandor::designer {

namespace {

QString literal(const QVariant& value) {
    switch (value.typeId()) {
    case QMetaType::Bool: return value.toBool() ? QStringLiteral("TRUE") : QStringLiteral("FALSE");
    case QMetaType::Int:
    case QMetaType::LongLong: return QString::number(value.toLongLong());
    case QMetaType::QByteArray:
        return QStringLiteral("x'%1'").arg(QString::fromLatin1(value.toByteArray().toHex()));
    default: break;
    }
    const model::sql::Value text{model::ColumnType::Text, value.toString().toStdU16String()};
    return QString::fromStdU16String(model::sql::literal(text, model::sql::Dialect::MySQL));
}

/// Where a text or a name in quotes ends that begins at a place.
qsizetype endOfQuoted(const QString& statement, qsizetype begin) {
    const QChar quote = statement[begin];
    qsizetype at = begin + 1;
    while (at < statement.size() && statement[at] != quote)
        at += statement[at] == u'\\' && quote == u'\'' ? 2 : 1;
    return at; // a quote that is doubled begins the next one
}

} // namespace

QString writtenOut(const QString& statement, const QVariantList& values) {
    QString out;
    qsizetype copied = 0;
    qsizetype used = 0;
    for (qsizetype at = 0; at < statement.size() && used < values.size(); ++at) {
        const QChar c = statement[at];
        if (c == u'\'' || c == u'`') at = endOfQuoted(statement, at);
        if (c != u'?') continue;
        out += QStringView(statement).sliced(copied, at - copied);
        out += literal(values[used++]);
        copied = at + 1;
    }
    out += QStringView(statement).sliced(copied);
    return out;
}

} // namespace zandor::designer
