#pragma once

#include <Zandor/platform/String.h>

#include <QString>

namespace zandor::platform::qt {

/// A copy; whatever the text holds stays as it is.
inline QString toQt(StringView text) {
    return QString::fromUtf16(text.data(), static_cast<qsizetype>(text.size()));
}

/// A copy; whatever the text holds stays as it is.
inline String fromQt(const QString& text) { return text.toStdU16String(); }

/// "lstTable(3)": the name under which an element of a control array is known.
inline QString elementName(StringView name, int index) {
    return toQt(name) + u'(' + QString::number(index) + u')';
}

} // namespace zandor::platform::qt
