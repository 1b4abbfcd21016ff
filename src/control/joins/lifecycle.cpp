#include "control/Zandor.h"

#include "platform/Numbers.h"

namespace TalvikDBxZandor {

using platform::decimal;
using platform::toInteger;

/// The model's counterpart of a join on the canvas. Error 13 when the record's Tag is no text,
/// 5 when the model holds no join under it.
platform::Ref<TalvikZandorLib::ZDJoin> Zandor::ModelJoin(const clsJoinLine& record) {
    const platform::Variant tag = record.Tag();
    const String* const key = std::get_if<String>(&tag);
    if (!key) throw platform::errors::typeMismatch();
    return Model()->Joins().Item(*key);
}

// The test reads the records' column texts, which a join made on the canvas leaves empty: such a
// join never counts as existing. Hosts rely on being able to draw one twice.
bool Zandor::JoinAllreadyExists(const Ref<Tabulet>& leftTable, const Ref<ColumnItem>& leftColumn,
                                const Ref<Tabulet>& rightTable,
                                const Ref<ColumnItem>& rightColumn) {
    bool result = false;
    Guard(u"JoinAllreadyExists", [&] {
        for (const auto& record : platform::Each<clsJoinLine>(mJoinLines)) {
            if (leftTable->TableHandle() == record->LeftTablehwnd() &&
                rightTable->TableHandle() == record->RightTablehwnd() &&
                leftColumn->ColumnItemName() == record->LeftColumnText() &&
                rightColumn->ColumnItemName() == record->RightColumnText()) {
                result = true;
                return;
            }
        }
    });
    return result;
}

bool Zandor::DrawNewJoin(Ref<clsJoinLine>& NewJoinLine, const Ref<Tabulet>& leftTable,
                         const Ref<ColumnItem>& leftColumn, const Ref<Tabulet>& rightTable,
                         const Ref<ColumnItem>& rightColumn, std::int16_t joinType,
                         std::int16_t compareOperator) {
    bool result = false;
    Guard(u"DrawNewJoin", [&] {
        if (JoinAllreadyExists(leftTable, leftColumn, rightTable, rightColumn)) return;
        std::int32_t n = 0;
        if (!mJoinFreeList->GetNextFreeIndex(n)) return;

        linJoin.Load(toInteger(n));
        shpJoin.Load(toInteger(2.0 * n));
        shpJoin.Load(toInteger(2.0 * n - 1));

        auto record = platform::makeRef<clsJoinLine>(mToolkit);
        record->LeftTablehwnd(leftTable->TableHandle());
        record->RightTablehwnd(rightTable->TableHandle());
        record->JoinLineIndex(n);
        record->LeftConnectorIndex(2 * n);
        record->RightConnectorIndex(2 * n - 1);
        record->JoinType(joinType);
        record->CompareOperator(compareOperator);
        record->LeftTableName(leftTable->Text());
        record->LeftColumnName(leftColumn->ColumnItemName());
        record->RightTableName(rightTable->Text());
        record->RightColumnName(rightColumn->ColumnItemName());
        record->Index(toInteger(n));
        mJoinLines.Add(record, decimal(n));

        DrawJoin(*record);
        NewJoinLine = record;
        result = true;
    });
    return result;
}

void Zandor::AddNewJoin(const Ref<clsJoinLine>& record, const ZDTableRef& leftTable,
                        const ZDColumnRef& leftColumn, const ZDTableRef& rightTable,
                        const ZDColumnRef& rightColumn) {
    Guard(u"AddNewJoin", [&] {
        const Ref<TalvikZandorLib::ZDJoin> join = mLibrary.NewZDJoin();
        join->LeftTable(leftTable);
        join->LeftColumn(leftColumn);
        join->RightTable(rightTable);
        join->RightColumn(rightColumn);
        // A join drawn by the user always enters the model as a normal one with "=".
        join->JoinType(0);
        join->CompareOperator(0);
        const auto stored = Model()->AddJoin(join);
        record->Tag(stored->Key());
    });
}

bool Zandor::RemoveJoin(const Ref<clsJoinLine>& record) {
    bool result = false;
    Guard(u"RemoveJoin", [&] {
        const std::int16_t n = record->Index();
        linJoin.Unload(n);
        shpJoin.Unload(toInteger(2.0 * n - 1));
        shpJoin.Unload(toInteger(2.0 * n));
        mJoinLines.Remove(decimal(n));
        mJoinFreeList->FreeIndex(n);
        // Its line has gone; the next click would look for it to take the highlight back.
        if (mLastJoin == record) mLastJoin = nullptr;
        result = true;
    });
    return result;
}

/// Joins the first copied column to the entry selected in the active table.
void Zandor::mnuTableDefinitionPaste_Click() {
    Guard(u"mnuTableDefinitionPaste_Click", [&] {
        if (mDragColumns.empty()) return;
        const Ref<clsDragColumn> source = mDragColumns.front();
        if (source->TableIndex() == mActiveTableIndex) return;
        const Ref<Tabulet> table = lstTable(mActiveTableIndex);
        const Ref<ColumnItem> target = FirstSelected(*table);
        if (!target || IsAllColumns(*target) || IsAllColumns(*source->Column())) return;
        Ref<clsJoinLine> record;
        if (!DrawNewJoin(record, source->Table(), source->Column(), table, target, 0, 0)) return;
        const ZDTableRef rightTable = TableOf(mActiveTableIndex);
        AddNewJoin(record, source->ZDTable(), source->ZDColumn(), rightTable,
                   rightTable->Columns().Item(target->Key()));
    });
}

void Zandor::mnuJoinDelete_Click() {
    Guard(u"mnuJoinDelete_Click", [&] {
        Ref<clsJoinLine> record;
        if (!JoinHitTest(record, mPopupX, mPopupY)) return;
        const auto join = ModelJoin(*record);
        RemoveJoin(record);
        Model()->Joins().Remove(join->Key());
        mEvents.Raise(Event::JoinRemoved, {.Join = join});
    });
}

} // namespace TalvikDBxZandor
