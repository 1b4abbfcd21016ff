#pragma once

#include "designer/run/fetch.h"

#include <QThread>

#include <memory>

namespace zandor::designer {

/// A statement that runs on a thread of its own. Its signals come on the thread that made it.
class Worker final : public QThread {
    Q_OBJECT

public:
    Worker(Connector connector, Command command, std::shared_ptr<Sink> sink);

    /// Stops the statement on the engine; ended() tells when that is done.
    void cancel() { mStop = true; }
    /// How many rows have come.
    qint64 rows() const { return mRows; }

signals:
    /// The columns are known, or enough rows for a first look have come.
    void progressed();
    void ended(const designer::Outcome& outcome);

protected:
    void run() override;

private:
    class Counter;

    const Connector mConnector;
    const Command mCommand;
    const std::shared_ptr<Sink> mSink;
    std::atomic<bool> mStop = false;
    std::atomic<qint64> mRows = 0;
};

/// Cancels a worker and waits for it; one whose server does not answer is left behind to end when
/// it can.
struct LetGo {
    void operator()(Worker* worker) const;
};
using WorkerPointer = std::unique_ptr<Worker, LetGo>;

} // namespace zandor::designer
