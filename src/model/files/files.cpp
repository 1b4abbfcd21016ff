#include "model/files/Refusal.h"
#include "model/files/SavedFiles.h"
#include "model/files/limits.h"

#include <Zandor/files/Descriptor.h>

#include <Zandor/QueryDocument.h>
#include <Zandor/files/Replacement.h>

#include <fcntl.h>
#include <sys/stat.h>
#include <unistd.h>

#include <cerrno>

namespace zandor::files {

namespace {

Error unread(const Path& path, int number) {
    return systemError(model::say<MessageCode::fileNotRead>(nameOf(path)), number);
}

} // namespace

std::optional<Error> saveQuery(const Path& path, const QueryDocument& document) {
    const auto text = toJson(namedFrom(document, path));
    if (!text) return text.failure();
    return replaceFile(path, *text);
}

Result<QueryDocument> loadQuery(const Path& path) {
    // Not blocking: a pipe would wait for its writer.
    const Descriptor file(::open(path.c_str(), O_RDONLY | O_NONBLOCK | O_CLOEXEC));
    if (!file.isOpen()) return unread(path, errno);
    struct stat state = {};
    if (::fstat(file.number(), &state) != 0) return unread(path, errno);
    if (!S_ISREG(state.st_mode)) return Error{model::say<MessageCode::noFileToRead>(nameOf(path))};

    std::string text;
    // One byte more than a file may have, by which the reader sees that it has too many.
    constexpr std::size_t most = limits::fileSize + 1;
    constexpr std::size_t piece = std::size_t{64} * 1024;
    while (text.size() < most) {
        const std::size_t before = text.size();
        text.resize(std::min(most, before + piece));
        const ssize_t count = ::read(file.number(), text.data() + before, text.size() - before);
        if (count < 0 && errno != EINTR) return unread(path, errno);
        text.resize(before + static_cast<std::size_t>(std::max<ssize_t>(count, 0)));
        if (count == 0) break;
    }
    auto document = fromJson(text);
    if (!document)
        return Error{
            model::say<MessageCode::fileNotUsed>(nameOf(path), document.failure().message)};
    return namedAbsolutely(std::move(*document), path);
}

} // namespace zandor::files
