#include <Zandor/files/Output.h>

#include <Zandor/files/Descriptor.h>

#include <cerrno>

namespace zandor::files {

std::optional<Error> Stream::write(std::string_view bytes) {
    if (mFailure) return mFailure;
    mWaiting += bytes;
    return mWaiting.size() < mMostWaiting ? std::nullopt : flush();
}

std::optional<Error> Stream::flush() {
    if (!mFailure && !writeAll(mFile, mWaiting)) mFailure = systemError(mFailed, errno);
    mWaiting.clear();
    return mFailure;
}

} // namespace zandor::files
