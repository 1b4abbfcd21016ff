#include <Zandor/Zandor.h>

#include <Zandor/control/KeyNumber.h>
#include <Zandor/control/rows.h>

#include <algorithm>

namespace TalvikDBxZandor {

using MSFlexGridLib::alignCenterCenter;

void Zandor::sprColumn_DragDrop(platform::Control*, float X, float Y) {
    Guard(u"sprColumn_DragDrop", [&] {
        if (mDragColumns.empty()) return;
        InsertDragColumns(X, Y);
        EmptyDragColumns();
        Raise(Event::Activate);
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
    basZandor::SpreadHitTest(mLife, column, row, *sprColumn, X, Y);
    // By value: what is inserted is told to the host, which may begin another drag.
    InsertRecords(std::vector(mDragColumns), std::max(column, 1));
}

void Zandor::InsertRecords(const std::vector<Ref<clsDragColumn>>& records, std::int32_t column) {
    const auto model = Model();
    for (const auto& record : records) {
        if (!MayComeOut(record->ZDColumn())) continue;
        String fieldName = Hold(record->Table())->Text() + u".";
        fieldName += Hold(record->Column())->Text();
        const std::int32_t binding = mBinding;
        InsertColumnDefinition(fieldName, column);
        AddNewAndCriterium(record->ZDColumn(), column);
        require(binding == mBinding);
        const auto definition = DefinitionOf(column);
        if (const auto ordered = Ordered()) {
            const auto before = DefinitionBefore(column);
            ordered->StandsBehind(definition, before);
        }
        Raise(Event::ColumnCreated, {.Definition = definition});
        // The host may have bound another model; its columns are none of these.
        require(mModel == model.pointer());
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
        sprColumn->Row(row::visible);
        SetCell(mWords.Visible, alignCenterCenter);
        sprColumn->Row(row::field);
        SetCell(fieldName, alignCenterCenter);
        FitColumn(column, fieldName);
        result = true;
    });
    return result;
}

/// Nothing where the query keeps no order of its definitions.
Held<TalvikZandorLib::OrderedDefinitions> Zandor::Ordered() {
    const Ref<TalvikZandorLib::Zandor> model = Model();
    const Ref<TalvikZandorLib::OrderedDefinitions> ordered =
        std::dynamic_pointer_cast<TalvikZandorLib::OrderedDefinitions>(model);
    return Hold(ordered);
}

/// The definition of the nearest grid column to the left that has one; nothing where none has.
/// Not by its position in the model, of which the grid may show less than there is.
Held<TalvikZandorLib::ZDColumnDefinition> Zandor::DefinitionBefore(std::int32_t column) {
    const std::int32_t binding = mBinding;
    const auto definitions = Definitions();
    while (--column >= 1) {
        const std::int32_t number = sprColumn->ColData(column);
        if (number == 0) continue;
        const String key = keyOfNumber(number);
        for (const auto& definition : definitions)
            if (definition->Key() == key) return definition;
        require(binding == mBinding);
    }
    return {};
}

bool Zandor::MoveColumn(std::int32_t column, std::int32_t position) {
    bool result = false;
    Guard(u"MoveColumn", [&] {
        const auto ordered = Ordered();
        if (mReadOnly || !ordered || column < 1 || position < 1 || sprColumn->ColData(column) == 0)
            return;
        // No blank column comes between.
        std::int32_t last = sprColumn->Cols() - 1;
        while (sprColumn->ColData(last) == 0) --last;
        position = std::min(position, last);
        const std::int32_t binding = mBinding;
        const auto definition = DefinitionOf(column);
        result = position == column;
        if (result) return;
        const auto before = DefinitionBefore(position < column ? position : position + 1);
        require(binding == mBinding);
        ordered->StandsBehind(definition, before);
        MakeGetValueFieldsInvisible();
        require(binding == mBinding);
        const std::int32_t current = sprColumn->Col();
        sprColumn->ColPosition(column, position);
        // The current cell goes with its column.
        if (current == column)
            sprColumn->Col(position);
        else if (current > column && current <= position)
            sprColumn->Col(current - 1);
        else if (current < column && current >= position)
            sprColumn->Col(current + 1);
        result = true;
        Raise(Event::ColumnModified, {.Definition = definition});
    });
    return result;
}

bool Zandor::RemoveColumn(std::int32_t column) {
    bool result = false;
    Guard(u"RemoveColumn", [&] {
        const std::int32_t last = sprColumn->Cols() - 1;
        if (column + 1 <= last) {
            ClearColumn(column);
            for (std::int32_t i = column + 1; i <= last; ++i) sprColumn->ColPosition(i, i - 1);
        }
        // The last column has nothing behind it that could close the gap; it stays as it is.
        result = true;
    });
    return result;
}

void Zandor::ClearColumn(std::int32_t column) {
    for (std::int32_t row = 0; row < sprColumn->Rows(); ++row)
        sprColumn->TextMatrix(row, column, {});
    sprColumn->ColWidth(column, sprColumn->ColWidth(0));
    // A blank column names no definition, so that an editor over it finds none.
    sprColumn->ColData(column, 0);
}

void Zandor::mnuColumnDefinitionDelete_Click() {
    Guard(u"mnuColumnDefinitionDelete_Click", [&] {
        std::int32_t column = 0;
        std::int32_t row = 0;
        basZandor::SpreadHitTest(mLife, column, row, *sprColumn, mPopupX, mPopupY);
        if (column < 1) return;
        const auto model = Model();
        const std::int32_t number = sprColumn->ColData(column);
        const auto definition = DefinitionOf(column);
        if (!MayRemoveColumn(definition)) return;
        // The host may have shown its model anew when it was asked.
        require(mModel == model.pointer() && sprColumn->ColData(column) == number);
        RemoveColumn(column);
        const std::int32_t binding = mBinding;
        const String key = definition->Key();
        List(model, &TalvikZandorLib::Zandor::ColumnDefinitions).Remove(key);
        // A host that showed its model anew on the way has shown the column once more.
        if (binding != mBinding && mModel == model.pointer())
            for (std::int32_t i = 1; i < sprColumn->Cols(); ++i)
                if (sprColumn->ColData(i) == number) RemoveColumn(i);
        Raise(Event::ColumnRemoved, {.Definition = definition});
    });
}

void Zandor::mnuTableDefinitionCopy_Click() {
    Guard(u"mnuTableDefinitionCopy_Click", [&] { GetDragColumns(mActiveTableIndex); });
}

/// Joins the first copied column to the entry selected in the active table.
void Zandor::mnuTableDefinitionPaste_Click() {
    Guard(u"mnuTableDefinitionPaste_Click", [&] {
        if (mDragColumns.empty()) return;
        const Ref<clsDragColumn> source = mDragColumns.front();
        if (source->TableIndex() == mActiveTableIndex) return;
        const auto table = Hold(lstTable(mActiveTableIndex));
        const Ref<ColumnItem> target = FirstSelected(*table);
        if (!target || IsAllColumns(*target) || IsAllColumns(*source->Column())) return;
        JoinTo(*source, table, target);
    });
}

void Zandor::mnuTableDefinitionDelete_Click() {
    Guard(u"mnuTableDefinitionDelete_Click", [&] { lstTable_CloseClick(mActiveTableIndex); });
}

} // namespace TalvikDBxZandor
