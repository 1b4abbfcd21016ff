#include <Zandor/Zandor.h>

#include <Zandor/platform/Numbers.h>

namespace TalvikDBxZandor {

using platform::decimal;
using platform::toInteger;

/// The model's counterpart of a join on the canvas. Error 13 when the record's Tag is no text,
/// 5 when the model holds no join under it.
Held<TalvikZandorLib::ZDJoin> Zandor::ModelJoin(const clsJoinLine& record) {
    const platform::Variant tag = record.Tag();
    const String* const key = std::get_if<String>(&tag);
    if (!key) throw platform::errors::typeMismatch();
    return Joins().Item(*key);
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
        // A table that has been closed since its column was copied is joined to nothing.
        const auto gone = [this](const auto& table) { return table && !Shows(Hold(table)); };
        if (gone(leftTable) || gone(rightTable)) return;
        std::int32_t n = 0;
        if (!mJoinFreeList->GetNextFreeIndex(n)) return;

        linJoin.Load(toInteger(n));
        shpJoin.Load(toInteger(2.0 * n));
        shpJoin.Load(toInteger(2.0 * n - 1));

        auto record = platform::makeRef<clsJoinLine>(mLife);
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
        mReaches.add(record->Index());

        DrawJoin(*record);
        // Where the drawing failed, the host may have answered the report by closing a table.
        require(Draws(record));
        NewJoinLine = record;
        result = true;
    });
    return result;
}

/// False when the model has not taken the join.
bool Zandor::AddNewJoin(const Ref<clsJoinLine>& record, const ZDTableRef& leftTable,
                        const ZDColumnRef& leftColumn, const ZDTableRef& rightTable,
                        const ZDColumnRef& rightColumn) {
    bool result = false;
    Guard(u"AddNewJoin", [&] {
        const auto join = Hold(mLibrary->NewZDJoin());
        join->LeftTable(leftTable);
        join->LeftColumn(leftColumn);
        join->RightTable(rightTable);
        join->RightColumn(rightColumn);
        // A join drawn by the user always enters the model as a normal one with "=".
        join->JoinType(0);
        join->CompareOperator(0);
        const auto stored = Hold(Model()->AddJoin(join));
        result = true;
        record->Tag(stored->Key());
    });
    return result;
}

/// Draws a join of a dragged or copied column and hands it to the model. Nothing when none was made
/// or it cannot be told from others; a join that the model refuses does not stay drawn.
platform::Ref<clsJoinLine> Zandor::JoinTo(const clsDragColumn& source, const Held<Tabulet>& table,
                                          const Ref<ColumnItem>& target) {
    if (!MayJoin(source, table, target)) return {};
    Ref<clsJoinLine> record;
    if (!DrawNewJoin(record, source.Table(), source.Column(), table, target, 0, 0)) return {};
    const auto rightTable = TableOf(table);
    const auto columns = List(rightTable, &TalvikZandorLib::ZDTable::Columns);
    const auto rightColumn = columns.Item(Hold(target)->Key());
    if (!Draws(record)) return {};
    const bool taken =
        AddNewJoin(record, source.ZDTable(), source.ZDColumn(), rightTable, rightColumn);
    if (!taken && Draws(record)) RemoveJoin(record);
    return HasTag(*record) ? record : nullptr;
}

bool Zandor::HasTag(const clsJoinLine& record) {
    return !std::holds_alternative<std::monostate>(record.Tag());
}

/// Whether a join is still drawn; the host may have removed it.
bool Zandor::Draws(const Ref<clsJoinLine>& record) const {
    const String key = decimal(record->Index());
    return mJoinLines.Contains(key) && mJoinLines.Item(key) == record;
}

bool Zandor::RemoveJoin(const Ref<clsJoinLine> record) {
    bool result = false;
    Guard(u"RemoveJoin", [&] {
        const std::int16_t n = record->Index();
        mReaches.forget(n);
        linJoin.Unload(n);
        shpJoin.Unload(toInteger(2.0 * n - 1));
        shpJoin.Unload(toInteger(2.0 * n));
        mJoinLines.Remove(decimal(n));
        mReaches.remove(n);
        mJoinFreeList->FreeIndex(n);
        // Its line has gone; the next click would look for it to take the highlight back.
        if (mLastJoin == record) mLastJoin = nullptr;
        result = true;
    });
    return result;
}

void Zandor::mnuJoinDelete_Click() {
    Guard(u"mnuJoinDelete_Click", [&] {
        Ref<clsJoinLine> record;
        if (!JoinHitTest(record, mPopupX, mPopupY)) return;
        if (!HasTag(*record)) {
            // Drawn, but never taken by the model: there is nothing else to remove.
            RemoveJoin(record);
            return;
        }
        const auto model = Model();
        const auto join = ModelJoin(*record);
        if (!MayRemoveJoin(join)) return;
        require(Draws(record));
        RemoveJoin(record);
        const String key = join->Key();
        List(model, &TalvikZandorLib::Zandor::Joins).Remove(key);
        Raise(Event::JoinRemoved, {.Join = join});
    });
}

} // namespace TalvikDBxZandor
