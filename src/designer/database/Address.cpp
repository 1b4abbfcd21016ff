#include "designer/database/Address.h"

#include <QFileInfo>
#include <QUrl>
#include <QUrlQuery>

namespace zandor::designer {

namespace {

const QString afterScheme = QStringLiteral("://");
const QString hostOption = QStringLiteral("host");
const QString passwordOption = QStringLiteral("password");

std::optional<Engine> engineOf(const QString& scheme) {
    if (scheme == QLatin1String("postgresql") || scheme == QLatin1String("postgres"))
        return Engine::PostgreSQL;
    if (scheme == QLatin1String("mysql") || scheme == QLatin1String("mariadb"))
        return Engine::MySQL;
    if (scheme == QLatin1String("odbc")) return Engine::ODBC;
    return {};
}

QString schemeOf(Engine engine) {
    switch (engine) {
    case Engine::PostgreSQL: return QStringLiteral("postgresql");
    case Engine::MySQL: return QStringLiteral("mysql");
    default: return QStringLiteral("odbc");
    }
}

bool isUrl(const QString& address) { return address.contains(afterScheme); }

/// Whether a "@" behind the first "/" shows that the user's name was taken for the host, and the
/// beginning of the password for the port.
bool mistakesPasswordForPort(const QUrl& url) {
    return url.userName().isEmpty() && url.port() > 0 &&
           url.path(QUrl::FullyEncoded).contains(u'@');
}

/// Of an address with characters in its password that should have been written with "%".
PartedAddress partByText(const QString& address) {
    const auto begin = address.indexOf(afterScheme) + afterScheme.size();
    const auto end = address.lastIndexOf(u'@');
    const auto colon = address.indexOf(u':', begin);
    if (colon < 0 || colon > end) return {address, {}};
    return {address.left(colon) + address.mid(end), address.mid(colon + 1, end - colon - 1)};
}

} // namespace

std::optional<Address> parseAddress(const QString& text) {
    const QString trimmed = text.trimmed();
    Address address;
    if (!isUrl(trimmed)) {
        address.file = trimmed;
        return address;
    }
    const QUrl url(trimmed, QUrl::StrictMode);
    if (url.isLocalFile()) {
        address.file = url.toLocalFile();
        return address;
    }
    const auto engine = engineOf(url.scheme());
    if (!url.isValid() || !engine) return {};
    QUrlQuery query(url.query(QUrl::FullyEncoded));
    address.engine = *engine;
    address.host = query.queryItemValue(hostOption, QUrl::FullyDecoded);
    if (address.host.isEmpty()) address.host = url.host();
    query.removeAllQueryItems(hostOption);
    address.options = query.toString(QUrl::FullyEncoded);
    address.port = std::max(url.port(), 0);
    address.user = url.userName(QUrl::FullyDecoded);
    address.database = url.path(QUrl::FullyDecoded).mid(1);
    return address;
}

QString textOf(const Address& address) {
    if (address.engine == Engine::SQLite) return address.file;
    QUrl url;
    QUrlQuery query(address.options);
    url.setScheme(schemeOf(address.engine));
    const bool socket = address.host.startsWith(u'/');
    if (socket)
        query.addQueryItem(hostOption, QString::fromLatin1(QUrl::toPercentEncoding(
                                           address.host, QByteArrayLiteral("/"))));
    url.setHost(socket || address.host.isEmpty() ? QStringLiteral("localhost")
                                                 : address.host.trimmed());
    if (address.port > 0) url.setPort(address.port);
    if (!address.user.isEmpty()) url.setUserName(address.user, QUrl::DecodedMode);
    if (!address.database.isEmpty()) url.setPath(u'/' + address.database, QUrl::DecodedMode);
    if (!query.isEmpty()) url.setQuery(query);
    return url.toString(QUrl::FullyEncoded);
}

PartedAddress partPassword(const QString& address) {
    if (!isUrl(address)) return {address, {}};
    QUrl url(address, QUrl::StrictMode);
    if (url.isLocalFile()) return {address, {}};
    if (!url.isValid() || mistakesPasswordForPort(url)) return partByText(address);
    QUrlQuery query(url.query(QUrl::FullyEncoded));
    const bool asOption = query.hasQueryItem(passwordOption);
    if (url.password().isEmpty() && !asOption) return {address, {}};
    QString password = url.password(QUrl::FullyDecoded);
    if (password.isEmpty()) password = query.queryItemValue(passwordOption, QUrl::FullyDecoded);
    url.setPassword({});
    query.removeAllQueryItems(passwordOption);
    if (asOption) url.setQuery(query.isEmpty() ? QUrlQuery() : query);
    if (query.isEmpty()) url.setQuery(QString());
    return {url.toString(QUrl::FullyEncoded), password};
}

QString lastingAddress(const QString& address) {
    const auto parts = parseAddress(address);
    return parts && parts->engine == Engine::SQLite ? QFileInfo(parts->file).absoluteFilePath()
                                                    : address;
}

QString nameOfDatabase(const QString& address) {
    const auto parts = parseAddress(address);
    if (!parts) return {};
    if (parts->engine == Engine::SQLite) return QFileInfo(parts->file).fileName();
    return parts->database.isEmpty() ? parts->host : parts->database;
}

} // namespace zandor::designer
