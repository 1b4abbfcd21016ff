#pragma once

#include <Zandor/model/Message.h>

namespace zandor::python {

/// Throws an exception of a class in zandor.errors, with a message's text and code.
[[noreturn]] void raise(const char* type, const model::Message& message,
                        const platform::String& reason = {});

} // namespace zandor::python
