#include "comforts/Comforts.h"

#include "comforts/Door.h"

namespace comforts {

Comforts::Comforts(platform::Toolkit& toolkit) : mToolkit(toolkit) {}

Comforts::~Comforts() = default;

void Comforts::attach(TalvikDBxZandor::Zandor& control) { mDoor = std::make_unique<Door>(control); }

void Comforts::detach() { mDoor.reset(); }

template <class Body>
bool Comforts::act(platform::StringView procedure, Body&& body) {
    if (!mDoor) return false;
    bool dealtWith = true;
    TalvikDBxZandor::basZandor::Guard(mToolkit, ModuleName, procedure,
                                      [&] { dealtWith = body(*mDoor); });
    return dealtWith;
}

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

} // namespace comforts
