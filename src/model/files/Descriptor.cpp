#include <Zandor/files/Descriptor.h>

#include <unistd.h>

#include <cerrno>

namespace zandor::files {

bool Descriptor::close() { return mNumber < 0 || ::close(std::exchange(mNumber, -1)) == 0; }

bool writeAll(int file, std::string_view bytes) {
    while (!bytes.empty()) {
        const ssize_t written = ::write(file, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR) continue;
        if (written < 0) return false;
        bytes.remove_prefix(static_cast<std::size_t>(written));
    }
    return true;
}

} // namespace zandor::files
