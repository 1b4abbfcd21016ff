#include "designer/shell/openForTask.h"

#include "designer/database/Address.h"
#include "designer/shell/askPassword.h"
#include "model/reader/serverError.h"

namespace zandor::designer::shell {

reader::Result<OpenedForTask> openForTask(const QString& address) {
    constexpr int mostTries = 3; // for a password
    auto [bare, password] = partPassword(address);
    auto connection = reader::openDatabase(bare, password);
    for (int tries = 0; !connection && tries < mostTries; ++tries) {
        if (!reader::asksForPassword(connection.failure())) break;
        const auto typed = askPassword(bare);
        if (!typed) break;
        password = *typed;
        connection = reader::openDatabase(bare, password);
    }
    if (!connection) return connection.failure();
    return OpenedForTask{std::move(*connection), bare, password};
}

} // namespace zandor::designer::shell
