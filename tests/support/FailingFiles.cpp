#include "support/FailingFiles.h"

#include <dlfcn.h>
#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>
#include <cstdarg>
#include <cstdio>
#include <set>
#include <string_view>

// The program's own definitions come before the system's, which they call.

struct FailingFiles::Watch {
    std::string folder;
    std::size_t nth = 0;
    How how = How::fails;
    std::size_t calls = 0;
    std::string failed;
    std::set<int> files;
    bool interrupted = false;
};

namespace {

thread_local FailingFiles::Watch* watch = nullptr;

/// What the system has under a name.
template <class Function>
Function* system(const char* name) {
    return reinterpret_cast<Function*>(::dlsym(RTLD_NEXT, name));
}

bool watched(const char* path) {
    return watch && std::string_view(path).starts_with(watch->folder + '/');
}
bool watched(int file) { return watch && watch->files.contains(file); }

bool fails(const char* call) {
    if (++watch->calls != watch->nth) return false;
    watch->failed = call;
    errno = EIO;
    return true;
}

/// Of a call that may be waiting when a signal comes.
bool waitingFails(const char* call) {
    if (watch->how != FailingFiles::How::interrupts) return fails(call);
    watch->interrupted = !watch->interrupted;
    if (watch->interrupted) errno = EINTR;
    return watch->interrupted;
}

int opened(const char* name, const char* path, int flags, mode_t mode) {
    const bool ours = watched(path);
    if (ours && fails(name)) return -1;
    const int file = system<int(const char*, int, ...)>(name)(path, flags, mode);
    if (ours && file >= 0) watch->files.insert(file);
    return file;
}

mode_t modeOf(int flags, va_list& arguments) {
    return (flags & O_CREAT) != 0 ? va_arg(arguments, mode_t) : 0;
}

} // namespace

extern "C" {

int open(const char* path, int flags, ...) {
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return opened("open", path, flags, mode);
}

int open64(const char* path, int flags, ...) {
    va_list arguments;
    va_start(arguments, flags);
    const mode_t mode = modeOf(flags, arguments);
    va_end(arguments);
    return opened("open64", path, flags, mode);
}

// One byte at a time where signals come, for a call may end with less than was asked for.
ssize_t read(int file, void* to, std::size_t count) {
    if (watched(file) && waitingFails("read")) return -1;
    if (watched(file) && watch->how == FailingFiles::How::interrupts && count > 0) count = 1;
    return system<ssize_t(int, void*, std::size_t)>("read")(file, to, count);
}

ssize_t write(int file, const void* from, std::size_t count) {
    if (watched(file) && waitingFails("write")) return -1;
    if (watched(file) && watch->how == FailingFiles::How::interrupts && count > 0) count = 1;
    return system<ssize_t(int, const void*, std::size_t)>("write")(file, from, count);
}

int fsync(int file) {
    return watched(file) && fails("fsync") ? -1 : system<int(int)>("fsync")(file);
}

int fchmod(int file, mode_t mode) noexcept {
    return watched(file) && fails("fchmod") ? -1 : system<int(int, mode_t)>("fchmod")(file, mode);
}

int fstat(int file, struct stat* to) noexcept {
    return watched(file) && fails("fstat") ? -1 : system<int(int, struct stat*)>("fstat")(file, to);
}

int stat(const char* path, struct stat* to) noexcept {
    return watched(path) && fails("stat")
               ? -1
               : system<int(const char*, struct stat*)>("stat")(path, to);
}

int access(const char* path, int mode) noexcept {
    return watched(path) && fails("access") ? -1
                                            : system<int(const char*, int)>("access")(path, mode);
}

int rename(const char* from, const char* to) noexcept {
    return watched(from) && fails("rename")
               ? -1
               : system<int(const char*, const char*)>("rename")(from, to);
}

// The number is free whatever the answer.
int close(int file) {
    const bool fail = watched(file) && fails("close");
    if (watch) watch->files.erase(file);
    const int result = system<int(int)>("close")(file);
    if (!fail) return result;
    errno = EIO;
    return -1;
}

} // extern "C"

FailingFiles::FailingFiles(std::string folder, std::size_t nth, How how)
    : mWatch(std::make_unique<Watch>()) {
    mWatch->folder = std::move(folder);
    mWatch->nth = nth;
    mWatch->how = how;
    watch = mWatch.get();
}

FailingFiles::~FailingFiles() { watch = nullptr; }

std::size_t FailingFiles::calls() const { return mWatch->calls; }
std::string FailingFiles::failed() const { return mWatch->failed; }
