#pragma once

namespace comforts {

/// Which comforts a host has switched on. All are off at first: the bare control does what its own
/// words say and no more.
struct Flags {
    bool AddsOnDoubleClick = false; ///< a double click on an entry makes it an output column

    /// What is typed or chosen in a cell's editor is kept however the editor is left, but for
    /// Escape; typing in a cell opens its editor; a choice in a list needs no "&Set".
    bool KeepsTyping = false;

    static constexpr Flags all() { return {.AddsOnDoubleClick = true, .KeepsTyping = true}; }

    friend bool operator==(const Flags&, const Flags&) = default;
};

} // namespace comforts
