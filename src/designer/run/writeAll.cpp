#include "designer/run/writeAll.h"

#include <QCoreApplication>
#include <QIODevice>

namespace designer {

std::optional<QString> writeAll(QIODevice& device, const QByteArray& bytes) {
    if (device.write(bytes) == bytes.size()) return {};
    return QCoreApplication::translate(
               "designer::writeAll",
               "The rows cannot be written (%1): see that the disk has room and that you may "
               "write there.")
        .arg(device.errorString());
}

} // namespace designer
