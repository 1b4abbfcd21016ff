#include <Zandor/comforts/Comforts.h>

#include "comforts/Door.h"

namespace zandor::comforts {

Comforts::Comforts(platform::Toolkit& toolkit) : mToolkit(toolkit) {}

Comforts::~Comforts() = default;

void Comforts::attach(TalvikDBxZandor::Zandor& control) {
    mDoor = std::make_shared<Door>(control);
    // These run within the control's procedures, which report what goes wrong in them.
    mDoor->listen(
        {.EditorOpened = [this] { editorOpened(*std::shared_ptr(mDoor)); },
         .EditorsClosing = [this] { editorsClosing(*std::shared_ptr(mDoor)); },
         .LaidOut = [this] { laidOut(*std::shared_ptr(mDoor)); },
         .Bound = [this] { act(u"bound", [this](Door& door) { return bound(door), true; }); },
         .CellWritten =
             [this](auto column) {
                 if (mDoor->grid().ColData(column) != 0) fit(*mDoor, column);
             },
         .JoinPlaced = {},
         .MenuChecked = [this](std::int16_t source) { menuChecked(source); }});
    if (mFlags.ReadsJoins) readJoins(true);
    offerRename();
}

void Comforts::detach() {
    if (mDoor) mDoor->shut();
    mDoor.reset();
    mTyping.reset();
    mUnderDrag.clear();
    mOffer.reset();
    mFields.reset();
    mRename.reset();
}

void Comforts::setWords(const platform::Words& words) {
    mWords = words;
    if (mRename) mRename->Caption(mWords.Rename);
    if (mFlags.ReadsJoins) readJoins(true);
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

void Comforts::setFlags(const Flags& flags) {
    const bool readBefore = std::exchange(mFlags, flags).ReadsJoins;
    if (readBefore != mFlags.ReadsJoins) readJoins(mFlags.ReadsJoins);
    offerRename();
    act(u"setFlags", [this](Door& door) { return bound(door), true; });
}

/// What follows from the model, shown afresh.
void Comforts::bound(Door& door) {
    // Another query has the same key numbers for other columns.
    if (door.hasAnotherModel()) mWidths.clear();
    door.markOutput(mFlags.MarksOutput);
    markFindings(door);
    if (mFlags.FitsColumns) readWidths(door);
    fitAll(door);
    placeEditor(door);
}

bool Comforts::raised(TalvikDBxZandor::Event event,
                      const TalvikDBxZandor::EventArguments& arguments) {
    using TalvikDBxZandor::Event;
    const bool columns = event == Event::ColumnCreated || event == Event::ColumnModified ||
                         event == Event::ColumnRemoved || event == Event::TableDeleted;
    const std::shared_ptr<Door> held = mDoor;
    if (!columns || !held) return true;
    act(u"raised", [&](Door& door) {
        if (mFlags.MarksOutput) door.markOutput(true);
        if (event == Event::ColumnCreated || event == Event::ColumnModified)
            fit(door, door.columnOfKey(arguments.Definition->Key()));
        return true;
    });
    return held->isOpen();
}

} // namespace zandor::comforts
