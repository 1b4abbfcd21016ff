#pragma once

#include "designer/run/fetch.h"

#include <Zandor/files/Output.h>

namespace zandor::designer {

/// Writes rows as comma-separated values as RFC 4180 words them: UTF-8, a header line, CRLF. A null
/// is empty, an empty text a pair of quotes, a blob in Base64.
class CsvWriter final : public Sink {
public:
    /// The output outlives the writer.
    explicit CsvWriter(files::Output& output) : mOutput(output) {}

    std::optional<QString> begin(const QStringList& columns) override;
    std::optional<QString> add(const Row& row) override;
    std::optional<QString> finish() override;

private:
    std::optional<QString> writeLine();

    files::Output& mOutput;
    QByteArray mLine;
};

} // namespace zandor::designer
