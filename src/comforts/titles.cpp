#include "comforts/Door.h"

#include <Zandor/comforts/Comforts.h>

// The menu on a table's title.

namespace zandor::comforts {

bool Comforts::titleClicked(std::int16_t table) {
    if (!mFlags.HasTitleMenu) return false;
    return act(u"titleClicked", [&](Door& door) {
        door.popUpOver(table);
        return true;
    });
}

void Comforts::offerRename() {
    if (!mDoor || !mFlags.HasTitleMenu || mRename) return;
    act(u"offerRename", [&](Door& door) {
        mRename = door.addTableEntry(u"mnuTableRename", mWords.Rename, [this] {
            if (!mDoor) return;
            const String key = mDoor->keyOfActiveTable();
            if (const auto asked = RenameRequested) asked(key);
        });
        mRename->Visible(false);
        return true;
    });
}

void Comforts::menuChecked(std::int16_t source) {
    if (!mRename) return;
    const bool overTable = source == TalvikDBxZandor::menuSource::table;
    mRename->Visible(mFlags.HasTitleMenu && overTable && mDoor && !mDoor->isReadOnly());
}

} // namespace zandor::comforts
