#include "designer/run/spoolSweep.h"

#include "designer/document/paths.h"
#include "designer/run/Spool.h"

#include <QDir>
#include <QRegularExpression>

#include <sys/stat.h>
#include <unistd.h>

#include <set>
#include <utility>
#include <vector>

namespace zandor::designer {

namespace {

namespace fs = std::filesystem;

/// A file, whatever its names: its device and its number there.
using FileNumber = std::pair<dev_t, ino_t>;

struct Left {
    files::Path path;
    FileNumber number;
};

/// The files that may have been left.
std::vector<Left> spoolsIn(const QString& folder) {
    static const QRegularExpression name(
        QRegularExpression::anchoredPattern(spoolName + QStringLiteral("[A-Za-z0-9]{6}")));
    std::vector<Left> found;
    const QDir directory(folder);
    for (const QString& entry : directory.entryList({spoolName + u'*'}, QDir::Files)) {
        if (!name.match(entry).hasMatch()) continue;
        const files::Path path = pathOf(directory.filePath(entry));
        struct stat state = {};
        if (::lstat(path.c_str(), &state) != 0) continue;
        if (!S_ISREG(state.st_mode) || state.st_uid != ::geteuid()) continue;
        found.push_back({path, {state.st_dev, state.st_ino}});
    }
    return found;
}

/// What is open in any process of this user; nothing where the system does not tell, as it tells
/// of this process at least.
std::set<FileNumber> openFiles() {
    std::set<FileNumber> open;
    std::error_code none;
    for (const auto& process : fs::directory_iterator("/proc", none)) {
        // Of other users' processes the system does not tell; they hold none of this user's files.
        for (const auto& file : fs::directory_iterator(process.path() / "fd", none)) {
            struct stat state = {};
            if (::stat(file.path().c_str(), &state) == 0) open.emplace(state.st_dev, state.st_ino);
        }
    }
    return open;
}

} // namespace

int sweepSpools(const QString& folder) {
    // In this order: one that is made meanwhile is not among them.
    const auto left = spoolsIn(folder);
    if (left.empty()) return 0;
    const auto open = openFiles();
    if (open.empty()) return 0;
    int gone = 0;
    for (const auto& [path, number] : left)
        if (!open.contains(number) && ::unlink(path.c_str()) == 0) ++gone;
    return gone;
}

void sweepSpools() {
    const QString now = spoolFolder();
    sweepSpools(now);
    if (now != QDir::tempPath()) sweepSpools(QDir::tempPath());
}

} // namespace zandor::designer
