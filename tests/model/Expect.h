#pragma once

#include <Zandor/platform/RuntimeError.h>

#include <gtest/gtest.h>

/// The number of the RuntimeError that a call throws; 0 when it throws none.
template <class Call>
std::int32_t errorOf(Call&& call) {
    try {
        call();
    } catch (const zandor::platform::RuntimeError& error) {
        return error.Number;
    }
    return 0;
}
