#pragma once

#include "designer/document/paths.h"
#include "designer/run/CsvWriter.h"

#include <Zandor/files/Replacement.h>

namespace zandor::designer {

/// Writes rows into a file of comma-separated values, which is there only when all of them are in
/// it; until then one that was there before stays.
class FileExport final : public Sink {
public:
    explicit FileExport(const QString& path) : mFile(pathOf(path)), mWriter(mFile) {}

    std::optional<QString> begin(const QStringList& columns) override;
    std::optional<QString> add(const Row& row) override;
    std::optional<QString> finish() override;

private:
    files::Replacement mFile;
    CsvWriter mWriter;
};

} // namespace zandor::designer
