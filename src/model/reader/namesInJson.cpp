#include "model/reader/namesInJson.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QStringTokenizer>

namespace zandor::reader {

void forEachName(const QString& array, const std::function<void(platform::String)>& use) {
    if (array.contains(u'\\')) {
        for (const auto& text : QJsonDocument::fromJson(array.toUtf8()).array())
            use(text.toString().toStdU16String());
        return;
    }
    // Without escapes every second part between quotation marks is a text as it stands.
    bool isText = false;
    for (const QStringView part : QStringTokenizer(array, u'"')) {
        if (isText) use({part.utf16(), static_cast<std::size_t>(part.size())});
        isText = !isText;
    }
}

} // namespace zandor::reader
