#include <Zandor/Zandor.h>

#include <Zandor/control/KeyNumber.h>

#include <algorithm>
#include <set>

namespace TalvikDBxZandor {

using TalvikZandorLib::ZDTable;

/// Whether an element still stands in its slot; the host may have closed it, and shown another
/// there.
bool Zandor::Shows(std::int16_t slot, const Held<Tabulet>& element) const {
    return element && lstTable.Find(slot) == element.pointer();
}

bool Zandor::Shows(const Held<Tabulet>& element) const {
    return std::any_of(lstTable.begin(), lstTable.end(),
                       [&](const auto& shown) { return shown.second == element.pointer(); });
}

Held<TalvikTabulet::Tabulet> Zandor::ShowTable(std::int16_t slot, const Held<ZDTable>& table,
                                               std::int32_t& cascade) {
    lstTable.Load(slot);
    auto element = Hold(lstTable(slot));
    const String name = table->Name();
    element->Text(name);
    const String key = table->Key();
    element->Tag(key);

    // A table without place and size of its own takes two steps of the cascade.
    const auto asked = [&](std::int32_t (ZDTable::*side)() const) {
        return static_cast<float>(((*table).*side)());
    };
    if (asked(&ZDTable::Left) >= 0 && asked(&ZDTable::Top) >= 0) {
        const float left = asked(&ZDTable::Left);
        element->Left(left);
        const float top = asked(&ZDTable::Top);
        element->Top(top);
    } else {
        ++cascade;
        element->Left(static_cast<float>(cascade * 120));
        element->Top(static_cast<float>(cascade * 120));
    }
    if (asked(&ZDTable::Width) > 0 && asked(&ZDTable::Height) > 0) {
        const float width = asked(&ZDTable::Width);
        element->Width(width);
        const float height = asked(&ZDTable::Height);
        element->Height(height);
    } else {
        ++cascade;
        element->Width(2000);
        element->Height(2000);
    }

    FillTable(element, table);
    if (!Shows(element)) return element;
    element->Activated(true);
    element->Visible(true);
    element->ZOrder();
    element->Complete();
    Trace(u"Table visible.", u"SetZandor");
    return element;
}

void Zandor::FillTable(const Held<Tabulet>& element, const Held<ZDTable>& table) {
    for (const auto& column : List(table, &ZDTable::Columns)) {
        const String name = column->Name();
        const String key = column->Key();
        if (!Shows(element)) return;
        const auto entry = Hold(element->ColumnItems().Add(key, name));
        if (column->Marker()) entry->Image(1);
        if (!column->Selected()) continue;
        Trace(u"Select column: " + name, u"SetZandor");
        if (!Shows(element)) return;
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
            if (!entries.Reads(n, ColumnName)) continue;
            Column = entries.Item(n);
            break;
        }
    });
    return result;
}

bool Zandor::SetSelectedTable(const String& given) {
    bool result = false;
    Guard(u"SetSelectedTable", [&, TableName = given] {
        Trace(u"SetSelectedTable");
        bool found = false;
        for (const auto& table : Tables()) {
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
        Held<ZDTable> current;
        for (const auto& table : Tables()) {
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
        const auto table = Hold(lstTable(Index));
        const String name = table->Text();
        DeletedTable = name;
        RemoveColumnsOf(name);

        // A record without a name is one that there was no memory to write it to.
        const auto isOf = [&](const String& side, std::int32_t handle) {
            return side == name || (side.empty() && handle == table->TableHandle());
        };
        std::vector<Ref<clsJoinLine>> joins;
        for (const auto& record : platform::Each<clsJoinLine>(mJoinLines))
            if (isOf(record->LeftTableName(), record->LeftTablehwnd()) ||
                isOf(record->RightTableName(), record->RightTablehwnd()))
                joins.push_back(record);
        for (const auto& record : joins)
            if (Draws(record)) RemoveJoin(record);

        require(Shows(Index, table));
        UnloadTable(Index);
        OrganizeTables();
        SetFocusBack();
        result = true;
    });
    return result;
}

/// Removes the output columns whose field begins with a table's name, and those that went with it
/// in the model by another. The first test knows no separator, so ORDER takes the columns of ORDERS
/// with it: hosts have come to expect it.
void Zandor::RemoveColumnsOf(const String& tableName) {
    const std::int32_t last = sprColumn->Cols() - 1;
    // No more columns than there are can go; without this bound a match in the last column, which
    // cannot be removed, or an empty name would be found for ever.
    std::int32_t removable = last;
    for (std::int32_t column = 1; column <= last; ++column) {
        if (!sprColumn->TextMatrix(0, column).starts_with(tableName)) continue;
        if (removable-- == 0) break;
        RemoveColumn(column);
        --column;
    }
    if (!Ordered()) return;
    // Totals and expressions do not begin with the name. A query that knows the order of its
    // definitions has taken those away itself that went with the table.
    std::set<std::int32_t> numbers;
    for (const auto& definition : Definitions())
        if (isKeyOfNumber(definition->Key())) numbers.insert(numberOfKey(definition->Key()));
    for (std::int32_t column = last; column >= 1; --column) {
        const std::int32_t number = sprColumn->ColData(column);
        if (number != 0 && !numbers.contains(number)) RemoveColumn(column);
    }
}

void Zandor::TerminateTable(std::int16_t Index) {
    Guard(u"TerminateTable", [&] {
        if (const auto table = Hold(lstTable.Find(Index))) table->Terminate();
    });
}

void Zandor::UnloadTable(std::int16_t Index) {
    const auto table = Hold(lstTable(Index));
    TerminateTable(Index);
    require(Shows(Index, table));
    lstTable.Unload(Index);
    mTableFreeList->FreeIndex(Index);
    mOwnPlaces.erase(Index);
    // A drag record may hold the element for longer; it leaves the screen all the same.
    table->Unload();
}

void Zandor::lstTable_CloseClick(std::int16_t Index) {
    Guard(u"lstTable_CloseClick", [&] {
        const auto model = Model();
        const auto element = Hold(lstTable(Index));
        const String name = element->Text();
        const auto table = TableOf(element);
        if (!MayCloseTable(table)) return;
        model->DeleteTable(table);
        // A host may have shown what is left of its model already.
        if (Shows(Index, element))
            RemoveTable(Index);
        else
            DeletedTable = name;
        Raise(Event::TableDeleted);
    });
}

void Zandor::lstTable_GotFocus(std::int16_t Index) {
    // The report's capital O is as hosts know it.
    Guard(u"lstTable_GotFOcus", [&] {
        const auto table = Hold(lstTable(Index));
        SetCurrentTable(table->Text());
        MakeGetValueFieldsInvisible();
        if (Shows(Index, table)) mActiveTableIndex = Index;
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
            const Ref<Tabulet> shown = lstTable.Find(i);
            if (shown && shown->Top() > 0 && shown->Left() > 0) {
                mActiveTableIndex = i;
                return;
            }
        }
    });
}

} // namespace TalvikDBxZandor
