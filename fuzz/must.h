#pragma once

#include <cstdlib>
#include <iostream>
#include <string_view>

/// Ends the program with a message when something does not hold: to a fuzzer, a finding.
inline void must(bool holds, std::string_view what) {
    if (holds) return;
    std::cerr << "does not hold: " << what << '\n';
    std::abort();
}
