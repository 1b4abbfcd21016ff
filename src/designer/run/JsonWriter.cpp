#include "designer/run/JsonWriter.h"

#include "designer/statement/ModelWords.h"

#include <nlohmann/json.hpp>

namespace zandor::designer {

namespace {

QByteArray quoted(const QByteArray& utf8) {
    return QByteArray::fromStdString(nlohmann::json(utf8.toStdString()).dump());
}

/// Engines have numbers that JSON has not: NaN and the infinities.
bool isJsonNumber(const QByteArray& text) {
    return nlohmann::json::accept(text.begin(), text.end());
}

QByteArray written(const Cell& cell) {
    switch (cell.kind) {
    case Cell::Kind::null: return "null";
    case Cell::Kind::boolean: return cell.text.toLatin1();
    case Cell::Kind::number:
        if (QByteArray text = cell.text.toLatin1(); isJsonNumber(text)) return text;
        break;
    case Cell::Kind::blob: return quoted(cell.blob.toBase64());
    case Cell::Kind::text: break;
    }
    return quoted(cell.text.toUtf8());
}

} // namespace

std::optional<QString> JsonWriter::begin(const QStringList& columns) {
    QStringList names;
    for (const QString& column : columns) {
        QString name = column;
        for (int n = 2; names.contains(name); ++n)
            name = QStringLiteral("%1_%2").arg(column).arg(n);
        names << name;
        mNames.push_back(quoted(name.toUtf8()) + ": ");
    }
    return write("[");
}

std::optional<QString> JsonWriter::add(const Row& row) {
    mLine.resize(0); // and keeps its room
    mLine += mAny ? ",\n{" : "\n{";
    mAny = true;
    for (std::size_t i = 0; i < row.size(); ++i) {
        if (i > 0) mLine += ", ";
        mLine += mNames[i];
        mLine += written(row[i]);
    }
    mLine += '}';
    return write({mLine.constData(), std::size_t(mLine.size())});
}

std::optional<QString> JsonWriter::finish() { return write(mAny ? "\n]\n" : "]\n"); }

std::optional<QString> JsonWriter::write(std::string_view bytes) {
    return inWords(mOutput.write(bytes));
}

} // namespace zandor::designer
