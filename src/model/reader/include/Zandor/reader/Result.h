#pragma once

#include <Zandor/model/Messages.h>
#include <Zandor/model/Result.h>
#include <Zandor/reader/Messages.h>
#include <Zandor/reader/export.h>

#include <QString>

namespace zandor::reader {

/// What went wrong and what to do about it.
struct ZANDOR_READER_EXPORT Error {
    /// Of a message of the house's or of the model's.
    Error(model::Message message) : message(std::move(message)) {}
    /// Somebody else's words, which are shown as they stand.
    explicit Error(const QString& words);

    model::Message message; ///< whose words are made where they are shown

    /// The message in English: one line.
    QString text() const;
};

/// A value, or the error that kept it from being read.
template <class T>
using Result = model::Result<T, Error>;

} // namespace zandor::reader
