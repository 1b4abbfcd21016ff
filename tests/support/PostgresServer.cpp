#include "support/PostgresServer.h"

#include "support/ServerProcess.h"

#include <QDeadlineTimer>
#include <QDir>
#include <QSqlError>
#include <QThread>

#include <csignal>
#include <stdexcept>

namespace {

/// Where Debian keeps the programs, which it does not put into the path: the newest version's.
QString programOf(const QString& name) {
    const QDir versions(QStringLiteral("/usr/lib/postgresql"));
    QString newest;
    int number = 0;
    for (const QString& version : versions.entryList(QDir::Dirs | QDir::NoDotAndDotDot)) {
        const QString program = versions.filePath(version + QStringLiteral("/bin/") + name);
        if (version.toInt() <= number || !QFile::exists(program)) continue;
        number = version.toInt();
        newest = program;
    }
    return newest.isEmpty() ? name : newest;
}

} // namespace

// Not in TMPDIR: the path of a socket has to be short.
PostgresServer::PostgresServer() : mDirectory(QStringLiteral("/tmp/zandor-postgres-XXXXXX")) {
    if (!mDirectory.isValid()) throw std::runtime_error(mDirectory.errorString().toStdString());
    makeDirectory();
    start();
    waitUntilItAnswers();
}

void PostgresServer::start() {
    const QString home = mDirectory.path();
    launch(mServer, QStringLiteral("postgres"),
           {QStringLiteral("-D"), home + QStringLiteral("/data"), QStringLiteral("-k"), home,
            QStringLiteral("-c"), QStringLiteral("listen_addresses="), QStringLiteral("-c"),
            QStringLiteral("fsync=off")});
}

PostgresServer::~PostgresServer() {
    endBySignal(mServer, SIGINT); // which ends the sessions that there are
}

void PostgresServer::kill() {
    mServer.kill();
    mServer.waitForFinished(serverPatience);
}

void PostgresServer::restart() {
    // It ends again as long as a session of the one before has not seen that this is gone.
    const QDeadlineTimer end(serverPatience);
    do start();
    while (!answersBeforeItEnds() && !end.hasExpired());
    waitUntilItAnswers();
}

void PostgresServer::requirePassword(const QString& user) {
    QFile rules(mDirectory.filePath(QStringLiteral("data/pg_hba.conf")));
    if (!rules.open(QIODevice::ReadWrite))
        throw std::runtime_error(rules.errorString().toStdString());
    const QByteArray before = rules.readAll();
    rules.seek(0); // the first rule that fits counts
    rules.write("local all " + user.toUtf8() + " scram-sha-256\n" + before);
    rules.close();
    ::kill(static_cast<pid_t>(mServer.processId()), SIGHUP);
    const QString probe = QStringLiteral("postgres-probe");
    const QDeadlineTimer end(serverPatience);
    for (bool enters = true; enters;) {
        if (end.hasExpired()) throw std::runtime_error("the server still asks for no password");
        QThread::msleep(20);
        {
            QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QPSQL"), probe);
            database.setHostName(folder());
            database.setUserName(user);
            database.setDatabaseName(QStringLiteral("postgres"));
            enters = database.open();
        }
        QSqlDatabase::removeDatabase(probe);
    }
}

void PostgresServer::launch(QProcess& process, const QString& program,
                            const QStringList& arguments) const {
    launchAs(QStringLiteral("postgres"), QStringLiteral("INT"), process, mDirectory.path(),
             programOf(program), arguments);
}

void PostgresServer::makeDirectory() {
    giveFolderTo(QStringLiteral("postgres"), mDirectory.path());
    QProcess initdb;
    launch(initdb, QStringLiteral("initdb"),
           {QStringLiteral("--pgdata=") + mDirectory.filePath(QStringLiteral("data")),
            QStringLiteral("--locale=C"), QStringLiteral("--encoding=UTF8"),
            QStringLiteral("--auth=trust"), QStringLiteral("--username=postgres"),
            QStringLiteral("--no-sync")});
    if (!initdb.waitForFinished(serverPatience) || initdb.exitCode() != 0)
        failWithWords(QStringLiteral("initdb failed; is the package postgresql installed?"),
                      initdb);
}

void PostgresServer::waitUntilItAnswers() {
    if (!answersBeforeItEnds())
        failWithWords(QStringLiteral("The PostgreSQL server does not answer"), mServer);
}

bool PostgresServer::answersBeforeItEnds() {
    const QDeadlineTimer end(serverPatience);
    const QString probe = QStringLiteral("postgres-probe");
    for (bool answers = false; !answers;) {
        if (mServer.waitForFinished(0) || mServer.state() == QProcess::NotRunning ||
            end.hasExpired())
            return false;
        QThread::msleep(50);
        answers = connect(probe).isOpen();
        QSqlDatabase::removeDatabase(probe);
    }
    return true;
}

QSqlDatabase PostgresServer::connect(const QString& connectionName) const {
    QSqlDatabase database = QSqlDatabase::addDatabase(QStringLiteral("QPSQL"), connectionName);
    database.setHostName(mDirectory.path());
    database.setUserName(QStringLiteral("postgres"));
    database.setDatabaseName(QStringLiteral("postgres"));
    database.open();
    return database;
}
