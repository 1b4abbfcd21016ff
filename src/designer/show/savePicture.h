#pragma once

#include <QString>

#include <optional>

class QPrinter;

namespace zandor::designer {

class Picture;

/// Writes a picture as its name's suffix says: ".png" (two pixels for a logical one), ".svg" or
/// ".pdf" (one page of the picture's size). The file is replaced when all of it is written. Returns
/// what went wrong.
std::optional<QString> savePicture(const Picture& picture, const QString& path);

/// Onto one page, as large as fits, but never enlarged. Returns what went wrong.
std::optional<QString> printPicture(const Picture& picture, QPrinter& printer);

} // namespace zandor::designer
