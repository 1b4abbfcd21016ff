#include "comforts/Door.h"

#include <Zandor/comforts/Comforts.h>

// The entries of the tables on the canvas.

namespace zandor::comforts {

/// The entry comes behind the last output column. A full grid has no place for it, and takes none.
bool Comforts::entryDoubleClicked(std::int16_t table, std::int32_t entry) {
    if (!mFlags.AddsOnDoubleClick) return false;
    return act(u"entryDoubleClicked", [&](Door& door) {
        if (!door.hasGrid()) return false;
        const std::int32_t last = door.lastColumn();
        if (last + 1 < door.grid().Cols()) door.drop(table, entry, last + 1);
        return true;
    });
}

} // namespace zandor::comforts
