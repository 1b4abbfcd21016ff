#pragma once

#include <cstddef>

/// What the program takes from the free store. The tests run on one thread.
namespace allocations {

/// How many there have been since the program began.
std::size_t count();

/// The next one, or the nth, fails with std::bad_alloc; those before and after it work.
void failNext(std::size_t nth = 1);

/// Whether a failure is still to come; takes it back.
bool disarm();

} // namespace allocations
