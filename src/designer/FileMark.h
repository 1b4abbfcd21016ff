#pragma once

#include <QString>

#include <optional>

namespace zandor::designer {

/// What the system tells of a file, by which one sees that somebody has changed or replaced it.
struct FileMark {
    quint64 device = 0;
    quint64 number = 0; ///< of the file on its device
    qint64 size = 0;
    qint64 written = 0; ///< nanoseconds, as whoever wrote it wants to have it
    qint64 changed = 0; ///< nanoseconds, by the system's own clock

    /// Nothing when there is no such file.
    static std::optional<FileMark> of(const QString& path);
    /// Whether it is the same file, whatever became of its content.
    bool isOfSameFile(const FileMark& other) const {
        return device == other.device && number == other.number;
    }
    friend bool operator==(const FileMark&, const FileMark&) = default;
};

} // namespace zandor::designer
