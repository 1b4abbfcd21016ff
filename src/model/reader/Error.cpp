#include <Zandor/reader/Result.h>

#include <Zandor/reader/rows.h>

namespace zandor::reader {

Error::Error(const QString& words)
    : message(model::say<model::MessageCode::asItStands>(words.toStdU16String())) {}

QString Error::text() const { return toQt(message.text()); }

} // namespace zandor::reader
