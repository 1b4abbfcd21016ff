#pragma once

#include <QProcess>
#include <QSqlDatabase>
#include <QTemporaryDir>

#include <optional>

/// A MariaDB server of one's own: made in a temporary directory, heard through a socket in it, and
/// gone with the object, or with the program if that dies. Its user "root" needs no password, for
/// nobody else can see the socket.
class MariaServer {
public:
    /// What has to be installed first, if anything.
    static std::optional<QString> missing();

    /// Makes and starts it, and waits until it answers. Throws std::runtime_error, with the
    /// server's own words, when that fails.
    MariaServer();
    ~MariaServer();
    MariaServer(const MariaServer&) = delete;
    MariaServer& operator=(const MariaServer&) = delete;

    /// An open connection of the user "root" under a connection name.
    QSqlDatabase connect(const QString& connectionName) const;
    /// The file of its socket.
    QString socket() const { return mDirectory.filePath(QStringLiteral("socket")); }

private:
    void launch(QProcess& process, const QString& program, const QStringList& arguments) const;
    void waitUntilItAnswers();

    QTemporaryDir mDirectory;
    QProcess mServer;
};
