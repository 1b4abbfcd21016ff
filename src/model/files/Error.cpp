#include <Zandor/files/Error.h>

#include <cerrno>
#include <cstring>

namespace zandor::files {

using model::Message;
using model::say;

namespace {

Message advice(int number) {
    switch (number) {
    case ENOENT:
    case ENOTDIR: return say<MessageCode::checkPath>();
    case ENAMETOOLONG: return say<MessageCode::shorterName>();
    case EACCES:
    case EPERM: return say<MessageCode::askOwnerOfFolder>();
    case ENOSPC:
    case EDQUOT: return say<MessageCode::makeRoom>();
    case EFBIG: return say<MessageCode::anotherDisk>();
    case EROFS: return say<MessageCode::folderOnAnotherDisk>();
    default: return say<MessageCode::tryAgain>();
    }
}

} // namespace

Error::Error(std::string_view words) : message(say<model::MessageCode::asItStands>(words)) {}

std::string Error::text() const { return platform::toUtf8(message.text()); }

std::string Error::reason() const {
    if (!message.is(MessageCode::refusedBySystem)) return {};
    return platform::toUtf8(std::get<platform::String>(message.arguments()[1].content));
}

Error systemError(Message failed, int number) {
    return say<MessageCode::refusedBySystem>(std::move(failed), std::strerror(number),
                                             advice(number));
}

} // namespace zandor::files
