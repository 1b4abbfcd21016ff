#include <Zandor/Zandor.h>

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
Held<TalvikZandorLib::ZDTable> Zandor::TableOf(const Held<Tabulet>& element) {
    const String key = element->Tag();
    return Tables().Item(key);
}

/// Whether a table takes its selection at once, which it is told of then.
bool Zandor::ActivateSelected(const Held<Tabulet>& element,
                              const Held<TalvikZandorLib::ZDTable>& table) {
    const auto all = Hold(Ref<TalvikZandorLib::ActivatedColumns>(
        std::dynamic_pointer_cast<TalvikZandorLib::ActivatedColumns>(table.pointer())));
    if (!all) return false;
    std::vector<String> keys;
    for (const auto& entry : element->ColumnItems().Selected()) keys.push_back(entry->Key());
    return all->Activate(keys);
}

/// Makes the model's columns active as far as their entries are selected. Without a title nothing
/// is traced.
void Zandor::CopySelection(std::int16_t Index, platform::StringView traceTitle) {
    const auto element = Hold(lstTable(Index));
    const bool quiet = traceTitle.empty() || mDebugSwitch == 0;
    for (std::int32_t n = 1; n <= element->ColumnItems().Count(); ++n) {
        const auto entry = Hold(element->ColumnItems().Item(n));
        const auto table = TableOf(element);
        if (n == 1 && quiet && ActivateSelected(element, table)) return;
        const auto column = List(table, &TalvikZandorLib::ZDTable::Columns).Item(entry->Key());
        const bool selected = entry->Selected();
        const bool traced = selected && !traceTitle.empty();
        if (traced) Trace(u"Selected column found: " + entry->Text(), traceTitle);
        column->activated(selected ? std::int16_t{1} : std::int16_t{0});
        if (traced && mDebugSwitch != 0)
            Trace(u"Tabulet Column selected: " + column->Name(), traceTitle);
        // A table that the host has closed has no further entries that matter.
        require(Shows(Index, element));
    }
}

void Zandor::lstTable_ColumnMouseDown(std::int16_t Index, const Ref<ColumnItem>&, std::int16_t,
                                      std::int16_t) {
    constexpr platform::StringView procedure = u"lstTable_ColumnMouseDown";
    Guard(procedure, [&] {
        Trace(procedure);
        CopySelection(Index, procedure);
    });
}

void Zandor::lstTable_SelectionChanged(std::int16_t Index) {
    Guard(u"lstTable_SelectionChanged", [&] { CopySelection(Index, {}); });
}

void Zandor::lstTable_ColumnMouseMove(std::int16_t Index, const Ref<ColumnItem>&,
                                      std::int16_t Button, std::int16_t) {
    Guard(u"lstTable_ColumnMouseMove", [&] {
        if (Button != platform::leftButton || mReadOnly) return;
        mDragTableIndex = Index;
        // Held, because the drop may come while Drag still runs and unload the element.
        const auto before = Hold(lstTable.Find(Index));
        GetDragColumns(Index);
        const auto table = Hold(lstTable(Index));
        require(table.pointer() == before.pointer());
        table->Drag(1);
    });
}

void Zandor::lstTable_ColumnMouseUp(std::int16_t, const Ref<ColumnItem>&, std::int16_t Button,
                                    std::int16_t) {
    Guard(u"lstTable_ColumnMouseUp", [&] {
        if (Button == platform::rightButton) PopupZandorMenu(menuSource::table, 0, 0);
    });
}

bool Zandor::GetDragColumns(std::int16_t Index) {
    bool result = false;
    Guard(u"GetDragColumns", [&] {
        std::vector<Ref<clsDragColumn>> records;
        const auto element = Hold(lstTable(Index));
        for (std::int32_t n = 1; n <= element->ColumnItems().Count(); ++n) {
            const auto entry = Hold(element->ColumnItems().Item(n));
            if (entry->Selected()) records.push_back(DragRecord(Index, element, entry));
            require(Shows(Index, element));
        }
        // The records before go at the end, when nothing is in between any more.
        mDragColumns.swap(records);
        result = true;
    });
    return result;
}

platform::Ref<clsDragColumn> Zandor::DragRecord(std::int16_t Index, const Ref<Tabulet>& element,
                                                const Ref<ColumnItem>& entry) {
    auto record = platform::makeRef<clsDragColumn>(mLife);
    record->TableIndex(Index);
    record->Table(element);
    record->Column(entry);
    const auto table = TableOf(Hold(element));
    record->ZDTable(table);
    record->ZDColumn(List(table, &TalvikZandorLib::ZDTable::Columns).Item(entry->Key()));
    return record;
}

void Zandor::EmptyDragColumns() {
    // Out of the control first: what the records held may be the last of something of the host's.
    const auto gone = std::exchange(mDragColumns, {});
}

void Zandor::lstTable_DragOver(std::int16_t Index, platform::Control*, float X, float Y,
                               std::int16_t) {
    Guard(u"lstTable_DragOver", [&] {
        const auto table = Hold(lstTable(Index));
        const Ref<ColumnItem> target = table->ColumnAt(X, Y);
        if (!target || Index == mDragTableIndex || IsAllColumns(*target)) return;
        for (std::int32_t n = 1; n <= table->ColumnItems().Count(); ++n) {
            const auto entry = Hold(table->ColumnItems().Item(n));
            entry->Selected(entry.pointer() == target);
            entry->Refresh();
        }
    });
}

void Zandor::lstTable_DragDrop(std::int16_t Index, platform::Control*, float X, float Y) {
    Guard(u"lstTable_DragDrop", [&] {
        const auto table = Hold(lstTable(Index));
        const Ref<ColumnItem> target = table->ColumnAt(X, Y);
        if (!target || IsAllColumns(*target) || mDragColumns.empty()) {
            EmptyDragColumns();
            return;
        }
        // However many columns were dragged, one join is made, from the first of them.
        const Ref<clsDragColumn> source = mDragColumns.front();
        if (IsAllColumns(*source->Column())) {
            EmptyDragColumns();
            return;
        }
        if (source->TableIndex() != Index) {
            const auto model = Model();
            const Ref<clsJoinLine> record = JoinTo(*source, table, target);
            if (record && mModel == model.pointer()) {
                const auto join = ModelJoin(*record);
                Raise(Event::JoinCreated, {.Join = join});
            }
        }
        EmptyDragColumns();
        Raise(Event::Activate);
    });
}

} // namespace TalvikDBxZandor
