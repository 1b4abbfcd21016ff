#include <Zandor/Zandor.h>

#include "control/joins/frmJoinDefinition.h"

#include <Zandor/control/symbols.h>

#include <Zandor/platform/Numbers.h>

// How the control opens the join definition dialog.

namespace TalvikDBxZandor {

using platform::toInteger;

void Zandor::SetLanguageOfJoinDefinition(frmJoinDefinition& dialog) {
    Guard(u"SetLanguageOfJoinDefinition", [&] {
        const auto dress = [this](const auto& control, const String& caption) {
            control->Font(mToolkit->ControlFont());
            control->Caption(caption);
        };
        dress(dialog.lblLeftTable, LNGJoinLeftTable);
        dress(dialog.lblLeftColumn, LNGJoinLeftColumn);
        dress(dialog.lblRightTable, LNGJoinRightTable);
        dress(dialog.lblRightColumn, LNGJoinRightColumn);
        dress(dialog.lblJoinType, LNGJoinType);
        dress(dialog.cmdOk, LNGJoinOk);
        dress(dialog.cmdCancel, LNGJoinCancel);
    });
}

void Zandor::SetEnabledJoinTypes(frmJoinDefinition& dialog) {
    Guard(u"SetEnabledJoinTypes", [&] {
        const String* const texts[] = {&LNGJoinTypeNormal, &LNGJoinTypeLeftOuter,
                                       &LNGJoinTypeRightOuter, &LNGJoinTypeBothOuter};
        const auto& list = dialog.cboJoinType;
        list->Font(mToolkit->ControlFont());
        list->Clear();
        for (std::size_t code = 0; code < std::size(texts); ++code)
            if (mUseJoinType[code]) list->AddItem(*texts[code]);
    });
}

void Zandor::SetEnabledJoinOperators(frmJoinDefinition& dialog) {
    // Shares its report name with the list of types.
    Guard(u"SetEnabledJoinTypes", [&] {
        const auto& list = dialog.cboJoinCompareOperator;
        list->Clear();
        for (std::size_t code = 0; code < operatorSymbols.size(); ++code)
            if (mUseOperator[code]) list->AddItem(String(operatorSymbols[code]));
    });
}

void Zandor::mnuJoinShowDefinition_Click() {
    Guard(u"mnuJoinShowDefinition_Click", [&] {
        Ref<clsJoinLine> record;
        if (!JoinHitTest(record, mPopupX, mPopupY)) return;
        frmJoinDefinition dialog(mLife, *mToolkit, mDebugSwitch != 0);
        dialog.form->Caption(LNGJoinForm);
        const auto model = Model();
        const auto join = ModelJoin(*record);
        if (!mReadOnly) {
            join->CompareOperator(toInteger(record->CompareOperator()));
            join->JoinType(toInteger(record->JoinType()));
        }

        SetLanguageOfJoinDefinition(dialog);
        SetEnabledJoinTypes(dialog);
        SetEnabledJoinOperators(dialog);
        dialog.Join(join);
        dialog.JoinLine(record);
        // The name says the opposite of what the number does: 0 leaves nothing to choose.
        dialog.JoinModifyDisabled(mReadOnly ? std::int16_t{0} : mJoinModifyDisabled);
        // What it does not offer, Ok would write as another.
        if (mReadOnly) dialog.cmdOk->Enabled(false);
        dialog.form->ShowModal();
        if (!dialog.JoinIsModified()) return;

        // The record follows the model: the mark of an outer join changes at once, and the dialog
        // opens on the new values the next time. It may be another one: while the dialog stood
        // open, the host may have shown its model anew.
        const std::int16_t compareOperator = join->CompareOperator();
        const std::int16_t joinType = join->JoinType();
        require(mModel == model.pointer());
        for (const auto& drawn : platform::Each<clsJoinLine>(mJoinLines)) {
            if (drawn->Tag() != record->Tag()) continue;
            drawn->CompareOperator(compareOperator);
            drawn->JoinType(joinType);
            DrawJoin(*drawn);
        }
        Raise(Event::JoinModified, {.Join = join});
    });
}

} // namespace TalvikDBxZandor
