#include "designer/shell/askPassword.h"

#include "designer/shell/Words.h"

#include <QFile>

#include <termios.h>

namespace zandor::designer::shell {

namespace {

/// A terminal that does not show what is typed, as long as the object lives.
class Silence {
public:
    explicit Silence(int terminal) : mTerminal(terminal) {
        mKnown = tcgetattr(terminal, &mBefore) == 0;
        if (!mKnown) return;
        termios silent = mBefore;
        silent.c_lflag &= ~static_cast<tcflag_t>(ECHO);
        silent.c_lflag |= ECHONL;
        mKnown = tcsetattr(terminal, TCSAFLUSH, &silent) == 0;
    }
    ~Silence() {
        if (mKnown) tcsetattr(mTerminal, TCSAFLUSH, &mBefore);
    }
    Silence(const Silence&) = delete;
    Silence& operator=(const Silence&) = delete;

    bool holds() const { return mKnown; }

private:
    const int mTerminal;
    termios mBefore{};
    bool mKnown = false;
};

} // namespace

std::optional<QString> askPassword(const QString& address) {
    QFile terminal(QStringLiteral("/dev/tty"));
    if (!terminal.open(QIODevice::ReadWrite | QIODevice::Unbuffered)) return {};
    const Silence silence(terminal.handle());
    if (!silence.holds()) return {};
    terminal.write(Words::tr("Password for %1: ").arg(address).toLocal8Bit());
    QByteArray line = terminal.readLine();
    if (!line.endsWith('\n')) return {};
    line.chop(1);
    return QString::fromLocal8Bit(line);
}

} // namespace zandor::designer::shell
