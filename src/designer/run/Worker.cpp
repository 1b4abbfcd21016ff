#include "designer/run/Worker.h"

namespace zandor::designer {

namespace {

constexpr qint64 firstLook = 100;        // rows; more than a screen shows
constexpr unsigned long patience = 3000; // milliseconds

} // namespace

/// Tells the worker of what goes to its sink.
class Worker::Counter final : public Sink {
public:
    explicit Counter(Worker& worker) : mWorker(worker) {}

    std::optional<QString> begin(const QStringList& columns) override {
        auto error = mWorker.mSink->begin(columns);
        emit mWorker.progressed();
        return error;
    }
    std::optional<QString> add(const Row& row) override {
        auto error = mWorker.mSink->add(row);
        if (++mWorker.mRows == firstLook) emit mWorker.progressed();
        return error;
    }
    std::optional<QString> finish() override { return mWorker.mSink->finish(); }

private:
    Worker& mWorker;
};

Worker::Worker(Connector connector, Command command, std::shared_ptr<Sink> sink)
    : mConnector(std::move(connector)), mCommand(std::move(command)), mSink(std::move(sink)) {}

void Worker::run() {
    Counter counter(*this);
    emit ended(fetch(mConnector, mCommand, counter, mStop));
}

void LetGo::operator()(Worker* worker) const {
    worker->disconnect();
    worker->cancel();
    if (worker->wait(patience))
        delete worker;
    else
        QObject::connect(worker, &QThread::finished, worker, &QObject::deleteLater);
}

} // namespace zandor::designer
