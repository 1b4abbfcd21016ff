#pragma once

#include <Zandor/files/export.h>

#include <string_view>
#include <utility>

namespace zandor::files {

/// An open file by the system's number, closed when the object goes.
class ZANDOR_FILES_EXPORT Descriptor {
public:
    explicit Descriptor(int number = -1) : mNumber(number) {}
    Descriptor(Descriptor&& other) noexcept : mNumber(std::exchange(other.mNumber, -1)) {}
    Descriptor& operator=(Descriptor&& other) noexcept {
        std::swap(mNumber, other.mNumber);
        return *this;
    }
    ~Descriptor() { close(); }

    int number() const { return mNumber; }
    bool isOpen() const { return mNumber >= 0; }
    /// False when the system has something to complain about only now (errno).
    bool close();

private:
    int mNumber;
};

/// Writes all of it; otherwise false, and why is in errno.
ZANDOR_FILES_EXPORT bool writeAll(int file, std::string_view bytes);

} // namespace zandor::files
