#include "designer/tables/tableMime.h"

#include <QDataStream>
#include <QIODevice>
#include <QMimeData>

namespace zandor::designer {

namespace {

const QString tablesFormat = QStringLiteral("application/x-zandor-tables");

} // namespace

std::unique_ptr<QMimeData> tablesAsMime(const std::vector<reader::TableId>& tables) {
    QByteArray bytes;
    QDataStream stream(&bytes, QIODevice::WriteOnly);
    for (const auto& id : tables)
        stream << QString::fromStdU16String(id.schema) << QString::fromStdU16String(id.name);
    auto data = std::make_unique<QMimeData>();
    data->setData(tablesFormat, bytes);
    return data;
}

bool hasTables(const QMimeData& data) { return data.hasFormat(tablesFormat); }

std::vector<reader::TableId> tablesOfMime(const QMimeData& data) {
    const QByteArray bytes = data.data(tablesFormat);
    QDataStream stream(bytes);
    std::vector<reader::TableId> tables;
    while (!stream.atEnd()) {
        QString schema, name;
        stream >> schema >> name;
        if (stream.status() != QDataStream::Ok) return {};
        tables.push_back({schema.toStdU16String(), name.toStdU16String()});
    }
    return tables;
}

} // namespace zandor::designer
