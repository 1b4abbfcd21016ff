#include <Zandor/files/Error.h>

#include <cerrno>
#include <cstring>

namespace zandor::files {

namespace {

std::string advice(int number) {
    switch (number) {
    case ENOENT:
    case ENOTDIR: return "check the path";
    case ENAMETOOLONG: return "choose a shorter name";
    case EACCES:
    case EPERM: return "ask the owner for permission, or choose another folder";
    case ENOSPC:
    case EDQUOT: return "make room on the disk, or choose another one";
    case EFBIG: return "choose another disk";
    case EROFS: return "choose a folder on another disk";
    default: return "try again, or choose another folder";
    }
}

} // namespace

Error systemError(const std::string& failed, int number) {
    const std::string reason = std::strerror(number);
    return {failed + " (" + reason + "); " + advice(number) + '.', reason};
}

std::string quoted(const Path& path) {
    std::string name = path.string();
    for (char& c : name)
        if (static_cast<unsigned char>(c) < 0x20 || c == 0x7f) c = '?';
    return '"' + name + '"';
}

} // namespace zandor::files
