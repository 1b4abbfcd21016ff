#pragma once

#include <algorithm>
#include <cstdlib>

/// Of a matrix that takes long, every n-th cell is tried where ZANDOR_SAMPLE=n says so; 1 is all.
inline int sampleStep() {
    const char* const wanted = std::getenv("ZANDOR_SAMPLE");
    return wanted ? std::max(1, std::atoi(wanted)) : 1;
}
