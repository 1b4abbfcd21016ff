#include "comforts/Door.h"

#include <Zandor/control/KeyNumber.h>

#include <Zandor/comforts/Spoken.h>

#include <algorithm>
#include <set>

namespace zandor::comforts {

using TalvikDBxZandor::Event;

void Door::shut() {
    if (mControl) mControl->mHooks = {};
    mControl = nullptr;
}

bool Door::hasAnotherModel() {
    const auto now = model();
    const bool another = mModel.lock() != now;
    mModel = now;
    return another;
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
    if (first > 0 && grid().ColData(first) == keyNumber) return first;
    for (std::int32_t column = 1; column < grid().Cols(); ++column)
        if (grid().ColData(column) == keyNumber) return column;
    return 0;
}

TalvikDBxZandor::Held<TalvikZandorLib::ZDColumnDefinition> Door::definitionOf(std::int32_t column) {
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

std::int32_t Door::columnOfKey(const String& key) const {
    if (key.empty() || !TalvikDBxZandor::isKeyOfNumber(key)) return 0;
    const std::int32_t number = TalvikDBxZandor::numberOfKey(key);
    return number == 0 ? 0 : columnWith(number, 0);
}

std::vector<std::pair<std::int16_t, platform::Ref<TalvikTabulet::Tabulet>>> Door::tables() const {
    std::vector<std::pair<std::int16_t, Ref<TalvikTabulet::Tabulet>>> shown;
    for (const auto& [slot, table] : control().lstTable)
        if (slot != 0) shown.emplace_back(slot, table);
    return shown;
}

std::vector<Field> Door::fields() const {
    std::vector<Field> all;
    for (const auto& [slot, table] : tables()) {
        const auto& entries = table->ColumnItems();
        for (std::int32_t n = 1; n <= entries.Count(); ++n)
            all.push_back({slot, n, table->Text() + u'.' + entries.Item(n)->Text()});
    }
    return all;
}

bool Door::has(const Field& field) const {
    const auto all = fields();
    return std::find(all.begin(), all.end(), field) != all.end();
}

void Door::changeField(std::int32_t column, const Field& field) {
    const auto definition = definitionOf(column);
    if (!definition || grid().TextMatrix(row::field, column) == field.name) return;
    const Ref<TalvikTabulet::Tabulet> element = control().lstTable(field.table);
    const auto record =
        control().DragRecord(field.table, element, element->ColumnItems().Item(field.entry));
    const auto chosen = record->ZDColumn();
    if (!control().MayComeOut(chosen)) return;
    definition->Column(chosen);
    // A host asked for its columns may have moved this one.
    const std::int32_t now = columnOfKey(definition->Key());
    if (now == 0) return;
    control().sprColumn->TextMatrix(row::field, now, field.name);
    control().FitColumn(now, field.name);
    tellModified(definition);
}

TalvikDBxZandor::Held<TalvikZandorLib::SizedDefinition>
Door::sizedDefinitionOf(std::int32_t column) {
    const Ref<TalvikZandorLib::ZDColumnDefinition> definition = definitionOf(column);
    const Ref<TalvikZandorLib::SizedDefinition> sized =
        std::dynamic_pointer_cast<TalvikZandorLib::SizedDefinition>(definition);
    return control().Hold(sized);
}

std::optional<std::int32_t> Door::storedWidth(std::int32_t column) {
    const auto sized = sizedDefinitionOf(column);
    if (!sized) return {};
    return sized->Width();
}

TalvikDBxZandor::Held<TalvikZandorLib::ZDColumnDefinition> Door::storeWidth(std::int32_t column,
                                                                            std::int32_t width) {
    auto definition = definitionOf(column);
    const auto sized = sizedDefinitionOf(column);
    if (!sized || sized->Width() == width) return {};
    sized->Width(width);
    return definition;
}

platform::Ref<TalvikZandorLib::ZDTable> Door::tableOf(const TalvikTabulet::Tabulet& element) {
    try {
        // The model's code may end the element.
        // NOLINTNEXTLINE(performance-unnecessary-copy-initialization)
        const String key = element.Tag();
        return control().Tables().Item(key);
    } catch (const platform::RuntimeError&) {
        return {};
    }
}

void Door::markOutput(bool marks) {
    // A model may hand out the table's own column, or one that reads "table.column".
    std::set<const void*> columns;
    std::set<String> names;
    if (marks)
        for (const auto& definition : control().Definitions()) {
            if (!definition->Visible()) continue;
            const auto column = control().Hold(definition->Column());
            if (!column) continue;
            columns.insert(column.get());
            const String name = column->Name();
            names.insert(name);
            // What stands in the parentheses of a total comes out by it.
            const std::size_t open = name.find(u'(');
            if (open != String::npos && name.back() == u')')
                names.insert(name.substr(open + 1, name.size() - open - 2));
        }
    if (columns.empty() && !mMarked) return;
    mMarked = true;
    for (const auto& [slot, table] : tables()) {
        const auto held = control().Hold(tableOf(*table));
        if (!held) continue;
        const auto own = control().List(held, &TalvikZandorLib::ZDTable::Columns);
        for (std::int32_t n = 1; n <= own.Count(); ++n) {
            const auto column = own.Item(n);
            const auto& entries = control().Hold(table)->ColumnItems();
            if (n > entries.Count()) break;
            const auto entry = entries.Item(n);
            entry->ComesOut(columns.contains(column.get()) ||
                            names.contains(table->Text() + u'.' + entry->Text()));
        }
    }
}

platform::String Door::nameOf(const platform::Line& line) {
    const auto sideOf = [&](const TalvikDBxZandor::DrawnEnd& end) -> std::optional<JoinSide> {
        const TalvikTabulet::Tabulet* const table = control().lstTable.Peek(end.Slot);
        if (!table || !end.Item) return {};
        return JoinSide{table->Tag(), end.Item->Key(), table->Text() + u'.' + end.Item->Text()};
    };
    for (const auto& join : platform::Each(control().mJoinLines)) {
        if (control().linJoin.Peek(join->JoinLineIndex()) != &line) continue;
        const auto left = sideOf(join->LeftEnd);
        const auto right = sideOf(join->RightEnd);
        if (!left || !right) return {};
        return join->Drawn.value_or(true) ? nameOfJoin(control(), *left, *right)
                                          : nameOfJoin(control(), *right, *left);
    }
    return {};
}

void Door::clearNotes() {
    for (std::int32_t column = 0; column < grid().Cols(); ++column)
        for (std::int32_t row = 0; row < grid().Rows(); ++row) note(row, column, {});
}

void Door::popUpOver(std::int16_t table) {
    control().lstTable_GotFocus(table);
    if (isOpen()) control().PopupZandorMenu(TalvikDBxZandor::menuSource::table, 0, 0);
}

std::unique_ptr<platform::MenuEntry>
Door::addTableEntry(platform::StringView name, const String& caption, platform::PlainEvent click) {
    return control().mnuZandor->makeEntry({.Name = name, .Caption = caption}, std::move(click),
                                          control().mnuTableDefinitionSep.get());
}

platform::String Door::keyOfActiveTable() const {
    return control().lstTable(control().mActiveTableIndex)->Tag();
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

void Door::dropDown() {
    if (editor() == Editor::sortOrder) control().cobSortOrder->DropDown();
    if (editor() == Editor::visibility) control().cobVisibility->DropDown();
}

void Door::placeEditor() {
    switch (editor()) {
    case Editor::text: return control().PlaceEditor(control().fraValue);
    case Editor::sortOrder: return control().PlaceEditor(control().fraSortOrder);
    case Editor::visibility: return control().PlaceEditor(control().fraVisibility);
    case Editor::none: break;
    }
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
    if (!definition->HasCriterium(key)) return String();
    return control()
        .List(definition, &TalvikZandorLib::ZDColumnDefinition::Criteria)
        .Item(key)
        ->Criterium();
}

void Door::set(Editor editor) {
    switch (editor) {
    case Editor::text: return control().cmdSetTextValue_Click();
    case Editor::sortOrder: return control().cmdSetSortOrder_Click();
    case Editor::visibility: return control().cmdSetVisibility_Click();
    case Editor::none: break;
    }
}

} // namespace zandor::comforts
