#include "Program.h"

#include <QDeadlineTimer>
#include <QThread>

#include <stdexcept>

Program::Program(const QString& path, const QStringList& arguments,
                 const QStringList& environment) {
    QProcessEnvironment variables = QProcessEnvironment::systemEnvironment();
    for (const QString& variable : environment) {
        const qsizetype equals = variable.indexOf(u'=');
        variables.insert(variable.left(equals), variable.mid(equals + 1));
    }
    mProcess.setProcessEnvironment(variables);
    mProcess.setProcessChannelMode(QProcess::ForwardedErrorChannel);
    mProcess.start(QStringLiteral("setpriv"),
                   QStringList{"--pdeathsig", "KILL", "--", path} + arguments);
    if (!mProcess.waitForStarted(patience))
        throw std::runtime_error("setpriv did not start: " + mProcess.errorString().toStdString());
}

Program::~Program() {
    if (mProcess.state() == QProcess::NotRunning) return;
    mProcess.terminate();
    if (!mProcess.waitForFinished(5'000)) mProcess.kill();
    mProcess.waitForFinished();
}

void Program::send(const QString& line) {
    mProcess.write(line.toUtf8() + '\n');
    if (!mProcess.waitForBytesWritten(patience))
        throw std::runtime_error("nobody hears \"" + line.toStdString() + '"');
}

QString Program::line() {
    const QDeadlineTimer end(patience);
    while (!mProcess.canReadLine())
        if (end.hasExpired() || !mProcess.waitForReadyRead(static_cast<int>(end.remainingTime())))
            throw std::runtime_error(mProcess.program().toStdString() + " " +
                                     mProcess.arguments().join(u' ').toStdString() +
                                     " says nothing");
    return QString::fromUtf8(mProcess.readLine()).chopped(1);
}

bool Program::endsWell() {
    return mProcess.waitForFinished(patience) && mProcess.exitStatus() == QProcess::NormalExit &&
           mProcess.exitCode() == 0;
}

void Program::kill() {
    mProcess.kill();
    mProcess.waitForFinished();
}

void await(const QString& what, const std::function<bool()>& holds) {
    const QDeadlineTimer end(patience);
    while (!holds()) {
        if (end.hasExpired())
            throw std::runtime_error("waited in vain until " + what.toStdString());
        QThread::msleep(15);
    }
}
