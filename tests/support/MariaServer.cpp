#include "support/MariaServer.h"

#include "support/ServerProcess.h"

#include <QDeadlineTimer>
#include <QSqlError>
#include <QStandardPaths>
#include <QThread>

#include <csignal>
#include <stdexcept>

namespace {

/// Debian keeps the server where a user's path does not lead.
QString mariaProgram(const QString& name) {
    const QString inPath = QStandardPaths::findExecutable(name);
    if (!inPath.isEmpty()) return inPath;
    return QStandardPaths::findExecutable(
        name, {QStringLiteral("/usr/sbin"), QStringLiteral("/usr/local/sbin")});
}

/// Small and quick instead of safe. The making and the serving have to agree about the sizes.
const QStringList quick = {
    QStringLiteral("--innodb-log-file-size=4M"), QStringLiteral("--innodb-flush-method=nosync"),
    QStringLiteral("--innodb-flush-log-at-trx-commit=0"),
    QStringLiteral("--skip-innodb-doublewrite"), QStringLiteral("--innodb-buffer-pool-size=32M")};

} // namespace

std::optional<QString> MariaServer::missing() {
    if (mariaProgram(QStringLiteral("mariadbd")).isEmpty() ||
        mariaProgram(QStringLiteral("mariadb-install-db")).isEmpty())
        return QStringLiteral("the package mariadb-server-core is not installed");
    if (!QSqlDatabase::isDriverAvailable(QStringLiteral("QMYSQL")))
        return QStringLiteral("the package libqt6sql6-mysql is not installed");
    return {};
}

// Not in TMPDIR: the path of a socket has to be short.
MariaServer::MariaServer() : mDirectory(QStringLiteral("/tmp/zandor-mariadb-XXXXXX")) {
    if (!mDirectory.isValid()) throw std::runtime_error(mDirectory.errorString().toStdString());
    // A server that begins removes what another one has for a while in the same folder.
    const QStringList places = {QStringLiteral("--datadir=") +
                                    mDirectory.filePath(QStringLiteral("data")),
                                QStringLiteral("--tmpdir=") + mDirectory.path()};
    QProcess install;
    launch(install, QStringLiteral("mariadb-install-db"),
           QStringList{QStringLiteral("--no-defaults")} + places +
               QStringList{QStringLiteral("--auth-root-authentication-method=normal"),
                           QStringLiteral("--skip-test-db"),
                           QStringLiteral("--skip-name-resolve")} +
               quick);
    if (!install.waitForFinished(serverPatience) || install.exitCode() != 0)
        failWithWords(QStringLiteral("mariadb-install-db failed"), install);
    launch(mServer, QStringLiteral("mariadbd"),
           QStringList{QStringLiteral("--no-defaults")} + places +
               QStringList{QStringLiteral("--socket=") + socket(),
                           QStringLiteral("--skip-networking"), QStringLiteral("--skip-log-bin"),
                           QStringLiteral("--character-set-server=utf8mb4"),
                           QStringLiteral("--pid-file=") +
                               mDirectory.filePath(QStringLiteral("pid"))} +
               quick);
    waitUntilItAnswers();
}

MariaServer::~MariaServer() { endBySignal(mServer, SIGTERM); }

void MariaServer::launch(QProcess& process, const QString& program,
                         const QStringList& arguments) const {
    // Of the servers' users, "mysql" is there only with the package that also starts a server.
    QStringList line = arguments;
    if (geteuid() == 0) line << QStringLiteral("--user=root");
    launchAs(QStringLiteral("root"), QStringLiteral("TERM"), process, mDirectory.path(),
             mariaProgram(program), line);
}

void MariaServer::waitUntilItAnswers() {
    const QDeadlineTimer end(serverPatience);
    const QString probe = QStringLiteral("mariadb-probe");
    for (bool answers = false; !answers;) {
        if (mServer.waitForFinished(0) || mServer.state() == QProcess::NotRunning ||
            end.hasExpired())
            failWithWords(QStringLiteral("The MariaDB server does not answer"), mServer);
        QThread::msleep(50);
        if (!QFile::exists(socket())) continue;
        answers = connect(probe).isOpen();
        QSqlDatabase::removeDatabase(probe);
    }
}

QSqlDatabase MariaServer::connect(const QString& connectionName) const {
    QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QMYSQL"), connectionName);
    database.setConnectOptions(QStringLiteral("UNIX_SOCKET=") + socket());
    database.setUserName(QStringLiteral("root"));
    database.open();
    return database;
}
