#include <Zandor/comforts/Comforts.h>

#include "comforts/Door.h"

namespace zandor::comforts {

void Comforts::dragCame(std::int16_t table) {
    mUnderDrag.clear();
    if (!mFlags.KeepsSelectionUnderDrags) return;
    act(u"dragCame", [&](Door& door) {
        const auto& entries = door.entriesOf(table);
        for (std::int32_t n = 1; n <= entries.Count(); ++n)
            mUnderDrag.emplace_back(entries.Item(n), entries.Item(n)->Selected());
        return true;
    });
}

void Comforts::dragGone() {
    // The entries outlive their table, should it have gone meanwhile.
    const auto before = std::exchange(mUnderDrag, {});
    act(u"dragGone", [&](Door&) {
        for (const auto& [entry, selected] : before) {
            if (entry->Selected() == selected) continue;
            entry->Selected(selected);
            entry->Refresh();
        }
        return true;
    });
}

} // namespace zandor::comforts
