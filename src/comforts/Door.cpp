#include "comforts/Door.h"

namespace comforts {

using TalvikDBxZandor::Event;

void Door::shut() {
    if (mControl) mControl->mHooks = {};
    mControl = nullptr;
}

std::int32_t Door::lastColumn() const {
    std::int32_t column = grid().Cols() - 1;
    while (column > 0 && !isUsed(column)) --column;
    return column;
}

bool Door::isUsed(std::int32_t column) const {
    return column > 0 && !grid().TextMatrix(row::field, column).empty();
}

std::int32_t Door::columnWith(std::int32_t keyNumber, std::int32_t first) const {
    if (grid().ColData(first) == keyNumber) return first;
    for (std::int32_t column = 1; column < grid().Cols(); ++column)
        if (grid().ColData(column) == keyNumber) return column;
    return 0;
}

platform::Ref<TalvikZandorLib::ZDColumnDefinition> Door::definitionOf(std::int32_t column) {
    try {
        return control().DefinitionOf(column);
    } catch (const platform::RuntimeError&) {
        return {};
    }
}

void Door::drop(std::int16_t table, std::int32_t entry, std::int32_t column) {
    const auto element = control().lstTable(table);
    const auto item = element->ColumnItems().Item(entry);
    control().InsertRecords({control().DragRecord(table, element, item)}, column);
    control().Raise(Event::Activate);
}

void Door::goTo(std::int32_t row, std::int32_t column) {
    control().sprColumn->Row(row);
    control().sprColumn->Col(column);
}

Editor Door::editor() const {
    if (control().fraValue->Visible()) return Editor::text;
    if (control().fraSortOrder->Visible()) return Editor::sortOrder;
    if (control().fraVisibility->Visible()) return Editor::visibility;
    return Editor::none;
}

platform::String Door::editorValue() const {
    switch (editor()) {
    case Editor::text: return control().txtValue->Text();
    case Editor::sortOrder: return platform::decimal(control().cobSortOrder->ListIndex());
    case Editor::visibility: return platform::decimal(control().cobVisibility->ListIndex());
    case Editor::none: break;
    }
    return {};
}

std::optional<platform::String> Door::storedValue(std::int32_t row, std::int32_t column) {
    const auto definition = definitionOf(column);
    if (!definition) return {};
    switch (editor()) {
    case Editor::sortOrder: return platform::decimal(definition->SortOrder());
    case Editor::visibility: return platform::decimal(definition->Visible() ? 0 : 1);
    default: break;
    }
    if (row == row::synonym) return definition->Synonym();
    const String key = platform::decimal(row);
    return definition->HasCriterium(key) ? definition->Criteria().Item(key)->Criterium() : String();
}

void Door::set(Editor editor) {
    switch (editor) {
    case Editor::text: return control().cmdSetTextValue_Click();
    case Editor::sortOrder: return control().cmdSetSortOrder_Click();
    case Editor::visibility: return control().cmdSetVisibility_Click();
    case Editor::none: break;
    }
}

} // namespace comforts
