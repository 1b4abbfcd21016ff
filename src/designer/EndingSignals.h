#pragma once

#include <QObject>

namespace zandor::designer {

/// Tells of the signals that end a program from outside (SIGTERM, SIGINT, SIGHUP) while it can
/// still do something; then the signal takes its course. A second one ends the program at once. One
/// of a process, and signals that the parent wants ignored stay so.
class EndingSignals final : public QObject {
    Q_OBJECT

public:
    explicit EndingSignals(QObject* parent = nullptr);
    ~EndingSignals() override;

signals:
    /// On the thread of the object, from its event loop. Nothing that waits for a person.
    void ending();

private:
    void heed();

    int mRead = -1;
};

} // namespace zandor::designer
