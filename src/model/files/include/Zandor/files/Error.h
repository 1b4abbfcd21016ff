#pragma once

#include <Zandor/files/Messages.h>
#include <Zandor/files/export.h>
#include <Zandor/model/Messages.h>
#include <Zandor/model/Result.h>

#include <filesystem>
#include <string>
#include <string_view>

namespace zandor::files {

/// The path of the file as saved or loaded.
using Path = std::filesystem::path;

/// What went wrong, where, and what to do about it.
struct ZANDOR_FILES_EXPORT Error {
    /// Of a message of the house's or of the model's.
    Error(model::Message message) : message(std::move(message)) {}
    /// Somebody else's words, which are shown as they stand: UTF-8.
    explicit Error(std::string_view words);

    model::Message message; ///< whose words are made where they are shown

    /// The message in English: one line of UTF-8.
    std::string text() const;
    /// The system's own words alone, in UTF-8; empty when it was not the system that refused.
    std::string reason() const;
};

template <class T>
using Result = model::Result<T, Error>; ///< A value, or the error that kept it from being made

/// "The file "a" cannot be saved (No space left on device); make room on the disk, …", by what
/// failed and the number of the system's error.
ZANDOR_FILES_EXPORT Error systemError(model::Message failed, int number);

} // namespace zandor::files
