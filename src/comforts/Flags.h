#pragma once

namespace comforts {

/// Which comforts a host has switched on. All are off at first: the bare control does what its own
/// words say and no more.
struct Flags {
    bool AddsOnDoubleClick = false; ///< a double click on an entry makes it an output column

    static constexpr Flags all() { return {.AddsOnDoubleClick = true}; }

    friend bool operator==(const Flags&, const Flags&) = default;
};

} // namespace comforts
