#pragma once

#include <QProcess>
#include <QSqlDatabase>
#include <QTemporaryDir>

/// A PostgreSQL server of one's own: made in a temporary directory, heard through a socket in it,
/// and gone with the object, or with the program if that dies. It trusts whoever connects, for
/// nobody else can see the socket.
class PostgresServer {
public:
    /// Makes and starts it, and waits until it answers. Throws std::runtime_error, with the
    /// server's own words, when that fails.
    PostgresServer();
    ~PostgresServer();
    PostgresServer(const PostgresServer&) = delete;
    PostgresServer& operator=(const PostgresServer&) = delete;

    /// An open connection to the server's empty database under a connection name.
    QSqlDatabase connect(const QString& connectionName) const;
    /// The folder of its socket, which takes the place of a host.
    QString folder() const { return mDirectory.path(); }

    /// Ends it as a crash does. No more connections then; those that there are end when their
    /// sessions see it.
    void kill();
    /// Starts it again after kill(), with the same data and at the same place.
    void restart();
    /// Lets a user in with a password only, from the next connection on.
    void requirePassword(const QString& user);

private:
    void start();
    /// Runs one of the server's programs, as the user "postgres" where the caller is root, whom
    /// the server refuses to serve.
    void launch(QProcess& process, const QString& program, const QStringList& arguments) const;
    void makeDirectory();
    void waitUntilItAnswers();
    bool answersBeforeItEnds();

    QTemporaryDir mDirectory;
    QProcess mServer;
};
