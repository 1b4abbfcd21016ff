#include "designer/run/fetch.h"

#include "designer/run/EngineStop.h"
#include "designer/run/MysqlResult.h"
#include "designer/run/keepToOne.h"
#include "designer/run/writtenOut.h"
#include "designer/statement/ModelWords.h"

#include <Zandor/reader/dialectOf.h>

#include <QCoreApplication>
#include <QSqlError>
#include <QSqlQuery>

namespace zandor::designer {

namespace {

QString words(const QSqlError& error) {
    const QString said = error.databaseText().trimmed();
    if (said.isEmpty()) {
        // A server that dies before its first row leaves its driver without a word.
        const QString driver = error.driverText().trimmed();
        return driver.isEmpty() ? QCoreApplication::translate("zandor::designer::ResultsPanel",
                                                              "The server does not answer.")
                                : driver;
    }
    // A server that another one reads from is gone: what follows is for those who run it.
    const bool connection = error.nativeErrorCode().startsWith(QLatin1String("08"));
    return connection ? said.section(u'\n', 0, 0) : said;
}

QSqlQuery queryOn(const QSqlDatabase& database) {
    if (QSqlResult* const result = MysqlResult::over(database)) return QSqlQuery(result);
    return QSqlQuery(database);
}

bool send(QSqlQuery& query, const QSqlDatabase& database, const Command& command) {
    // Without values not prepared: the driver would look for placeholders in the texts.
    if (command.values.isEmpty()) return query.exec(command.statement);
    // Prepared, Qt's driver keeps all rows that have a long text, takes 4 GB for a geometry, and
    // that of ODBC has a zero too many in every text.
    if (reader::dialectOf(database) == model::sql::Dialect::MySQL)
        return query.exec(writtenOut(command.statement, command.values));
    if (!query.prepare(command.statement)) return false;
    for (const QVariant& value : command.values) query.addBindValue(value);
    return query.exec();
}

class Fetch {
public:
    Fetch(const Connector& connector, const reader::Connection& connection,
          const std::atomic<bool>& stop)
        : mConnection(connection), mStop(stop), mEngineStop(connection.database(), connector, stop),
          mQuery(queryOn(connection.database())) {
        mQuery.setForwardOnly(true); // the drivers then neither wait for all rows nor keep them
        mQuery.setNumericalPrecisionPolicy(QSql::HighPrecision);
    }

    Outcome run(const Command& command, Sink& sink) {
        if (command.isTyped)
            if (const auto wrong = keepToOne(mConnection.database(), command.statement))
                return broken(wrong->isEmpty() ? words({}) : *wrong);
        if (!send(mQuery, mConnection.database(), command)) return broken(said(command));
        CellReader cells(mQuery, mConnection.database());
        if (const auto error = sink.begin(cells.columns()))
            return leave(Outcome::End::refused, *error);
        while (mQuery.next()) {
            if (mStop) return leave(Outcome::End::cancelled);
            if (command.limit && mRows == *command.limit) {
                // A drawing's statement has said how many rows to give.
                if (command.isTyped) mEngineStop.stop();
                mQuery.finish();
                return finished(sink, {Outcome::End::limited, {}, mRows});
            }
            if (const auto error = sink.add(cells.row()))
                return leave(Outcome::End::refused, *error);
            ++mRows;
        }
        // A failure between two rows ends the loop like the last row does.
        if (mQuery.lastError().isValid()) return broken(said(command));
        return finished(sink, {Outcome::End::complete, {}, mRows});
    }

private:
    /// The driver would read all rows that are left; so the engine is stopped first.
    Outcome leave(Outcome::End end, const QString& message = {}) {
        mEngineStop.stop();
        mQuery.finish();
        return {end, message, mRows};
    }

    Outcome finished(Sink& sink, const Outcome& outcome) {
        if (const auto error = sink.finish()) return {Outcome::End::refused, *error, mRows};
        return outcome;
    }

    /// What PostgreSQL shows of a text below its words is seen where the text was typed.
    QString said(const Command& command) const {
        const QString all = words(mQuery.lastError());
        if (!command.isTyped) return all;
        const bool shows = mConnection.database().driverName() == QLatin1String("QPSQL");
        return (shows ? all.section(u'\n', 0, 0) : all).simplified();
    }

    Outcome broken(const QString& said) {
        mQuery.finish();
        if (mStop) return {Outcome::End::cancelled, {}, mRows};
        return {answers(mConnection) ? Outcome::End::failed : Outcome::End::lost, said, mRows};
    }

    const reader::Connection& mConnection;
    const std::atomic<bool>& mStop;
    EngineStop mEngineStop; // outlives the statement
    QSqlQuery mQuery;
    qint64 mRows = 0;
};

} // namespace

Outcome fetch(const Connector& connector, const Command& command, Sink& sink,
              const std::atomic<bool>& stop) {
    const auto connection = connector();
    if (stop) return {Outcome::End::cancelled};
    if (!connection) return {Outcome::End::unreachable, inWords(connection.failure())};
    return Fetch(connector, *connection, stop).run(command, sink);
}

} // namespace zandor::designer
