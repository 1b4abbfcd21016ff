#pragma once

#include <Zandor/files/export.h>

#include <string_view>
#include <utility>

namespace zandor::files {

/// An open file by the system's number, closed when the object goes.
class ZANDOR_FILES_EXPORT Descriptor {
public:
    /// Takes over an open file; -1: none.
    explicit Descriptor(int number = -1) : mNumber(number) {}
    /// The other one has no file then.
    Descriptor(Descriptor&& other) noexcept : mNumber(std::exchange(other.mNumber, -1)) {}
    /// Closes the file held before.
    Descriptor& operator=(Descriptor&& other) noexcept {
        std::swap(mNumber, other.mNumber);
        return *this;
    }
    ~Descriptor() { close(); }

    /// Of the system's; -1: no file is open.
    int number() const { return mNumber; }
    /// Whether there is a file.
    bool isOpen() const { return mNumber >= 0; }
    /// False when the system has something to complain about only now (errno).
    bool close();

private:
    int mNumber;
};

/// Writes all of it; otherwise false, and why is in errno.
ZANDOR_FILES_EXPORT bool writeAll(int file, std::string_view bytes);

} // namespace zandor::files
