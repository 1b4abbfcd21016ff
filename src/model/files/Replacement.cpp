#include <Zandor/files/Replacement.h>

#include "model/files/Refusal.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdio>
#include <random>
#include <system_error>

namespace zandor::files {

namespace {

/// A name that nothing else in the folder has.
Path nameBeside(const Path& path) {
    constexpr const char* digits = "0123456789abcdef";
    std::random_device random;
    std::string name = "." + path.filename().string().substr(0, 200) + '.';
    for (int n = 0; n < 12; ++n) name += digits[random() % 16];
    return path.parent_path() / name;
}

/// Where a link leads to, also when nothing is there yet; the path itself when it is none. A link
/// that leads to itself stays one.
Path targetOf(const Path& path) {
    std::error_code none;
    Path target = std::filesystem::canonical(path, none);
    if (!none) return target;
    Path end = std::filesystem::absolute(path, none);
    constexpr int mostLinks = 40; // as the system has it
    for (int n = 0; n < mostLinks && std::filesystem::is_symlink(end, none); ++n)
        end = end.parent_path() / std::filesystem::read_symlink(end, none);
    return end;
}

model::Message notSaved(const Path& path) {
    return model::say<MessageCode::fileNotSaved>(nameOf(path));
}

/// Some file systems have no such thing as waiting for the disk.
bool isOnDisk(int file) { return ::fsync(file) == 0 || errno == EINVAL; }

} // namespace

Replacement::Replacement(const Path& path) : mPath(path), mTarget(targetOf(path)) {}

Replacement::~Replacement() {
    if (!mBeside.empty()) ::unlink(mBeside.c_str());
}

std::optional<Error> Replacement::open() {
    struct stat old = {};
    const bool replaces = ::stat(mTarget.c_str(), &old) == 0;
    if (!replaces && errno != ENOENT) return refused(errno);
    if (replaces && !S_ISREG(old.st_mode))
        return Error{model::say<MessageCode::noFileToSave>(nameOf(mPath))};
    if (replaces && ::access(mTarget.c_str(), W_OK) != 0)
        return Error{model::say<MessageCode::writeProtected>(nameOf(mPath))};

    const Path beside = nameBeside(mTarget);
    constexpr mode_t everybody = 0666; // less what the user's mask forbids
    mFile = Descriptor(::open(beside.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, everybody));
    if (!mFile.isOpen()) return refused(errno);
    mBeside = beside;
    mStream.emplace(mFile.number(), notSaved(mPath));
    // Without the permissions of the old file the new one is not its like; without its owner it is.
    if (replaces && ::fchmod(mFile.number(), old.st_mode & 07777) != 0) return refused(errno);
    return {};
}

std::optional<Error> Replacement::commit() {
    if (auto error = flush()) return error;
    if (!isOnDisk(mFile.number()) || !mFile.close() ||
        std::rename(mBeside.c_str(), mTarget.c_str()) != 0)
        return refused(errno);
    mBeside.clear();

    // The new name is on the disk only with the folder. The file is saved whatever comes of it.
    const Descriptor folder(
        ::open(mTarget.parent_path().c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC));
    if (folder.isOpen()) ::fsync(folder.number());
    return {};
}

Error Replacement::refused(int number) const { return systemError(notSaved(mPath), number); }

std::optional<Error> replaceFile(const Path& path, std::string_view content) {
    Replacement file(path);
    if (auto error = file.open()) return error;
    if (auto error = file.write(content)) return error;
    return file.commit();
}

} // namespace zandor::files
