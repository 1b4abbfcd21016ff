#include "model/reader/serverError.h"

#include <algorithm>
#include <array>

namespace zandor::reader {

namespace {

struct Advice {
    const char* words; ///< what the engine says, or a part of it
    const char* advice;
};

/// An engine that was not reached, or turns one away, gives no code but only its words.
constexpr std::array<Advice, 14> byWords = {{
    {"no password supplied", "give a password"},
    {"password authentication failed", "check the user name and the password"},
    {"Access denied for user", "check the user name and the password"},
    {"no pg_hba.conf entry", "ask the server's administrator to let you in"},
    {"could not translate host name", "check the name of the host"},
    {"Unknown MySQL server host", "check the name of the host"},
    {"Connection refused", "see that the server runs, and check host and port"},
    {"No such file or directory", "see that the server runs, and check host and port"},
    {"Can't connect to", "see that the server runs, and check host and port"},
    {"timeout expired", "see that the server can be reached, and check host and port"},
    {"Unknown database", "check the name of the database"},
    {"ermission denied", "ask the owner for permission"},
    {"role \"", "check the user name"},
    {"database \"", "check the name of the database"},
}};

} // namespace

Error serverError(const QString& failed, const QSqlError& error) {
    QString said = error.databaseText().simplified();
    if (said.isEmpty()) said = error.driverText().simplified();
    QString advice = QStringLiteral("open the database afresh");
    for (const Advice& each : byWords)
        if (said.contains(QLatin1String(each.words))) {
            advice = QLatin1String(each.advice);
            break;
        }
    return {QStringLiteral("%1 (%2): %3.").arg(failed, said, advice)};
}

bool asksForPassword(const QString& message) {
    // The first one begins so in all languages.
    static const std::array<QLatin1String, 3> words = {
        QLatin1String("fe_sendauth"), QLatin1String("password authentication failed"),
        QLatin1String("Access denied for user")};
    return std::any_of(words.begin(), words.end(),
                       [&](QLatin1String each) { return message.contains(each); });
}

} // namespace zandor::reader
