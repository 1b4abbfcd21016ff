#include <Zandor/Zandor.h>

#include <Zandor/control/KeyNumber.h>

#include <algorithm>

namespace TalvikDBxZandor {

/// The model held; an empty one is made where none is.
Held<TalvikZandorLib::Zandor> Zandor::Model() {
    if (!mModel) {
        const Ref<TalvikZandorLib::Zandor> made = mLibrary->NewZandor();
        if (!mModel) mModel = made;
    }
    return Hold(mModel);
}

platform::Ref<TalvikZandorLib::Zandor> Zandor::P_GET_Zandor() {
    Ref<TalvikZandorLib::Zandor> result;
    Guard(report::Zandor.get, [&] { result = Model(); });
    return result;
}

void Zandor::P_SET_Zandor(const Ref<TalvikZandorLib::Zandor>& given) {
    Guard(report::Zandor.let, [this, model = given] {
        if (!model) {
            Raise(Event::Error, {.Text = u"New Zanodr is nothing!", .Number = -1});
            return;
        }
        const std::int32_t binding = ++mBinding;
        RemoveAllTables();
        require(binding == mBinding);
        // A slot whose table could not be made has nothing to be looked for in.
        for (std::int16_t i = 1; i <= lastTableSlot; ++i)
            if (!mTableFreeList->IsFree(i) && !lstTable.Find(i)) mTableFreeList->FreeIndex(i);
        TakeModel(model);
        lstTable(0)->Font(mToolkit->AmbientFont());
        sprColumn->Font(mToolkit->AmbientFont());
        SetZandor();
        require(binding == mBinding);
        OrganizeTables();
        ShowMenuEntries();
        require(binding == mBinding);
        // Last, so that a model whose keys cannot be read is bound all the same.
        TieBoundColumns();
        if (const auto bound = mHooks.Bound) bound();
    });
}

/// No grid column keeps a number that would name a stranger among the new model's definitions.
void Zandor::TakeModel(const Ref<TalvikZandorLib::Zandor>& model) {
    mModel = model;
    for (std::int32_t column = 1; column < sprColumn->Cols(); ++column)
        sprColumn->ColData(column, 0);
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
    Held<Tabulet> first;
    Held<Tabulet> selected;
    std::int32_t cascade = 0;
    const std::int32_t binding = mBinding;
    for (const auto& table : Tables()) {
        if (mTableFreeList->FreeCount() == 0) continue;
        std::int32_t slot = 0;
        if (!mTableFreeList->GetNextFreeIndex(slot)) return false;
        const auto index = static_cast<std::int16_t>(slot);
        const Held<Tabulet> element = ShowTable(index, table, cascade);
        require(binding == mBinding);
        if (!first) first = element;
        if (table->Selected() != 0) selected = element;
        require(binding == mBinding);
        if (Shows(index, element)) mActiveTableIndex = index;
    }
    require(binding == mBinding);
    if (selected)
        SetCurrentTable(selected->Text());
    else if (first)
        SetCurrentTable(first->Text());
    require(binding == mBinding);
    return true;
}

void Zandor::ShowJoins() {
    const std::int32_t binding = mBinding;
    for (const auto& join : Joins()) {
        Ref<Tabulet> leftTable, rightTable;
        Ref<ColumnItem> leftColumn, rightColumn;
        FindTable(Hold(join->LeftTable())->Name(), leftTable);
        FindColumn(leftTable, Hold(join->LeftColumn())->Name(), leftColumn);
        FindTable(Hold(join->RightTable())->Name(), rightTable);
        FindColumn(rightTable, Hold(join->RightColumn())->Name(), rightColumn);
        const std::int16_t joinType = join->JoinType();
        const std::int16_t compareOperator = join->CompareOperator();
        require(binding == mBinding);
        const auto gone = [this](const auto& table) { return table && !Shows(Hold(table)); };
        if (gone(leftTable) || gone(rightTable)) continue;
        Ref<clsJoinLine> record;
        DrawNewJoin(record, leftTable, leftColumn, rightTable, rightColumn, joinType,
                    compareOperator);
        require(binding == mBinding);
        record->Tag(join->Key());
        require(binding == mBinding);
    }
}

void Zandor::ShowDefinitions() {
    std::int32_t column = 1;
    for (const auto& definition : Definitions()) ShowDefinition(column++, definition);
}

void Zandor::ShowDefinition(std::int32_t column,
                            const Held<TalvikZandorLib::ZDColumnDefinition>& definition) {
    const std::int32_t binding = mBinding;
    const auto goTo = [&](std::int32_t row) {
        sprColumn->Col(column);
        sprColumn->Row(row);
    };
    // Whatever the host did when it was asked, the answer goes into its own cell.
    const auto answer = [&](std::int32_t row, const auto& ask) {
        goTo(row);
        auto value = ask();
        require(binding == mBinding);
        goTo(row);
        return value;
    };

    const String name = answer(0, [&] { return Hold(definition->Column())->Name(); });
    sprColumn->Text(name);
    mBoundColumns = column;
    FitColumn(column, name);
    sprColumn->CellAlignment(MSFlexGridLib::alignCenterCenter);

    SetCell(answer(1, [&] { return definition->Synonym(); }), MSFlexGridLib::alignLeftCenter);

    const std::int16_t sortOrder = answer(2, [&] { return definition->SortOrder(); });
    if (sortOrder == 1) sprColumn->Text(mWords.Ascending);
    if (sortOrder == 2) sprColumn->Text(mWords.Descending);
    sprColumn->CellAlignment(MSFlexGridLib::alignCenterCenter);

    // "Invisible" here and "Not Visible" in the editor mean the same; both texts are settled.
    const bool visible = answer(3, [&] { return definition->Visible(); });
    SetCell(visible ? mWords.Visible : mWords.Invisible, MSFlexGridLib::alignCenterCenter);

    std::int32_t row = 4;
    goTo(row);
    for (const auto& criterium : List(definition, &TalvikZandorLib::ZDColumnDefinition::Criteria)) {
        SetCell(answer(row, [&] { return criterium->Criterium(); }),
                MSFlexGridLib::alignLeftCenter);
        if (++row >= sprColumn->Rows()) break;
        goTo(row);
    }
}

/// Gives each column that the binding filled its definition's key number, so that it can be edited
/// and deleted like one dropped by the user. A key of another form leaves the column untied.
void Zandor::TieBoundColumns() {
    const std::int32_t binding = mBinding;
    for (std::int32_t column = 1; column <= mBoundColumns; ++column) {
        const String key = Definitions().Item(column)->Key();
        require(binding == mBinding);
        sprColumn->ColData(column, isKeyOfNumber(key) ? numberOfKey(key) : 0);
    }
}

bool Zandor::RemoveAllTables() {
    bool result = false;
    Guard(u"RemoveAllTables", [&] {
        // The host may show others in the slots meanwhile; those stay.
        const std::vector shown(lstTable.begin(), lstTable.end());
        for (const auto& [index, table] : shown)
            if (index != 0 && Shows(index, Hold(table))) RemoveTable(index);
        result = true;
    });
    return result;
}

void Zandor::Terminate() {
    Guard(u"Terminate", [&] {
        Trace(u"Terminate");
        const std::int32_t binding = ++mBinding;
        RemoveAllTables();
        require(binding == mBinding);
        TerminateTable(0);
        for (std::int16_t i = 1; i <= lastTableSlot; ++i)
            if (!mTableFreeList->IsFree(i)) TerminateTable(i);
        const Ref<TalvikZandorLib::Zandor> empty = mLibrary->NewZandor();
        require(binding == mBinding);
        TakeModel(empty);
    });
}

void Zandor::SetCurrentTable(const String& given) {
    Guard(u"SetCurrentTable", [this, TabName = given] {
        Trace(u"SetCurrentTable");
        Trace(u"Looking for Table: " + TabName);
        const auto found = std::find_if(lstTable.begin(), lstTable.end(), [&](const auto& element) {
            return element.second->Text() == TabName;
        });
        if (found != lstTable.end()) MakeCurrent(Hold((*found).second));
    });
}

void Zandor::MakeCurrent(const Held<Tabulet>& table) {
    const auto trace = [&](platform::StringView text) {
        Trace(text);
        require(Shows(table));
    };
    // A control that is not on the screen yet cannot take the focus, and need not.
    if (table->Visible()) quietly([&] { table->SetFocus(); });
    require(Shows(table));
    table->Activated(true);
    trace(u"Table found.");
    table->Complete();
    trace(u"Table refreshed.");
    SetSelectedTable(table->Tag());
}

void Zandor::SelectColumnNames(const String& givenTable, const String& givenColumn) {
    Guard(u"SelectColumnNames", [this, TabName = givenTable, ColName = givenColumn] {
        Trace(u"SelectColumnNames");
        const std::int32_t binding = mBinding;
        const std::vector shown(lstTable.begin(), lstTable.end());
        for (const auto& [index, element] : shown) {
            const auto held = Hold(element);
            if (Shows(index, held) && held->Text() == TabName) SelectColumn(held, ColName);
        }
        require(binding == mBinding);
        for (const auto& table : Tables()) {
            if (table->Name() != TabName) continue;
            for (const auto& column : List(table, &TalvikZandorLib::ZDTable::Columns)) {
                const bool match = column->Name() == ColName;
                column->Selected(match);
            }
        }
    });
}

void Zandor::SelectColumn(const Held<Tabulet>& table, const String& name) {
    for (std::int32_t n = 1; n <= table->ColumnItems().Count(); ++n) {
        const auto entry = Hold(table->ColumnItems().Item(n));
        if (entry->Text() != name) {
            entry->Selected(false);
            entry->Refresh();
            continue;
        }
        if (mDebugSwitch != 0)
            mLife.MsgBox(u"Column found., vbSystemModal, FUNCTION_NAME", platform::styleOkOnly,
                         String(ModuleName));
        if (!Shows(table)) return;
        entry->Selected(true);
        entry->Refresh();
        entry->EnsureVisible();
    }
}

} // namespace TalvikDBxZandor
