#include "designer/statement/readStatementFile.h"

#include "designer/tr.h"

#include <QFile>
#include <QFileInfo>
#include <QStringConverter>

namespace zandor::designer {

model::Result<QString, Undrawn> readStatementFile(const QString& path) {
    const QFileInfo info(path);
    if (!info.exists()) return Undrawn{tr("There is no file \"%1\"; check the path.").arg(path)};
    if (info.isDir())
        return Undrawn{tr("\"%1\" is a folder; name a file with a statement.").arg(path)};
    QFile file(path);
    if (!file.open(QIODevice::ReadOnly))
        return Undrawn{tr("The file \"%1\" cannot be read: %2.").arg(path, file.errorString())};
    return statementTextOf(file.read(mostStatementBytes + 1), path);
}

model::Result<QString, Undrawn> statementTextOf(const QByteArray& bytes, const QString& name) {
    if (bytes.size() > mostStatementBytes)
        return Undrawn{tr("\"%1\" is too large for a statement.").arg(name)};
    QStringDecoder decoder(
        QStringConverter::encodingForData(bytes).value_or(QStringConverter::Utf8));
    QString text = decoder.decode(bytes);
    if (decoder.hasError() || text.contains(QChar(0)))
        return Undrawn{tr("\"%1\" is no text in UTF-8; save it as such.").arg(name)};
    return text;
}

} // namespace zandor::designer
