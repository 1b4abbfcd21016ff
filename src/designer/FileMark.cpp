#include "designer/FileMark.h"

#include "designer/document/paths.h"

#include <sys/stat.h>

namespace zandor::designer {

namespace {

qint64 nanoseconds(const timespec& time) { return time.tv_sec * 1'000'000'000 + time.tv_nsec; }

} // namespace

std::optional<FileMark> FileMark::of(const QString& path) {
    struct stat state = {};
    if (::stat(pathOf(path).c_str(), &state) != 0) return {};
    return FileMark{state.st_dev, state.st_ino, state.st_size, nanoseconds(state.st_mtim),
                    nanoseconds(state.st_ctim)};
}

} // namespace zandor::designer
