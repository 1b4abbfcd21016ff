#pragma once

#include <Zandor/model/Result.h>

#include <QString>

namespace zandor::reader {

/// What went wrong and what to do about it: one line, ready to be shown to a user.
struct Error {
    QString text;
};

/// A value, or the error that kept it from being read.
template <class T>
using Result = model::Result<T, Error>;

} // namespace zandor::reader
