#pragma once

#include <QByteArray>
#include <QString>

#include <optional>

class QIODevice;

namespace designer {

/// What went wrong, in one line.
std::optional<QString> writeAll(QIODevice& device, const QByteArray& bytes);

} // namespace designer
