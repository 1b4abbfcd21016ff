#include "control/Zandor.h"

namespace TalvikDBxZandor {

/// The entry that stands for all columns of a table takes part in no join.
bool Zandor::IsAllColumns(const ColumnItem& entry) { return entry.Text() == u"*"; }

platform::Ref<TalvikTabulet::ColumnItem> Zandor::FirstSelected(Tabulet& table) {
    auto& entries = table.ColumnItems();
    for (std::int32_t n = 1; n <= entries.Count(); ++n)
        if (entries.Item(n)->Selected()) return entries.Item(n);
    return {};
}

/// The model table behind a shown one. Error 5 when the model holds none under its key.
Zandor::ZDTableRef Zandor::TableOf(std::int16_t Index) {
    return Model()->Tables().Item(lstTable(Index)->Tag());
}

void Zandor::lstTable_ColumnMouseDown(std::int16_t Index, const Ref<ColumnItem>&, std::int16_t,
                                      std::int16_t) {
    constexpr platform::StringView procedure = u"lstTable_ColumnMouseDown";
    Guard(procedure, [&] {
        Trace(procedure);
        // Held, because a host told of a column may unload the element.
        const Ref<Tabulet> element = lstTable(Index);
        auto& entries = element->ColumnItems();
        const ZDTableRef table = TableOf(Index);
        for (std::int32_t n = 1; n <= entries.Count(); ++n) {
            const Ref<ColumnItem> entry = entries.Item(n);
            const ZDColumnRef column = table->Columns().Item(entry->Key());
            const bool selected = entry->Selected();
            if (selected) Trace(u"Selected column found: " + entry->Text(), procedure);
            column->activated(selected ? std::int16_t{1} : std::int16_t{0});
            if (selected && mDebugSwitch != 0)
                Trace(u"Tabulet Column selected: " + column->Name(), procedure);
        }
    });
}

void Zandor::lstTable_ColumnMouseMove(std::int16_t Index, const Ref<ColumnItem>&,
                                      std::int16_t Button, std::int16_t) {
    Guard(u"lstTable_ColumnMouseMove", [&] {
        if (Button != platform::leftButton) return;
        mDragTableIndex = Index;
        GetDragColumns(Index);
        // Held, because the drop may come while Drag still runs and unload the element.
        const Ref<Tabulet> table = lstTable(Index);
        table->Drag(1);
    });
}

void Zandor::lstTable_ColumnMouseUp(std::int16_t, const Ref<ColumnItem>&, std::int16_t Button,
                                    std::int16_t) {
    Guard(u"lstTable_ColumnMouseUp", [&] {
        if (Button == platform::rightButton) PopupZandorMenu(0, 0, 0);
    });
}

bool Zandor::GetDragColumns(std::int16_t Index) {
    bool result = false;
    Guard(u"GetDragColumns", [&] {
        std::vector<Ref<clsDragColumn>> records;
        const Ref<Tabulet> element = lstTable(Index);
        auto& entries = element->ColumnItems();
        for (std::int32_t n = 1; n <= entries.Count(); ++n) {
            const Ref<ColumnItem> entry = entries.Item(n);
            if (entry->Selected()) records.push_back(DragRecord(Index, element, entry));
        }
        mDragColumns = std::move(records);
        result = true;
    });
    return result;
}

platform::Ref<clsDragColumn> Zandor::DragRecord(std::int16_t Index, const Ref<Tabulet>& element,
                                                const Ref<ColumnItem>& entry) {
    auto record = platform::makeRef<clsDragColumn>(mToolkit);
    record->TableIndex(Index);
    record->Table(element);
    record->Column(entry);
    record->ZDTable(TableOf(Index));
    record->ZDColumn(record->ZDTable()->Columns().Item(entry->Key()));
    return record;
}

void Zandor::lstTable_DragOver(std::int16_t Index, platform::Control*, float X, float Y,
                               std::int16_t) {
    Guard(u"lstTable_DragOver", [&] {
        const Ref<ColumnItem> target = lstTable(Index)->ColumnAt(X, Y);
        if (!target || Index == mDragTableIndex || IsAllColumns(*target)) return;
        auto& entries = lstTable(Index)->ColumnItems();
        for (std::int32_t n = 1; n <= entries.Count(); ++n) {
            const auto& entry = entries.Item(n);
            entry->Selected(entry == target);
            entry->Refresh();
        }
    });
}

void Zandor::lstTable_DragDrop(std::int16_t Index, platform::Control*, float X, float Y) {
    Guard(u"lstTable_DragDrop", [&] {
        const Ref<ColumnItem> target = lstTable(Index)->ColumnAt(X, Y);
        if (!target || IsAllColumns(*target) || mDragColumns.empty()) {
            mDragColumns.clear();
            return;
        }
        // However many columns were dragged, one join is made, from the first of them.
        const Ref<clsDragColumn> source = mDragColumns.front();
        if (IsAllColumns(*source->Column())) {
            mDragColumns.clear();
            return;
        }
        if (source->TableIndex() != Index) {
            Ref<clsJoinLine> record;
            if (DrawNewJoin(record, source->Table(), source->Column(), lstTable(Index), target, 0,
                            0)) {
                const ZDTableRef rightTable = TableOf(Index);
                AddNewJoin(record, source->ZDTable(), source->ZDColumn(), rightTable,
                           rightTable->Columns().Item(target->Key()));
                mEvents.Raise(Event::JoinCreated, {.Join = ModelJoin(*record)});
            }
        }
        mDragColumns.clear();
        mEvents.Raise(Event::Activate, {});
    });
}

} // namespace TalvikDBxZandor
