#pragma once

#include <QProcess>
#include <QString>
#include <QStringList>

#include <csignal>
#include <stdexcept>

#include <unistd.h>

// What servers that tests start have in common.

constexpr int serverPatience = 120'000; // milliseconds; a crowded machine is slow

/// Throws std::runtime_error with what the process has said.
[[noreturn]] inline void failWithWords(const QString& what, QProcess& process) {
    const QString words = QString::fromLocal8Bit(process.readAll()).trimmed();
    throw std::runtime_error(
        QStringLiteral("%1 (%2): %3").arg(what, process.errorString(), words).toStdString());
}

/// Starts one of a server's programs in a folder, to be told to end by the signal of that name when
/// this program dies. Where the caller is root, whom servers refuse to serve, it runs as `user`.
inline void launchAs(const QString& user, const QString& signal, QProcess& process,
                     const QString& folder, const QString& program, const QStringList& arguments) {
    QStringList line{QStringLiteral("--pdeathsig"), signal};
    if (geteuid() == 0)
        line += {QStringLiteral("--reuid=") + user, QStringLiteral("--regid=") + user,
                 QStringLiteral("--init-groups")};
    line += {QStringLiteral("--"), program};
    process.setProcessChannelMode(QProcess::MergedChannels);
    process.setWorkingDirectory(folder);
    process.start(QStringLiteral("setpriv"), line + arguments);
    if (!process.waitForStarted()) failWithWords(QStringLiteral("setpriv did not start"), process);
}

/// Gives a folder to the user whom launchAs() takes.
inline void giveFolderTo(const QString& user, const QString& folder) {
    if (geteuid() != 0) return;
    QProcess chown;
    chown.start(QStringLiteral("chown"), {user, folder});
    if (!chown.waitForFinished() || chown.exitCode() != 0)
        failWithWords(QStringLiteral("The folder could not be given to the user ") + user, chown);
}

/// Sends a signal and waits for the end; kills what does not end.
inline void endBySignal(QProcess& process, int signal) {
    if (process.state() == QProcess::NotRunning) return;
    ::kill(static_cast<pid_t>(process.processId()), signal);
    if (!process.waitForFinished(serverPatience)) process.kill();
    process.waitForFinished();
}
