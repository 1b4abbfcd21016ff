#include "control/Zandor.h"

#include "control/KeyNumber.h"

namespace TalvikDBxZandor {

using platform::Each;

/// The model held; an empty one is made where none is. A walk over it keeps the reference, because
/// a host asked for a table may bind another model.
platform::Ref<TalvikZandorLib::Zandor> Zandor::Model() {
    if (!mModel) mModel = mLibrary.NewZandor();
    return mModel;
}

platform::Ref<TalvikZandorLib::Zandor> Zandor::P_GET_Zandor() {
    Ref<TalvikZandorLib::Zandor> result;
    Guard(u"P_GET Zandor", [&] { result = Model(); });
    return result;
}

void Zandor::P_SET_Zandor(const Ref<TalvikZandorLib::Zandor>& model) {
    Guard(u"P_SET Zandor", [&] {
        if (!model) {
            mEvents.Raise(Event::Error, {.Text = u"New Zanodr is nothing!", .Number = -1});
            return;
        }
        RemoveAllTables();
        mModel = model;
        lstTable(0)->Font(mToolkit.AmbientFont());
        sprColumn->Font(mToolkit.AmbientFont());
        SetZandor();
        OrganizeTables();
        ShowMenuEntries();
        // Last, so that a model whose keys cannot be read is bound all the same.
        TieBoundColumns();
    });
}

void Zandor::ShowMenuEntries() {
    mnuJoinShowDefinition->Visible(LNGMnuShowJoinDefVis);
    mnuJoinDelete->Visible(LNGMnuDelJoinVis);
    mnuJoinSep->Visible(LNGMnuSep1Vis);
    mnuTableDefinitionCopy->Visible(LNGMnuCopyColVis);
    mnuTableDefinitionPaste->Visible(LNGMnuCreateJoinVis);
    mnuTableDefinitionDelete->Visible(LNGMnuDelTableVis);
    mnuTableDefinitionSep->Visible(LNGMnuSep2Vis);
    mnuColumnDefinitionPaste->Visible(LNGMnuPasteColVis);
    mnuColumnDefinitionDelete->Visible(LNGMnuDelColVis);
}

void Zandor::SetZandor() {
    mBoundColumns = 0;
    Guard(u"SetZandor", [&] {
        Trace(u"SetZandor");
        if (!ShowTables()) return;
        ShowJoins();
        ShowDefinitions();
    });
}

/// False when no slot could be had although one was counted free.
bool Zandor::ShowTables() {
    Ref<Tabulet> first;
    Ref<Tabulet> selected;
    std::int32_t cascade = 0;
    for (const auto model = Model(); const auto& table : Each(model->Tables())) {
        if (mTableFreeList->FreeCount() == 0) continue;
        std::int32_t slot = 0;
        if (!mTableFreeList->GetNextFreeIndex(slot)) return false;
        const auto index = static_cast<std::int16_t>(slot);
        ShowTable(index, *table, cascade);
        if (!first) first = lstTable(index);
        if (table->Selected() != 0) selected = lstTable(index);
        mActiveTableIndex = index;
    }
    if (selected)
        SetCurrentTable(selected->Text());
    else if (first)
        SetCurrentTable(first->Text());
    return true;
}

void Zandor::ShowJoins() {
    for (const auto model = Model(); const auto& join : Each(model->Joins())) {
        Ref<Tabulet> leftTable, rightTable;
        Ref<ColumnItem> leftColumn, rightColumn;
        FindTable(join->LeftTable()->Name(), leftTable);
        FindColumn(leftTable, join->LeftColumn()->Name(), leftColumn);
        FindTable(join->RightTable()->Name(), rightTable);
        FindColumn(rightTable, join->RightColumn()->Name(), rightColumn);
        Ref<clsJoinLine> record;
        DrawNewJoin(record, leftTable, leftColumn, rightTable, rightColumn, join->JoinType(),
                    join->CompareOperator());
        record->Tag(join->Key());
    }
}

void Zandor::ShowDefinitions() {
    std::int32_t column = 1;
    for (const auto model = Model(); const auto& definition : Each(model->ColumnDefinitions()))
        ShowDefinition(column++, *definition);
}

void Zandor::ShowDefinition(std::int32_t column, TalvikZandorLib::ZDColumnDefinition& definition) {
    sprColumn->Col(column);
    sprColumn->Row(0);
    const String name = definition.Column()->Name();
    sprColumn->Text(name);
    mBoundColumns = column;
    FitColumn(column, name);
    sprColumn->CellAlignment(MSFlexGridLib::alignCenterCenter);

    sprColumn->Row(1);
    SetCell(definition.Synonym(), MSFlexGridLib::alignLeftCenter);

    sprColumn->Row(2);
    const std::int16_t sortOrder = definition.SortOrder();
    if (sortOrder == 1) sprColumn->Text(u"Ascending");
    if (sortOrder == 2) sprColumn->Text(u"Descending");
    sprColumn->CellAlignment(MSFlexGridLib::alignCenterCenter);

    // "Invisible" here and "Not Visible" in the editor mean the same; both texts are settled.
    sprColumn->Row(3);
    SetCell(definition.Visible() ? u"Visible" : u"Invisible", MSFlexGridLib::alignCenterCenter);

    std::int32_t row = 4;
    sprColumn->Row(row);
    for (const auto& criterium : Each(definition.Criteria())) {
        SetCell(criterium->Criterium(), MSFlexGridLib::alignLeftCenter);
        if (++row >= sprColumn->Rows()) break;
        sprColumn->Row(row);
    }
}

/// Gives each column that the binding filled its definition's key number, so that it can be edited
/// and deleted like one dropped by the user. A key of another form leaves the column untied.
void Zandor::TieBoundColumns() {
    for (std::int32_t column = 1; column <= mBoundColumns; ++column) {
        const String key = Model()->ColumnDefinitions().Item(column)->Key();
        sprColumn->ColData(column, isKeyOfNumber(key) ? numberOfKey(key) : 0);
    }
}

bool Zandor::RemoveAllTables() {
    bool result = false;
    Guard(u"RemoveAllTables", [&] {
        std::vector<std::int16_t> shown;
        for (const auto& [index, table] : lstTable)
            if (index != 0) shown.push_back(index);
        for (const std::int16_t index : shown) RemoveTable(index);
        result = true;
    });
    return result;
}

void Zandor::Terminate() {
    Guard(u"Terminate", [&] {
        Trace(u"Terminate");
        RemoveAllTables();
        TerminateTable(0);
        for (std::int16_t i = 1; i <= lastTableSlot; ++i)
            if (!mTableFreeList->IsFree(i)) TerminateTable(i);
        mModel = mLibrary.NewZandor();
    });
}

void Zandor::SetCurrentTable(const String& TabName) {
    Guard(u"SetCurrentTable", [&] {
        Trace(u"SetCurrentTable");
        Trace(u"Looking for Table: " + TabName);
        for (const auto& [index, table] : lstTable) {
            if (table->Text() != TabName) continue;
            MakeCurrent(*Ref<Tabulet>(table));
            break;
        }
    });
}

void Zandor::MakeCurrent(Tabulet& table) {
    if (table.Visible()) {
        try {
            table.SetFocus();
        } catch (...) {
            // A control that is not on the screen yet cannot take the focus, and need not.
        }
    }
    table.Activated(true);
    Trace(u"Table found.");
    table.Complete();
    Trace(u"Table refreshed.");
    SetSelectedTable(table.Tag());
}

void Zandor::SelectColumnNames(const String& TabName, const String& ColName) {
    Guard(u"SelectColumnNames", [&] {
        Trace(u"SelectColumnNames");
        for (const auto& [index, table] : lstTable) {
            if (table->Text() != TabName) continue;
            auto& entries = table->ColumnItems();
            for (std::int32_t n = 1; n <= entries.Count(); ++n) {
                const auto& entry = entries.Item(n);
                if (entry->Text() != ColName) {
                    entry->Selected(false);
                    entry->Refresh();
                    continue;
                }
                if (mDebugSwitch != 0)
                    mToolkit.MsgBox(u"Column found., vbSystemModal, FUNCTION_NAME",
                                    platform::styleOkOnly, String(ModuleName));
                entry->Selected(true);
                entry->Refresh();
                entry->EnsureVisible();
            }
        }
        for (const auto model = Model(); const auto& table : Each(model->Tables())) {
            if (table->Name() != TabName) continue;
            for (const auto& column : Each(table->Columns()))
                column->Selected(column->Name() == ColName);
        }
    });
}

} // namespace TalvikDBxZandor
