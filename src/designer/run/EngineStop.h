#pragma once

#include "designer/run/fetch.h"

#include <condition_variable>
#include <mutex>
#include <thread>

namespace zandor::designer {

/// Stops, on the engine itself, what runs over a connection: as soon as a flag is set or stop() is
/// called. Made before the statement begins, and gone after its end, on the connection's thread.
///
/// SQLite asks between its steps whether to go on. A server is told from a second connection, again
/// and again until the statement has ended, for the first word may come before the statement does.
class EngineStop {
public:
    /// All of them outlive the object.
    EngineStop(const QSqlDatabase& database, const Connector& another,
               const std::atomic<bool>& flag);
    ~EngineStop();
    EngineStop(const EngineStop&) = delete;
    EngineStop& operator=(const EngineStop&) = delete;

    void stop();

private:
    void askSqlite(const QSqlDatabase& database);
    void watch(const Connector& another, const QString& killing);
    bool isWished() const { return mFlag || mStopped; }

    const std::atomic<bool>& mFlag;
    std::atomic<bool> mStopped = false;
    void* mSqlite = nullptr; ///< the driver's handle
    std::mutex mMutex;
    std::condition_variable mChange;
    bool mEnded = false;
    std::thread mWatch; ///< only for a server
};

} // namespace zandor::designer
