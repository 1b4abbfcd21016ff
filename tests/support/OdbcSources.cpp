#include "support/OdbcSources.h"

#include <QDir>
#include <QFile>
#include <QSqlDatabase>

#include <stdexcept>

namespace {

/// Where it is depends on the kind of machine; empty when it is nowhere.
QString fileOf(const OdbcDriver& driver) {
    const QDir lib(QStringLiteral("/usr/lib"));
    for (const QString& folder : lib.entryList({QStringLiteral("*-linux-gnu*")}, QDir::Dirs)) {
        const QString file =
            lib.filePath(folder + QStringLiteral("/odbc/") + QLatin1String(driver.file));
        if (QFile::exists(file)) return file;
    }
    return {};
}

} // namespace

std::optional<QString> OdbcSources::missing(const OdbcDriver& driver) {
    if (!QSqlDatabase::isDriverAvailable(QStringLiteral("QODBC")))
        return QStringLiteral("the package libqt6sql6-odbc is not installed");
    if (fileOf(driver).isEmpty())
        return QStringLiteral("the package %1 is not installed").arg(QLatin1String(driver.package));
    return {};
}

OdbcSources::OdbcSources() {
    qputenv("ODBCSYSINI", mFolder.path().toUtf8());
    qputenv("ODBCINI", mFolder.filePath(QStringLiteral("odbc.ini")).toUtf8());
}

OdbcSources::~OdbcSources() {
    qunsetenv("ODBCSYSINI");
    qunsetenv("ODBCINI");
}

QString OdbcSources::add(const OdbcDriver& driver, const QStringList& settings) {
    static int sources = 0;
    const QString name = QStringLiteral("source%1").arg(++sources);
    QFile file(mFolder.filePath(QStringLiteral("odbc.ini")));
    if (!file.open(QIODevice::Append)) throw std::runtime_error("odbc.ini cannot be written");
    const QStringList lines =
        QStringList{QStringLiteral("[%1]").arg(name), QStringLiteral("Driver=") + fileOf(driver)} +
        settings;
    file.write(lines.join(u'\n').toUtf8() + '\n');
    return name;
}
