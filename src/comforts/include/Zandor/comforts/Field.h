#pragma once

#include <Zandor/platform/String.h>

namespace zandor::comforts {

/// A column of a table on the canvas, as a column of the grid names it.
struct Field {
    std::int16_t table = 0; ///< its slot
    std::int32_t entry = 0; ///< from 1
    platform::String name;  ///< "orders.total"

    friend bool operator==(const Field&, const Field&) = default;
};

/// What a host has to say about a cell of the grid.
struct Finding {
    platform::String definition; ///< its key
    std::int32_t row = 0;        ///< of the grid
    platform::String text;       ///< for its tooltip and screen readers
};

} // namespace zandor::comforts
