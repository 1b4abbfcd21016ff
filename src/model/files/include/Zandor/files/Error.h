#pragma once

#include <Zandor/files/export.h>
#include <Zandor/model/Result.h>

#include <filesystem>
#include <string>

namespace zandor::files {

/// The path of the file as saved or loaded.
using Path = std::filesystem::path;

/// What went wrong, where, and what to do about it: one line of UTF-8, ready to be shown to a user.
struct Error {
    std::string text;
    /// The system's own words alone, when it was the system that refused.
    std::string reason = {};
};

template <class T>
using Result = model::Result<T, Error>;

/// "The file "a" cannot be saved (No space left on device); make room on the disk, …", by what
/// failed and the number of the system's error.
ZANDOR_FILES_EXPORT Error systemError(const std::string& failed, int number);

/// The path within a message of one line.
ZANDOR_FILES_EXPORT std::string quoted(const Path& path);

} // namespace zandor::files
