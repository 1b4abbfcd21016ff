#pragma once

#include <Zandor/files/Error.h>
#include <Zandor/files/export.h>

#include <optional>
#include <string_view>

namespace zandor::files {

/// Where bytes go, one piece after the other.
class ZANDOR_FILES_EXPORT Output {
public:
    virtual ~Output() = default;
    /// Some of what was written may wait for its way until flush(). What went wrong, with this
    /// piece or with one before.
    virtual std::optional<Error> write(std::string_view bytes) = 0;
    /// Lets nothing wait.
    virtual std::optional<Error> flush() = 0;
};

/// An open file, pipe or terminal as an output. It is left open.
class ZANDOR_FILES_EXPORT Stream final : public Output {
public:
    /// Bytes that wait before they are written.
    static constexpr std::size_t usuallyWaiting = std::size_t{64} * 1024;
    static constexpr std::size_t nothingWaits = 0; ///< for a stream that writes at once

    /// `failed` is what an error says of a failure, without a full stop: "The output cannot be
    /// written". As many bytes wait at most.
    Stream(int file, model::Message failed, std::size_t mostWaiting = usuallyWaiting)
        : mFile(file), mFailed(std::move(failed)), mMostWaiting(mostWaiting) {}

    std::optional<Error> write(std::string_view bytes) override;
    std::optional<Error> flush() override;

private:
    const int mFile;
    const model::Message mFailed;
    const std::size_t mMostWaiting;
    std::string mWaiting;
    std::optional<Error> mFailure;
};

} // namespace zandor::files
