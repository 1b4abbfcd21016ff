#include "Allocations.h"

#include <cstdlib>
#include <new>

namespace {

std::size_t made = 0;
std::size_t failing = 0; ///< so many more, and the last of them fails; 0: none

} // namespace

namespace allocations {

std::size_t count() { return made; }

void failNext(std::size_t nth) { failing = nth; }

bool disarm() {
    const bool armed = failing > 0;
    failing = 0;
    return armed;
}

} // namespace allocations

void* operator new(std::size_t size) {
    ++made;
    if (failing > 0 && --failing == 0) throw std::bad_alloc();
    if (void* const memory = std::malloc(size == 0 ? 1 : size)) return memory;
    throw std::bad_alloc();
}

void operator delete(void* memory) noexcept { std::free(memory); }
void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }
