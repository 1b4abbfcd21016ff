#include "designer/run/CsvWriter.h"

#include "designer/statement/ModelWords.h"

#include <algorithm>

namespace zandor::designer {

namespace {

void appendField(QByteArray& line, const QByteArray& text) {
    const bool quoted = text.isEmpty() || std::any_of(text.begin(), text.end(), [](char c) {
                            return c == ',' || c == '"' || c == '\r' || c == '\n';
                        });
    if (!quoted) {
        line += text;
        return;
    }
    line += '"';
    for (const char c : text) {
        if (c == '"') line += '"';
        line += c;
    }
    line += '"';
}

} // namespace

std::optional<QString> CsvWriter::begin(const QStringList& columns) {
    for (qsizetype i = 0; i < columns.size(); ++i) {
        if (i > 0) mLine += ',';
        appendField(mLine, columns[i].toUtf8());
    }
    return writeLine();
}

std::optional<QString> CsvWriter::add(const Row& row) {
    for (std::size_t i = 0; i < row.size(); ++i) {
        if (i > 0) mLine += ',';
        const Cell& cell = row[i];
        if (cell.kind == Cell::Kind::blob)
            appendField(mLine, cell.blob.toBase64());
        else if (cell.kind != Cell::Kind::null)
            appendField(mLine, cell.text.toUtf8());
    }
    return writeLine();
}

std::optional<QString> CsvWriter::finish() { return {}; }

std::optional<QString> CsvWriter::writeLine() {
    mLine += "\r\n";
    const auto error = mOutput.write({mLine.constData(), std::size_t(mLine.size())});
    mLine.resize(0); // and keeps its room
    return inWords(error);
}

} // namespace zandor::designer
