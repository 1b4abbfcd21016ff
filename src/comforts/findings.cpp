#include "comforts/Door.h"

#include <Zandor/comforts/Comforts.h>

// What a host has to say about cells of the grid.

namespace zandor::comforts {

void Comforts::setFindings(std::vector<Finding> findings) {
    mFindings = std::move(findings);
    act(u"setFindings", [&](Door& door) {
        markFindings(door);
        return true;
    });
}

void Comforts::markFindings(Door& door) {
    door.clearNotes();
    for (const Finding& finding : mFindings) {
        const std::int32_t column = door.columnOfKey(finding.definition);
        if (column != 0 && finding.row >= 0 && finding.row < door.grid().Rows())
            door.note(finding.row, column, finding.text);
    }
}

bool Comforts::showCell(const String& definition, std::int32_t row) {
    return act(u"showCell", [&](Door& door) {
        const std::int32_t column = door.hasGrid() ? door.columnOfKey(definition) : 0;
        if (column == 0 || row < 0 || row >= door.grid().Rows()) return false;
        door.closeEditors();
        if (!door.isOpen()) return true;
        door.goTo(row, column);
        door.showCurrentCell();
        if (door.isOpen()) door.focusGrid();
        return true;
    });
}

} // namespace zandor::comforts
