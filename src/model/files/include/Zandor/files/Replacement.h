#pragma once

#include <Zandor/files/export.h>

#include <Zandor/files/Descriptor.h>

#include <Zandor/files/Output.h>

namespace zandor::files {

/// A file that is written beside an old one, or none, and takes its place when all of it is on the
/// disk. Until commit() says that it has, and after any failure, the old file is as it was; what
/// was written goes with the object. A link stays a link, and the file's permissions stay.
///
/// Whatever this program writes for its user is written so.
class ZANDOR_FILES_EXPORT Replacement final : public Output {
public:
    /// Of the file at a path, which need not exist; nothing is done yet.
    explicit Replacement(const Path& path);
    Replacement(const Replacement&) = delete;
    Replacement& operator=(const Replacement&) = delete;
    ~Replacement() override;

    /// Before anything is written.
    std::optional<Error> open();
    std::optional<Error> write(std::string_view bytes) override { return mStream->write(bytes); }
    std::optional<Error> flush() override { return mStream->flush(); }
    /// The last call.
    std::optional<Error> commit();

private:
    Error refused(int number) const;

    const Path mPath;
    Path mTarget; ///< where the path leads to
    Path mBeside; ///< empty: there is no such file
    Descriptor mFile;
    std::optional<Stream> mStream;
};

/// All at once.
ZANDOR_FILES_EXPORT std::optional<Error> replaceFile(const Path& path, std::string_view content);

} // namespace zandor::files
