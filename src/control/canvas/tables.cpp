#include "control/Zandor.h"

namespace TalvikDBxZandor {

using platform::Each;

void Zandor::ShowTable(std::int16_t slot, TalvikZandorLib::ZDTable& table, std::int32_t& cascade) {
    lstTable.Load(slot);
    // Held, because a host asked for a column may unload the element.
    const Ref<Tabulet> held = lstTable(slot);
    Tabulet& element = *held;
    element.Text(table.Name());
    element.Tag(table.Key());

    // A table without place and size of its own takes two steps of the cascade.
    if (table.Left() >= 0 && table.Top() >= 0) {
        element.Left(static_cast<float>(table.Left()));
        element.Top(static_cast<float>(table.Top()));
    } else {
        ++cascade;
        element.Left(static_cast<float>(cascade * 120));
        element.Top(static_cast<float>(cascade * 120));
    }
    if (table.Width() > 0 && table.Height() > 0) {
        element.Width(static_cast<float>(table.Width()));
        element.Height(static_cast<float>(table.Height()));
    } else {
        ++cascade;
        element.Width(2000);
        element.Height(2000);
    }

    FillTable(element, table);
    element.Activated(true);
    element.Visible(true);
    element.ZOrder();
    element.Complete();
    Trace(u"Table visible.", u"SetZandor");
}

void Zandor::FillTable(Tabulet& element, TalvikZandorLib::ZDTable& table) {
    for (const auto& column : Each(table.Columns())) {
        const String name = column->Name();
        const auto entry = element.ColumnItems().Add(column->Key(), name);
        if (column->Marker()) entry->Image(1);
        if (!column->Selected()) continue;
        Trace(u"Select column: " + name, u"SetZandor");
        entry->Selected(true);
        entry->Refresh();
        entry->EnsureVisible();
        Trace(u"Column selected: " + name, u"SetZandor");
    }
}

bool Zandor::FindTable(const String& TableName, Ref<Tabulet>& Table) {
    bool result = true;
    Guard(u"FindTable", [&] {
        Table = nullptr;
        for (std::int16_t i = 1; i <= lastTableSlot; ++i) {
            if (mTableFreeList->IsFree(i) || lstTable(i)->Text() != TableName) continue;
            Table = lstTable(i);
            break;
        }
    });
    return result;
}

bool Zandor::FindColumn(const Ref<Tabulet>& Table, const String& ColumnName,
                        Ref<ColumnItem>& Column) {
    bool result = true;
    Guard(u"FindColumn", [&] {
        Column = nullptr;
        auto& entries = Table->ColumnItems();
        for (std::int32_t n = 1; n <= entries.Count(); ++n) {
            if (entries.Item(n)->Text() != ColumnName) continue;
            Column = entries.Item(n);
            break;
        }
    });
    return result;
}

bool Zandor::SetSelectedTable(const String& TableName) {
    bool result = false;
    Guard(u"SetSelectedTable", [&] {
        Trace(u"SetSelectedTable");
        bool found = false;
        for (const auto model = Model(); const auto& table : Each(model->Tables())) {
            const bool match = !found && table->Key() == TableName;
            table->Selected(match ? std::int16_t{1} : std::int16_t{0});
            found = found || match;
        }
        result = true;
    });
    return result;
}

bool Zandor::ShowSelectedTable() {
    bool result = false;
    Guard(u"ShowSelectedTable", [&] {
        ZDTableRef current;
        for (const auto model = Model(); const auto& table : Each(model->Tables())) {
            if (!current) current = table;
            if (table->Selected() == 0) continue;
            current = table;
            break;
        }
        if (current) SetCurrentTable(current->Name());
        result = true;
    });
    return result;
}

bool Zandor::RemoveTable(std::int16_t Index) {
    bool result = false;
    Guard(u"RemoveTable", [&] {
        const String name = lstTable(Index)->Text();
        DeletedTable = name;
        RemoveColumnsOf(name);

        std::vector<Ref<clsJoinLine>> joins;
        for (const auto& record : Each<clsJoinLine>(mJoinLines))
            if (record->LeftTableName() == name || record->RightTableName() == name)
                joins.push_back(record);
        for (const auto& record : joins) RemoveJoin(record);

        TerminateTable(Index);
        lstTable.Unload(Index);
        mTableFreeList->FreeIndex(Index);
        OrganizeTables();
        SetFocusBack();
        result = true;
    });
    return result;
}

/// Removes the output columns whose field begins with a table's name. The test knows no separator,
/// so ORDER takes the columns of ORDERS with it: hosts have come to expect it.
void Zandor::RemoveColumnsOf(const String& tableName) {
    const std::int32_t last = sprColumn->Cols() - 1;
    // No more columns than there are can go; without this bound a match in the last column, which
    // cannot be removed, or an empty name would be found for ever.
    std::int32_t removable = last;
    for (std::int32_t column = 1; column <= last; ++column) {
        if (!sprColumn->TextMatrix(0, column).starts_with(tableName)) continue;
        if (removable-- == 0) return;
        RemoveColumn(column);
        --column;
    }
}

void Zandor::TerminateTable(std::int16_t Index) {
    Guard(u"TerminateTable", [&] {
        if (lstTable(Index)) lstTable(Index)->Terminate();
    });
}

void Zandor::lstTable_CloseClick(std::int16_t Index) {
    Guard(u"lstTable_CloseClick", [&] {
        Model()->DeleteTable(TableOf(Index));
        RemoveTable(Index);
        mEvents.Raise(Event::TableDeleted, {});
    });
}

void Zandor::lstTable_GotFocus(std::int16_t Index) {
    // The report's capital O is as hosts know it.
    Guard(u"lstTable_GotFOcus", [&] {
        SetCurrentTable(lstTable(Index)->Text());
        MakeGetValueFieldsInvisible();
        mActiveTableIndex = Index;
    });
}

void Zandor::SetFocusBack() {
    Guard(u"SetFocusBack", [&] {
        if (mTableFreeList->IsFree(mActiveTableIndex)) mActiveTableIndex = 0;
        const bool outOfReach = mActiveTableIndex == 0 || lstTable(mActiveTableIndex)->Top() < 0 ||
                                lstTable(mActiveTableIndex)->Left() < 0;
        if (!outOfReach) return;
        if (!mOnlyJoin) {
            sprColumn->SetFocus();
            return;
        }
        for (std::int16_t i = 1; i <= lastTableSlot; ++i) {
            if (mTableFreeList->IsFree(i)) continue;
            if (lstTable(i)->Top() > 0 && lstTable(i)->Left() > 0) {
                mActiveTableIndex = i;
                return;
            }
        }
    });
}

} // namespace TalvikDBxZandor
