#include "designer/run/EngineStop.h"

#include "designer/run/sharedSqlite.h"

#include <Zandor/reader/dialectOf.h>

#include <QSqlQuery>

#include <sqlite3.h>

namespace zandor::designer {

namespace {

constexpr int stepsBetweenQuestions = 1000; // some microseconds
constexpr std::chrono::milliseconds betweenQuestions(50);

/// What stops a statement of this connection when said over another, or nothing.
QString killing(const QSqlDatabase& database) {
    const auto dialect = reader::dialectOf(database);
    const bool postgres = dialect == model::sql::Dialect::PostgreSQL;
    if (!postgres && dialect != model::sql::Dialect::MySQL) return {};
    QSqlQuery query(database);
    query.setForwardOnly(true);
    const bool told = query.exec(postgres ? QStringLiteral("SELECT pg_backend_pid()")
                                          : QStringLiteral("SELECT CONNECTION_ID()"));
    if (!told || !query.next()) return {};
    return (postgres ? QStringLiteral("SELECT pg_cancel_backend(%1)")
                     : QStringLiteral("KILL QUERY %1"))
        .arg(query.value(0).toLongLong());
}

} // namespace

EngineStop::EngineStop(const QSqlDatabase& database, const Connector& another,
                       const std::atomic<bool>& flag)
    : mFlag(flag) {
    if (database.driverName() == QLatin1String("QSQLITE")) {
        askSqlite(database);
    } else if (const QString statement = killing(database); !statement.isEmpty()) {
        mWatch = std::thread([this, &another, statement] { watch(another, statement); });
    }
}

EngineStop::~EngineStop() {
    if (mSqlite) sqlite3_progress_handler(static_cast<sqlite3*>(mSqlite), 0, nullptr, nullptr);
    if (!mWatch.joinable()) return;
    {
        const std::lock_guard lock(mMutex);
        mEnded = true;
    }
    mChange.notify_one();
    mWatch.join();
}

void EngineStop::stop() {
    {
        const std::lock_guard lock(mMutex);
        mStopped = true;
    }
    mChange.notify_one();
}

// Not sqlite3_interrupt: it does nothing to a statement that begins a moment later, and the thread
// that calls it has to know that the connection is still there.
void EngineStop::askSqlite(const QSqlDatabase& database) {
    sqlite3* const handle = sharedSqlite(database);
    if (!handle) return; // then it stops with the next row
    mSqlite = handle;
    const auto wished = [](void* self) {
        return static_cast<const EngineStop*>(self)->isWished() ? 1 : 0;
    };
    sqlite3_progress_handler(handle, stepsBetweenQuestions, wished, this);
}

void EngineStop::watch(const Connector& another, const QString& killing) {
    std::optional<reader::Connection> connection;
    std::unique_lock lock(mMutex);
    while (!mEnded) {
        // The flag may be set by a signal, which can wake nobody; so one looks now and then.
        mChange.wait_for(lock, betweenQuestions, [this] { return mEnded || mStopped; });
        if (mEnded || !isWished()) continue;
        lock.unlock();
        if (!connection)
            if (auto made = another()) connection = std::move(*made);
        if (connection) QSqlQuery(connection->database()).exec(killing);
        lock.lock();
        if (!mEnded) mChange.wait_for(lock, betweenQuestions, [this] { return mEnded; });
    }
}

} // namespace zandor::designer
