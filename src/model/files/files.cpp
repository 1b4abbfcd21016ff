#include "model/files/QueryDocument.h"
#include "model/files/limits.h"

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstring>
#include <random>
#include <system_error>

namespace files {

namespace {

/// An open file, closed when the object goes.
class Descriptor {
public:
    explicit Descriptor(int number) : mNumber(number) {}
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    ~Descriptor() { close(); }

    int number() const { return mNumber; }
    bool isOpen() const { return mNumber >= 0; }
    /// False when the system has something to complain about only now.
    bool close() { return mNumber < 0 || ::close(std::exchange(mNumber, -1)) == 0; }

private:
    int mNumber;
};

/// A file that is deleted again unless it is kept.
class TemporaryFile {
public:
    explicit TemporaryFile(Path path) : mPath(std::move(path)) {}
    TemporaryFile(const TemporaryFile&) = delete;
    TemporaryFile& operator=(const TemporaryFile&) = delete;
    ~TemporaryFile() {
        if (!mPath.empty()) ::unlink(mPath.c_str());
    }
    void keep() { mPath.clear(); }

private:
    Path mPath;
};

/// The path within a message of one line.
std::string quoted(const Path& path) {
    std::string name = path.string();
    for (char& c : name)
        if (static_cast<unsigned char>(c) < 0x20 || c == 0x7f) c = '?';
    return '"' + name + '"';
}

/// By the number of the system's error.
std::string advice(int error) {
    switch (error) {
    case ENOENT: return "check the path";
    case EACCES:
    case EPERM: return "ask the owner for permission, or choose another folder";
    case ENOSPC:
    case EDQUOT: return "make room on the disk, or choose another one";
    case EFBIG: return "choose another disk";
    case EROFS: return "choose a folder on another disk";
    default: return "try again, or choose another folder";
    }
}

Error failed(const std::string& what, const Path& path, int error) {
    return {"The file " + quoted(path) + " cannot be " + what + " (" + std::strerror(error) +
            "); " + advice(error) + '.'};
}

bool writeAll(int file, std::string_view text) {
    while (!text.empty()) {
        const ssize_t written = ::write(file, text.data(), text.size());
        if (written < 0 && errno == EINTR) continue;
        if (written < 0) return false;
        text.remove_prefix(static_cast<std::size_t>(written));
    }
    return true;
}

/// A name that nothing else in the folder has.
Path nameBeside(const Path& path) {
    constexpr const char* digits = "0123456789abcdef";
    std::random_device random;
    std::string name = "." + path.filename().string().substr(0, 200) + '.';
    for (int n = 0; n < 12; ++n) name += digits[random() % 16];
    return path.parent_path() / name;
}

/// Where a link leads to; the path itself when it is none.
Path resolved(const Path& path) {
    std::error_code none;
    const Path target = std::filesystem::canonical(path, none);
    return none ? std::filesystem::absolute(path, none) : target;
}

} // namespace

std::optional<Error> saveQuery(const Path& path, const QueryDocument& document) {
    const auto text = toJson(document);
    if (!text) return Error{text.error()};

    const Path target = resolved(path);
    struct stat old = {};
    const bool replaces = ::stat(target.c_str(), &old) == 0;
    if (replaces && !S_ISREG(old.st_mode))
        return Error{quoted(path) + " is not a file; choose another name."};
    if (replaces && ::access(target.c_str(), W_OK) != 0)
        return Error{"The file " + quoted(path) + " is write-protected; save under another name."};

    const Path beside = nameBeside(target);
    constexpr mode_t everybody = 0666; // less what the user's mask forbids
    Descriptor file(::open(beside.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, everybody));
    if (!file.isOpen()) return failed("saved", path, errno);
    TemporaryFile temporary(beside);
    // Without the permissions of the old file the new one is not its like; without its owner it is.
    if (replaces && ::fchmod(file.number(), old.st_mode & 07777) != 0)
        return failed("saved", path, errno);
    if (!writeAll(file.number(), *text) || ::fsync(file.number()) != 0 || !file.close() ||
        ::rename(beside.c_str(), target.c_str()) != 0)
        return failed("saved", path, errno);
    temporary.keep();

    // The new name is on the disk only with the folder. The file is saved whatever comes of it.
    const Descriptor folder(::open(target.parent_path().c_str(), O_RDONLY | O_DIRECTORY));
    if (folder.isOpen()) ::fsync(folder.number());
    return {};
}

Result<QueryDocument> loadQuery(const Path& path) {
    // Not blocking: a pipe would wait for its writer.
    const Descriptor file(::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC));
    if (!file.isOpen()) return failed("read", path, errno);
    struct stat state = {};
    if (::fstat(file.number(), &state) != 0) return failed("read", path, errno);
    if (!S_ISREG(state.st_mode))
        return Error{quoted(path) + " is not a file; choose a query file."};

    std::string text;
    // One byte more than a file may have, by which the reader sees that it has too many.
    constexpr std::size_t most = limits::fileSize + 1;
    constexpr std::size_t piece = 64 * 1024;
    while (text.size() < most) {
        const std::size_t before = text.size();
        text.resize(std::min(most, before + piece));
        const ssize_t count = ::read(file.number(), text.data() + before, text.size() - before);
        if (count < 0 && errno != EINTR) return failed("read", path, errno);
        text.resize(before + static_cast<std::size_t>(std::max<ssize_t>(count, 0)));
        if (count == 0) break;
    }
    auto document = fromJson(text);
    if (!document)
        return Error{"The file " + quoted(path) + " cannot be used: " + document.error()};
    return document;
}

} // namespace files
