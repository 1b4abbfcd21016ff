#pragma once

#include <Zandor/Zandor.h>

#include <utility>

namespace TalvikDBxZandor {

/// Opens the private procedures and members of the control to tests, under their own names and with
/// the control as first argument.
struct ZandorBackstage {
#define ZANDOR_PROCEDURE(name)                                                                     \
    template <class... Arguments>                                                                  \
    static decltype(auto) name(Zandor& control, Arguments&&... arguments) {                        \
        return control.name(std::forward<Arguments>(arguments)...);                                \
    }
#define ZANDOR_MEMBER(name)                                                                        \
    static auto& name(Zandor& control) { return control.name; }

    // clang-format off
    ZANDOR_PROCEDURE(UserControl_Initialize)
    ZANDOR_PROCEDURE(UserControl_Terminate)
    ZANDOR_PROCEDURE(ResizeControls)
    ZANDOR_PROCEDURE(SetZandor)
    ZANDOR_PROCEDURE(RemoveAllTables)
    ZANDOR_PROCEDURE(FindTable)
    ZANDOR_PROCEDURE(FindColumn)
    ZANDOR_PROCEDURE(SetSelectedTable)
    ZANDOR_PROCEDURE(ShowSelectedTable)
    ZANDOR_PROCEDURE(RemoveTable)
    ZANDOR_PROCEDURE(TerminateTable)
    ZANDOR_PROCEDURE(SetFocusBack)
    ZANDOR_PROCEDURE(lstTable_CloseClick)
    ZANDOR_PROCEDURE(lstTable_GotFocus)
    ZANDOR_PROCEDURE(OrganizeTables)
    ZANDOR_PROCEDURE(lstTable_Moving)
    ZANDOR_PROCEDURE(lstTable_Moved)
    ZANDOR_PROCEDURE(lstTable_Resized)
    ZANDOR_PROCEDURE(lstTable_Scroll)
    ZANDOR_PROCEDURE(hsbTable_Change)
    ZANDOR_PROCEDURE(vsbTable_Change)
    ZANDOR_PROCEDURE(hsbTable_GotFocus)
    ZANDOR_PROCEDURE(vsbTable_GotFocus)
    ZANDOR_PROCEDURE(cmdHome_Click)
    ZANDOR_PROCEDURE(cmdHome_GotFocus)
    ZANDOR_PROCEDURE(fraTable_MouseDown)
    ZANDOR_PROCEDURE(fraTable_MouseUp)
    ZANDOR_PROCEDURE(lstTable_ColumnMouseDown)
    ZANDOR_PROCEDURE(lstTable_ColumnMouseMove)
    ZANDOR_PROCEDURE(lstTable_SelectionChanged)
    ZANDOR_PROCEDURE(lstTable_ColumnMouseUp)
    ZANDOR_PROCEDURE(lstTable_DragOver)
    ZANDOR_PROCEDURE(lstTable_DragDrop)
    ZANDOR_PROCEDURE(GetDragColumns)
    ZANDOR_PROCEDURE(DrawJoin)
    ZANDOR_PROCEDURE(DrawJoins)
    ZANDOR_PROCEDURE(PlaceLine)
    ZANDOR_PROCEDURE(DeltaJoinLine)
    ZANDOR_PROCEDURE(JoinHitTest)
    ZANDOR_PROCEDURE(JoinAllreadyExists)
    ZANDOR_PROCEDURE(DrawNewJoin)
    ZANDOR_PROCEDURE(AddNewJoin)
    ZANDOR_PROCEDURE(RemoveJoin)
    ZANDOR_PROCEDURE(SetLanguageOfJoinDefinition)
    ZANDOR_PROCEDURE(SetEnabledJoinTypes)
    ZANDOR_PROCEDURE(SetEnabledJoinOperators)
    ZANDOR_PROCEDURE(mnuJoinDelete_Click)
    ZANDOR_PROCEDURE(mnuJoinShowDefinition_Click)
    ZANDOR_PROCEDURE(AddNewAndCriterium)
    ZANDOR_PROCEDURE(MakeGetValueFieldsInvisible)
    ZANDOR_PROCEDURE(GetTextValue)
    ZANDOR_PROCEDURE(GetSortOrder)
    ZANDOR_PROCEDURE(GetVisibility)
    ZANDOR_PROCEDURE(sprColumn_MouseDown)
    ZANDOR_PROCEDURE(sprColumn_MouseUp)
    ZANDOR_PROCEDURE(sprColumn_Scroll)
    ZANDOR_PROCEDURE(cmdSetSortOrder_Click)
    ZANDOR_PROCEDURE(cmdSetVisibility_Click)
    ZANDOR_PROCEDURE(cmdSetTextValue_Click)
    ZANDOR_PROCEDURE(cobSortOrder_KeyDown)
    ZANDOR_PROCEDURE(cobVisibility_KeyDown)
    ZANDOR_PROCEDURE(txtValue_KeyDown)
    ZANDOR_PROCEDURE(sprColumn_DragDrop)
    ZANDOR_PROCEDURE(mnuColumnDefinitionPaste_Click)
    ZANDOR_PROCEDURE(mnuColumnDefinitionDelete_Click)
    ZANDOR_PROCEDURE(mnuTableDefinitionCopy_Click)
    ZANDOR_PROCEDURE(mnuTableDefinitionDelete_Click)
    ZANDOR_PROCEDURE(mnuTableDefinitionPaste_Click)
    ZANDOR_PROCEDURE(RemoveColumn)
    ZANDOR_PROCEDURE(PopupZandorMenu)
    ZANDOR_PROCEDURE(CheckMenus)
    ZANDOR_PROCEDURE(SwitchSpecialMenusOff)
    ZANDOR_PROCEDURE(mnuZandor_Click)

    ZANDOR_MEMBER(mLife)
    ZANDOR_MEMBER(mDebugSwitch)
    ZANDOR_MEMBER(mJoinModifyDisabled)
    ZANDOR_MEMBER(mOnlyJoin)
    ZANDOR_MEMBER(mUseJoinType)
    ZANDOR_MEMBER(mUseOperator)
    ZANDOR_MEMBER(mModel)
    ZANDOR_MEMBER(mTableFreeList)
    ZANDOR_MEMBER(mJoinFreeList)
    ZANDOR_MEMBER(mJoinLines)
    ZANDOR_MEMBER(mDragColumns)
    ZANDOR_MEMBER(mDragTableIndex)
    ZANDOR_MEMBER(mActiveTableIndex)
    ZANDOR_MEMBER(mLastJoin)
    ZANDOR_MEMBER(mPopupX)
    ZANDOR_MEMBER(mPopupY)
    ZANDOR_MEMBER(mMenuPrepared)
    ZANDOR_MEMBER(fraTable)
    ZANDOR_MEMBER(linJoin)
    ZANDOR_MEMBER(shpJoin)
    ZANDOR_MEMBER(lstTable)
    ZANDOR_MEMBER(sprColumn)
    ZANDOR_MEMBER(hsbTable)
    ZANDOR_MEMBER(vsbTable)
    ZANDOR_MEMBER(cmdHome)
    ZANDOR_MEMBER(fraSortOrder)
    ZANDOR_MEMBER(fraSortOrder2)
    ZANDOR_MEMBER(cobSortOrder)
    ZANDOR_MEMBER(cmdSetSortOrder)
    ZANDOR_MEMBER(fraVisibility)
    ZANDOR_MEMBER(fraVisibility2)
    ZANDOR_MEMBER(cobVisibility)
    ZANDOR_MEMBER(cmdSetVisibility)
    ZANDOR_MEMBER(fraValue)
    ZANDOR_MEMBER(fraValue2)
    ZANDOR_MEMBER(txtValue)
    ZANDOR_MEMBER(cmdSetTextValue)
    ZANDOR_MEMBER(mnuZandor)
    ZANDOR_MEMBER(mnuJoinShowDefinition)
    ZANDOR_MEMBER(mnuJoinDelete)
    ZANDOR_MEMBER(mnuJoinSep)
    ZANDOR_MEMBER(mnuTableDefinitionCopy)
    ZANDOR_MEMBER(mnuTableDefinitionPaste)
    ZANDOR_MEMBER(mnuTableDefinitionDelete)
    ZANDOR_MEMBER(mnuTableDefinitionSep)
    ZANDOR_MEMBER(mnuColumnDefinitionPaste)
    ZANDOR_MEMBER(mnuColumnDefinitionDelete)
    // clang-format on

#undef ZANDOR_PROCEDURE
#undef ZANDOR_MEMBER

    static constexpr std::int16_t lastTableSlot = Zandor::lastTableSlot;
    static constexpr std::int16_t lastJoinSlot = Zandor::lastJoinSlot;
};

} // namespace TalvikDBxZandor
