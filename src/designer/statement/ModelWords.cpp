#include "designer/statement/ModelWords.h"

#include <QCoreApplication>

namespace zandor::designer {

QString inWords(const model::Message& message) {
    return QString::fromStdU16String(message.words([](const char* english) {
        return QCoreApplication::translate("Model", english).toStdU16String();
    }));
}

QString inWords(const files::Error& error) { return inWords(error.message); }

QString inWords(const reader::Error& error) { return inWords(error.message); }

std::optional<QString> inWords(const std::optional<files::Error>& error) {
    if (!error) return {};
    return inWords(error->message);
}

} // namespace zandor::designer
