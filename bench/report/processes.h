#pragma once

#include <QString>

namespace report {

/// Shows one form of a window, "empty", "control" or "scene", and says when it is painted, and
/// then how much memory it has, in KiB. The exit code of a program of its own.
int showForm(const QString& form);

} // namespace report
