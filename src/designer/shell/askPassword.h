#pragma once

#include <QString>

#include <optional>

namespace zandor::designer::shell {

/// Asks the person at the terminal for a password, which is not shown. Nothing when there is no
/// terminal, or no answer.
std::optional<QString> askPassword(const QString& address);

} // namespace zandor::designer::shell
