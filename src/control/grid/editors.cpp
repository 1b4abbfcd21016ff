#include "control/Zandor.h"

namespace TalvikDBxZandor {

namespace {

constexpr std::int32_t synonymRow = 1;
constexpr std::int32_t sortRow = 2;
constexpr std::int32_t visibleRow = 3;
constexpr std::int32_t firstCriteriaRow = 4;

/// Writes the text of a synonym or criteria row. False when there was nothing to change.
bool storeText(TalvikZandorLib::ZDColumnDefinition& definition, std::int32_t row,
               const platform::String& text) {
    if (row == synonymRow) {
        definition.Synonym(text);
        return true;
    }
    const platform::String key = platform::decimal(row);
    if (!definition.HasCriterium(key)) {
        if (text.empty()) return false;
        definition.AddCriterium(text, key);
    } else if (text.empty()) {
        definition.Criteria().Remove(key);
    } else {
        definition.Criteria().Item(key)->Criterium(text);
    }
    return true;
}

} // namespace

void Zandor::sprColumn_MouseDown(std::int16_t Button, std::int16_t, float X, float Y) {
    Guard(u"sprColumn_MouseDown", [&] {
        MakeGetValueFieldsInvisible();
        if (Button != platform::leftButton) return;
        std::int32_t column = 0;
        std::int32_t row = 0;
        basZandor::SpreadHitTest(mToolkit, column, row, *sprColumn, X, Y);
        if (column == 0 || row == 0) return;
        sprColumn->Row(row);
        sprColumn->Col(column);
        EditCell();
    });
}

/// Opens the editor of the current cell.
void Zandor::EditCell() {
    const std::int32_t row = sprColumn->Row();
    const String text = sprColumn->Text();
    if (row == sortRow)
        GetSortOrder(text);
    else if (row == visibleRow)
        GetVisibility(text);
    else
        GetTextValue(text);
}

void Zandor::sprColumn_MouseUp(std::int16_t Button, std::int16_t, float X, float Y) {
    Guard(u"sprColumn_MouseUp", [&] {
        if (Button == platform::rightButton) PopupZandorMenu(2, X, Y);
    });
}

void Zandor::sprColumn_Scroll() {
    Guard(u"sprColumn_Scroll", [&] { MakeGetValueFieldsInvisible(); });
}

void Zandor::cmdSetSortOrder_Click() {
    Guard(u"cmdSetSortOrder_Click", [&] {
        if (Model()->ColumnDefinitions().Count() != 0) {
            const auto definition = DefinitionOf(sprColumn->Col());
            definition->SortOrder(cobSortOrder->ListIndex());
            mEvents.Raise(Event::ColumnModified, {.Definition = definition});
            SetCell(cobSortOrder->Text(), MSFlexGridLib::alignCenterCenter);
        }
        fraSortOrder->Visible(false);
    });
}

void Zandor::cmdSetVisibility_Click() {
    Guard(u"cmdSetVisibility_Click", [&] {
        if (Model()->ColumnDefinitions().Count() != 0) {
            const auto definition = DefinitionOf(sprColumn->Col());
            definition->Visible(cobVisibility->ListIndex() == 0);
            mEvents.Raise(Event::ColumnModified, {.Definition = definition});
            SetCell(cobVisibility->Text(), MSFlexGridLib::alignCenterCenter);
        }
        fraVisibility->Visible(false);
    });
}

void Zandor::cmdSetTextValue_Click() {
    Guard(u"cmdSetTextValue_Click", [&] {
        if (Model()->ColumnDefinitions().Count() != 0) {
            const std::int32_t row = sprColumn->Row();
            const auto definition = DefinitionOf(sprColumn->Col());
            const String text = txtValue->Text();
            // A drop under an open editor makes the new column's field current: nothing to write.
            if (row == synonymRow || row >= firstCriteriaRow) {
                if (storeText(*definition, row, text))
                    mEvents.Raise(Event::ColumnModified, {.Definition = definition});
                SetCell(text, MSFlexGridLib::alignLeftCenter);
            }
        }
        fraValue->Visible(false);
    });
}

void Zandor::cobSortOrder_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"cobSortOrder_KeyDown", [&] {
        if (KeyCode != platform::keyEscape) return;
        cobSortOrder->ListIndex(0);
        fraSortOrder->Visible(false);
    });
}

void Zandor::cobVisibility_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"cobVisibility_KeyDown", [&] {
        if (KeyCode != platform::keyEscape) return;
        cobVisibility->ListIndex(0);
        fraVisibility->Visible(false);
    });
}

void Zandor::txtValue_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"txtValue_KeyDown", [&] {
        if (KeyCode != platform::keyEscape) return;
        txtValue->Text({});
        fraValue->Visible(false);
    });
}

} // namespace TalvikDBxZandor
