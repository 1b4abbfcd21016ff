#include "designer/database/opening.h"

#include "designer/database/Address.h"
#include "designer/database/PasswordPrompt.h"
#include "designer/database/patiently.h"
#include "designer/statement/ModelWords.h"
#include "model/reader/serverError.h"

#include <QCoreApplication>

namespace zandor::designer {

namespace {

using Take = std::function<std::optional<reader::Error>(Database::Tables)>;

reader::Result<Database::Tables> listOfTables(const Connector& connect) {
    const auto connection = connect();
    if (!connection) return connection.failure();
    return reader::makeReader(connection->database())->tables();
}

Opening refused(const reader::Error& error) {
    return {false, inWords(error), reader::asksForPassword(error)};
}

/// Lets a thread find out whether the database can be opened, and opens it here when it can: a
/// connection belongs to the thread that made it.
Opening openBy(const Connector& connect, const QString& name, QWidget* window, const Take& take) {
    auto tables = patiently<reader::Result<Database::Tables>>(
        QCoreApplication::translate("zandor::designer::Opening", "Connecting to %1\u2026")
            .arg(name),
        window, [connect] { return listOfTables(connect); });
    if (!tables) return {};
    if (!*tables) return refused(tables->failure());
    const auto error = take(std::move(**tables));
    return error ? refused(*error) : Opening{true};
}

} // namespace

Opening openPatiently(Database& database, const QString& address, const QString& password,
                      QWidget* window) {
    return openBy(Database::connectorTo(address, password), nameOfDatabase(address), window,
                  [&](Database::Tables tables) {
                      return database.open(address, password, std::move(tables));
                  });
}

Opening renewPatiently(Database& database, QWidget* window) {
    return openBy(database.connector(), database.name(), window,
                  [&](Database::Tables tables) { return database.renew(std::move(tables)); });
}

Opening openAskingForPassword(Database& database, const QString& address, QWidget* window) {
    const PartedAddress parted = partPassword(address);
    QString password = parted.password;
    while (true) {
        Opening opening = openPatiently(database, parted.address, password, window);
        if (!opening.asksForPassword) return opening;
        const QString why = password.isEmpty() ? QString() : opening.error;
        const auto given = askForPassword(parted.address, why, window);
        if (!given) return {};
        password = *given;
    }
}

std::optional<QString> askForPassword(const QString& address, const QString& why, QWidget* window) {
    PasswordPrompt prompt(partPassword(address).address, why, window);
    if (prompt.exec() != QDialog::Accepted) return {};
    return prompt.password();
}

} // namespace zandor::designer
