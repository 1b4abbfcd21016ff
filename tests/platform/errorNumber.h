#pragma once

#include <Zandor/platform/RuntimeError.h>

#include <cstdint>
#include <functional>

/// Of the error that the deed ends in; 0 of none.
inline std::int32_t errorNumber(const std::function<void()>& deed) {
    try {
        deed();
    } catch (const zandor::platform::RuntimeError& error) {
        return error.Number;
    }
    return 0;
}
