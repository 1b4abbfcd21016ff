#include "comforts/Comforts.h"

#include "comforts/Door.h"

namespace comforts {

Comforts::Comforts(platform::Toolkit& toolkit) : mToolkit(toolkit) {}

Comforts::~Comforts() = default;

void Comforts::attach(TalvikDBxZandor::Zandor& control) {
    mDoor = std::make_shared<Door>(control);
    // These run within the control's procedures, which report what goes wrong in them.
    mDoor->listen({.EditorOpened = [this] { editorOpened(*std::shared_ptr(mDoor)); },
                   .EditorsClosing = [this] { editorsClosing(*std::shared_ptr(mDoor)); }});
}

void Comforts::detach() {
    if (mDoor) mDoor->shut();
    mDoor.reset();
    mTyping.reset();
}

bool Comforts::act(platform::StringView procedure, const std::function<bool(Door&)>& body) {
    // Held, because what the body tells the host may end the control.
    const std::shared_ptr<Door> door = mDoor;
    if (!door || !door->isOpen()) return false;
    TalvikDBxZandor::Life& life = door->life();
    const TalvikDBxZandor::Life::Procedure running(life);
    bool dealtWith = true;
    TalvikDBxZandor::basZandor::Guard(life, ModuleName, procedure,
                                      [&] { dealtWith = body(*door); });
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
