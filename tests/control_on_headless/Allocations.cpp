#include "Allocations.h"

#include <cstdlib>
#include <new>

namespace {

std::size_t made = 0;
bool failing = false;

} // namespace

namespace allocations {

std::size_t count() { return made; }

void failNext() { failing = true; }

bool disarm() {
    const bool armed = failing;
    failing = false;
    return armed;
}

} // namespace allocations

void* operator new(std::size_t size) {
    ++made;
    if (allocations::disarm()) throw std::bad_alloc();
    if (void* const memory = std::malloc(size == 0 ? 1 : size)) return memory;
    throw std::bad_alloc();
}

void operator delete(void* memory) noexcept { std::free(memory); }
void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }
