#pragma once

#include <Zandor/files/Error.h>

#include <QString>
#include <QStringList>

namespace zandor::designer {

/// A message of the query model, which speaks English, in the designer's language; as it stands
/// when it is not one that the designer knows.
QString inWords(const QString& message);
/// Of a file that could not be written; nothing for nothing.
std::optional<QString> inWords(const std::optional<files::Error>& error);

/// The messages that it knows, in English, with %1 and so on in the place of names and numbers.
QStringList knownMessages();

} // namespace zandor::designer
