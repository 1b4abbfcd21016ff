#include "control/Zandor.h"

#include <algorithm>

namespace TalvikDBxZandor {

using MSFlexGridLib::alignCenterCenter;

void Zandor::sprColumn_DragDrop(platform::Control*, float X, float Y) {
    Guard(u"sprColumn_DragDrop", [&] {
        if (mDragColumns.empty()) return;
        InsertDragColumns(X, Y);
        mDragColumns.clear();
        mEvents.Raise(Event::Activate, {});
    });
}

void Zandor::mnuColumnDefinitionPaste_Click() {
    // The records stay: what was copied once can be pasted again and again.
    Guard(u"mnuColumnDefinitionPaste_Click", [&] { InsertDragColumns(mPopupX, mPopupY); });
}

/// Makes a definition of each drag record, side by side from the grid column of a point on.
void Zandor::InsertDragColumns(float X, float Y) {
    if (mDragColumns.empty()) return;
    std::int32_t column = 0;
    std::int32_t row = 0;
    basZandor::SpreadHitTest(mToolkit, column, row, *sprColumn, X, Y);
    // By value: what is inserted is told to the host, which may begin another drag.
    InsertRecords(std::vector(mDragColumns), std::max(column, 1));
}

void Zandor::InsertRecords(const std::vector<Ref<clsDragColumn>>& records, std::int32_t column) {
    for (const auto& record : records) {
        String fieldName = record->Table()->Text() + u".";
        fieldName += record->Column()->Text();
        InsertColumnDefinition(fieldName, column);
        AddNewAndCriterium(record->ZDColumn(), column);
        mEvents.Raise(Event::ColumnCreated, {.Definition = DefinitionOf(column)});
        ++column;
    }
}

bool Zandor::InsertColumnDefinition(const String& fieldName, std::int32_t column) {
    bool result = false;
    Guard(u"InsertColumnDefinition", [&] {
        if (column == 0) return;
        // Carries the last, blank column to the place of the new one. Where the last column is
        // taken, its definition is overwritten.
        for (std::int32_t i = sprColumn->Cols() - 2; i >= column; --i)
            sprColumn->ColPosition(i, i + 1);
        sprColumn->Col(column);
        sprColumn->Row(3);
        SetCell(u"Visible", alignCenterCenter);
        sprColumn->Row(0);
        SetCell(fieldName, alignCenterCenter);
        FitColumn(column, fieldName);
        result = true;
    });
    return result;
}

bool Zandor::RemoveColumn(std::int32_t column) {
    bool result = false;
    Guard(u"RemoveColumn", [&] {
        const std::int32_t last = sprColumn->Cols() - 1;
        if (column + 1 <= last) {
            for (std::int32_t row = 0; row < sprColumn->Rows(); ++row)
                sprColumn->TextMatrix(row, column, {});
            sprColumn->ColWidth(column, sprColumn->ColWidth(0));
            // A blank column names no definition, so that an editor over it finds none.
            sprColumn->ColData(column, 0);
            for (std::int32_t i = column + 1; i <= last; ++i) sprColumn->ColPosition(i, i - 1);
        }
        // The last column has nothing behind it that could close the gap; it stays as it is.
        result = true;
    });
    return result;
}

void Zandor::mnuColumnDefinitionDelete_Click() {
    Guard(u"mnuColumnDefinitionDelete_Click", [&] {
        std::int32_t column = 0;
        std::int32_t row = 0;
        basZandor::SpreadHitTest(mToolkit, column, row, *sprColumn, mPopupX, mPopupY);
        if (column < 1) return;
        const auto definition = DefinitionOf(column);
        RemoveColumn(column);
        Model()->ColumnDefinitions().Remove(definition->Key());
        mEvents.Raise(Event::ColumnRemoved, {.Definition = definition});
    });
}

void Zandor::mnuTableDefinitionCopy_Click() {
    Guard(u"mnuTableDefinitionCopy_Click", [&] { GetDragColumns(mActiveTableIndex); });
}

void Zandor::mnuTableDefinitionDelete_Click() {
    Guard(u"mnuTableDefinitionDelete_Click", [&] { lstTable_CloseClick(mActiveTableIndex); });
}

} // namespace TalvikDBxZandor
