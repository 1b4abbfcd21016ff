#include "designer/placeOfSample.h"

#include <QCoreApplication>
#include <QDir>

namespace zandor::designer {

QString placeOfSample() {
    const QDir program(QCoreApplication::applicationDirPath());
    const QString built = QStringLiteral("../../sample/trading.sqlite");
    const QString installed = QStringLiteral("../share/zandor-designer/trading.sqlite");
    return QDir::cleanPath(program.filePath(program.exists(built) ? built : installed));
}

} // namespace zandor::designer
