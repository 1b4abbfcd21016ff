#include "designer/run/FileExport.h"

#include "designer/statement/ModelWords.h"

namespace zandor::designer {

std::optional<QString> FileExport::begin(const QStringList& columns) {
    if (const auto error = mFile.open()) return inWords(error);
    return mWriter.begin(columns);
}

std::optional<QString> FileExport::add(const Row& row) { return mWriter.add(row); }

std::optional<QString> FileExport::finish() { return inWords(mFile.commit()); }

} // namespace zandor::designer
