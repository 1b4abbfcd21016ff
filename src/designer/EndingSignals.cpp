#include "designer/EndingSignals.h"

#include <QSocketNotifier>

#include <fcntl.h>
#include <unistd.h>

#include <cerrno>
#include <csignal>

namespace zandor::designer {

namespace {

constexpr int signalNumbers[] = {SIGTERM, SIGINT, SIGHUP};

/// The end of a pipe that the handler writes to: in a handler next to nothing else is allowed.
int toLoop = -1;

extern "C" void passOn(int number) {
    const int before = errno;
    const auto byte = static_cast<unsigned char>(number);
    std::signal(number, SIG_DFL);
    [[maybe_unused]] const auto written = ::write(toLoop, &byte, 1);
    errno = before;
}

} // namespace

EndingSignals::EndingSignals(QObject* parent) : QObject(parent) {
    int ends[2];
    if (toLoop >= 0 || ::pipe2(ends, O_CLOEXEC | O_NONBLOCK) != 0) return;
    mRead = ends[0];
    toLoop = ends[1];
    auto* const notifier = new QSocketNotifier(mRead, QSocketNotifier::Read, this);
    connect(notifier, &QSocketNotifier::activated, this, &EndingSignals::heed);
    for (const int number : signalNumbers)
        if (std::signal(number, passOn) == SIG_IGN) std::signal(number, SIG_IGN);
}

EndingSignals::~EndingSignals() {
    if (mRead < 0) return;
    for (const int number : signalNumbers)
        if (std::signal(number, SIG_DFL) == SIG_IGN) std::signal(number, SIG_IGN);
    ::close(std::exchange(toLoop, -1));
    ::close(mRead);
}

void EndingSignals::heed() {
    unsigned char number = 0;
    if (::read(mRead, &number, 1) != 1) return;
    emit ending();
    std::raise(number);
}

} // namespace zandor::designer
