#include "designer/run/FileExport.h"

#include <QCoreApplication>

namespace designer {

std::optional<QString> FileExport::begin(const QStringList& columns) {
    if (!mFile.open(QIODevice::WriteOnly)) return complain();
    return mWriter.begin(columns);
}

std::optional<QString> FileExport::add(const Row& row) { return mWriter.add(row); }

std::optional<QString> FileExport::finish() {
    if (!mFile.commit()) return complain();
    return {};
}

std::optional<QString> FileExport::complain() const {
    return QCoreApplication::translate("designer::FileExport",
                                       "The file \"%1\" cannot be written (%2): check the folder "
                                       "and your permissions.")
        .arg(mFile.fileName(), mFile.errorString());
}

} // namespace designer
