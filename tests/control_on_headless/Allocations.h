#pragma once

#include <cstddef>

/// What the program takes from the free store. The tests run on one thread.
namespace allocations {

/// How many there have been since the program began.
std::size_t count();

/// The next one fails with std::bad_alloc; those after it work.
void failNext();

/// Whether a failure is still to come; takes it back.
bool disarm();

} // namespace allocations
