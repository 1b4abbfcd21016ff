#include "model/reader/serverError.h"

#include <Zandor/reader/rows.h>

#include <algorithm>
#include <array>

namespace zandor::reader {

using model::say;

namespace {

struct Advice {
    const char* words; ///< what the engine says, or a part of it
    model::Message (*advice)();
};

/// Behind the words that a wrong password gets as well.
constexpr const char* deniedDatabase = "' to database '";

/// An engine that was not reached, or turns one away, gives no code but only its words.
constexpr std::array<Advice, 17> byWords = {{
    {"no password supplied", say<MessageCode::givePassword>},
    {"password authentication failed", say<MessageCode::checkPassword>},
    {deniedDatabase, say<MessageCode::askAdministrator>},
    {"Access denied for user", say<MessageCode::checkPassword>},
    {"command denied to user", say<MessageCode::askOwner>},
    {"no pg_hba.conf entry", say<MessageCode::askAdministrator>},
    {"could not translate host name", say<MessageCode::checkHost>},
    {"Unknown MySQL server host", say<MessageCode::checkHost>},
    {"Connection refused", say<MessageCode::checkServer>},
    {"No such file or directory", say<MessageCode::checkServer>},
    {"Can't connect to", say<MessageCode::checkServer>},
    {"timeout expired", say<MessageCode::checkNetwork>},
    {"Unknown database", say<MessageCode::checkDatabase>},
    {"ermission denied", say<MessageCode::askOwner>},
    {"role \"", say<MessageCode::checkUser>},
    {"Data source name not found", say<MessageCode::checkDatabase>},
    {"database \"", say<MessageCode::checkDatabase>},
}};

} // namespace

Error serverError(const model::Message& failed, const QSqlError& error) {
    QString said = error.databaseText().simplified();
    if (said.isEmpty()) said = error.driverText().simplified();
    const auto known = std::ranges::find_if(
        byWords, [&](const Advice& each) { return said.contains(QLatin1String(each.words)); });
    return say<MessageCode::refusedByEngine>(failed, said.toStdU16String(),
                                             known == byWords.end() ? say<MessageCode::openAfresh>()
                                                                    : known->advice());
}

bool asksForPassword(const Error& error) {
    if (!error.message.is(MessageCode::refusedByEngine)) return false;
    const QString said = toQt(std::get<platform::String>(error.message.arguments()[1].content));
    // The first one begins so in all languages.
    static const std::array<QLatin1String, 3> words = {
        QLatin1String("fe_sendauth"), QLatin1String("password authentication failed"),
        QLatin1String("Access denied for user")};
    if (said.contains(QLatin1String(deniedDatabase))) return false;
    return std::any_of(words.begin(), words.end(),
                       [&](QLatin1String each) { return said.contains(each); });
}

} // namespace zandor::reader
