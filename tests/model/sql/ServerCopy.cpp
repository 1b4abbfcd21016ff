#include "ServerCopy.h"

#include <QSqlDriver>
#include <QSqlError>
#include <QSqlField>
#include <QSqlQuery>
#include <QSqlRecord>
#include <QVariant>

#include <stdexcept>

namespace {

/// A name in SQLite.
QString quoted(const QString& name) {
    return u'"' + QString(name).replace(u'"', QStringLiteral("\"\"")) + u'"';
}

bool isMysql(const QSqlDatabase& server) {
    return server.driver()->dbmsType() == QSqlDriver::MySqlServer;
}

QString quotedOn(const QSqlDatabase& server, const QString& name) {
    if (!isMysql(server)) return quoted(name);
    QString carried;
    for (const QChar c : name) // the engine has none beyond U+FFFF
        if (!c.isLowSurrogate()) carried += c.isHighSurrogate() ? QChar(u'_') : c;
    return u'`' + carried.replace(u'`', QStringLiteral("``")) + u'`';
}

QSqlQuery selected(const QSqlDatabase& database, const QString& statement) {
    QSqlQuery query(database);
    query.setForwardOnly(true);
    if (!query.exec(statement))
        throw std::runtime_error((query.lastError().text() + u'\n' + statement).toStdString());
    return query;
}

/// The same kind of values in a server's words.
QString typeOn(const QSqlDatabase& server, const QString& declared) {
    const QString type = declared.toUpper();
    if (isMysql(server)) {
        if (type == u"REAL") return QStringLiteral("double");
        if (type == u"TIMESTAMP") return QStringLiteral("datetime"); // which has no zone
        if (type == u"TEXT") return QStringLiteral("varchar(500)");  // of which an index can be
        return declared;
    }
    if (type == u"BLOB") return QStringLiteral("bytea");
    if (type == u"REAL") return QStringLiteral("double precision");
    if (type == u"DATETIME") return QStringLiteral("timestamp");
    return declared;
}

class TableCopy {
public:
    TableCopy(const QSqlDatabase& from, const QSqlDatabase& to, const QString& table)
        : mFrom(from), mTo(to), mTable(table) {}

    void run() {
        create();
        fill();
    }

private:
    void create() {
        QStringList columns;
        QMap<int, QString> key;
        QSqlQuery info =
            selected(mFrom, QStringLiteral("PRAGMA table_info(%1)").arg(quoted(mTable)));
        while (info.next()) {
            const QString name = quotedOn(mTo, info.value(QStringLiteral("name")).toString());
            const int at = info.value(QStringLiteral("pk")).toInt();
            const QString declared = info.value(QStringLiteral("type")).toString();
            columns << name + u' ' + typeOn(mTo, declared);
            mFields << QSqlField(name, fieldType(declared.toUpper()));
            if (at) key.insert(at, name);
        }
        if (!key.isEmpty())
            columns << QStringLiteral("PRIMARY KEY (%1)").arg(key.values().join(u", "));
        ::run(
            mTo,
            QStringLiteral("CREATE TABLE %1 (%2)").arg(quotedOn(mTo, mTable), columns.join(u", ")));
    }

    /// SQLite keeps truth as a number and moments as texts; they are handed on as what they are.
    static QMetaType fieldType(const QString& type) {
        if (type == u"BOOLEAN") return QMetaType::fromType<bool>();
        if (type == u"BLOB") return QMetaType::fromType<QByteArray>();
        return {};
    }

    void fill() {
        constexpr int rowsAtOnce = 500;
        QSqlQuery rows = selected(mFrom, QStringLiteral("SELECT * FROM %1").arg(quoted(mTable)));
        QStringList values;
        while (rows.next()) {
            QStringList row;
            for (int i = 0; i < mFields.size(); ++i) row << literal(mFields[i], rows.value(i));
            values << u'(' + row.join(u", ") + u')';
            if (values.size() == rowsAtOnce) insert(values);
        }
        insert(values);
    }

    QString literal(QSqlField field, const QVariant& value) const {
        if (value.isNull()) return QStringLiteral("NULL");
        if (field.metaType().isValid()) {
            field.setValue(value);
        } else {
            field.setMetaType(value.metaType());
            field.setValue(value);
        }
        return mTo.driver()->formatValue(field);
    }

    void insert(QStringList& values) {
        if (values.isEmpty()) return;
        ::run(mTo, QStringLiteral("INSERT INTO %1 VALUES %2")
                       .arg(quotedOn(mTo, mTable), values.join(u", ")));
        values.clear();
    }

    const QSqlDatabase mFrom;
    const QSqlDatabase mTo;
    const QString mTable;
    QList<QSqlField> mFields;
};

} // namespace

void run(const QSqlDatabase& database, const QString& statement) {
    QSqlQuery query(database);
    if (!query.exec(statement))
        throw std::runtime_error(
            (query.lastError().text() + u'\n' + statement.left(400)).toStdString());
}

void copyToServer(const QSqlDatabase& sqlite, const QSqlDatabase& server) {
    QStringList tables;
    QStringList viewsAndIndexes;
    QSqlQuery master = selected(sqlite, QStringLiteral("SELECT type, name, sql FROM sqlite_master "
                                                       "WHERE name NOT LIKE 'sqlite%' "
                                                       "ORDER BY type = 'view'"));
    while (master.next()) {
        const QString type = master.value(0).toString();
        if (type == u"table") tables << master.value(1).toString();
        if (type == u"view" || type == u"index") viewsAndIndexes << master.value(2).toString();
    }
    for (const QString& table : tables) TableCopy(sqlite, server, table).run();
    for (const QString& statement : viewsAndIndexes) run(server, statement);
    if (!isMysql(server)) run(server, QStringLiteral("ANALYZE"));
}
