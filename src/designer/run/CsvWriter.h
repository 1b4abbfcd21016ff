#pragma once

#include "designer/run/fetch.h"

class QIODevice;

namespace designer {

/// Writes rows as comma-separated values as RFC 4180 words them: UTF-8, a header line, CRLF. A null
/// is empty, an empty text a pair of quotes, a blob in Base64.
class CsvWriter final : public Sink {
public:
    /// The device is open for writing and outlives the writer.
    explicit CsvWriter(QIODevice& device) : mDevice(device) {}

    std::optional<QString> begin(const QStringList& columns) override;
    std::optional<QString> add(const Row& row) override;
    std::optional<QString> finish() override;

private:
    std::optional<QString> writeLine();

    QIODevice& mDevice;
    QByteArray mLine;
};

} // namespace designer
