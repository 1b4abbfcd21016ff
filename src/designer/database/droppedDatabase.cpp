#include "designer/database/droppedDatabase.h"

#include <QFile>
#include <QFileInfo>
#include <QMimeData>
#include <QUrl>

namespace zandor::designer {

std::optional<QString> droppedDatabase(const QMimeData& data) {
    const QList<QUrl> urls = data.urls();
    if (urls.size() != 1 || !urls.front().isLocalFile()) return {};
    const QString path = urls.front().toLocalFile();
    if (!QFileInfo(path).isFile()) return {};
    // By its content, for a database may have any suffix and a query file is dropped as well.
    QFile file(path);
    const QByteArray signature("SQLite format 3\0", 16);
    if (!file.open(QIODevice::ReadOnly) || file.read(signature.size()) != signature) return {};
    return path;
}

} // namespace zandor::designer
