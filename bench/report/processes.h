#pragma once

#include <QStringList>

namespace report {

/// Shows one form of a window, "empty", "control" or "scene", and says when it is painted, and
/// then how much memory it has, in KiB. The exit code of a program of its own.
int showForm(const QString& form);

/// Shows the first rows of a database file with a table "rows", looks at each, and says then how
/// much memory it has, in KiB. The exit code of a program of its own.
int showRows(const QString& path, qint64 count);

/// The resident memory of this process, in KiB: that of its own, and of the libraries with it.
double resident();

struct Run {
    double milliseconds = 0; ///< from its start to its end
    double kibibytes = 0;    ///< that it says it has
};

/// Runs this program in a process of its own.
Run run(const QStringList& arguments);

} // namespace report
