#include "comforts/Door.h"

namespace comforts {

using TalvikDBxZandor::Event;

std::int32_t Door::lastColumn() const {
    std::int32_t column = grid().Cols() - 1;
    while (column > 0 && grid().TextMatrix(0, column).empty()) --column;
    return column;
}

void Door::drop(std::int16_t table, std::int32_t entry, std::int32_t column) {
    const auto element = mControl.lstTable(table);
    const auto item = element->ColumnItems().Item(entry);
    mControl.InsertRecords({mControl.DragRecord(table, element, item)}, column);
    mControl.mEvents.Raise(Event::Activate, {});
}

} // namespace comforts
