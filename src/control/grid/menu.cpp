#include <Zandor/Zandor.h>

#include <Zandor/control/rows.h>

namespace TalvikDBxZandor {

void Zandor::PopupZandorMenu(std::int16_t source, float X, float Y) {
    Guard(u"PopupZandorMenu", [&] {
        Raise(Event::Activate);
        CheckMenus(source, X, Y);
        const std::int32_t binding = mBinding;
        OfferHostEntries(source, X, Y);
        require(binding == mBinding);
        // Window frameworks that watch the control's window learn that a menu is open.
        const std::uint32_t message = mToolkit->RegisterWindowMessage(u"TALVIKDISABLEVELT");
        std::int32_t scratch = 0;
        if (message > 0) mToolkit->SendMessage(message, 0, &scratch);
        mnuZandor->PopupMenuAtMouse();
        if (message > 0) mToolkit->SendMessage(message, 1, &scratch);
    });
}

void Zandor::CheckMenus(std::int16_t source, float X, float Y) {
    Guard(u"CheckMenus", [&] {
        mPopupX = X;
        mPopupY = Y;
        mMenuPrepared = true;
        MakeGetValueFieldsInvisible();
        SwitchSpecialMenusOff();

        if (source == menuSource::table) {
            mnuTableDefinitionCopy->Enabled(true);
            mnuTableDefinitionPaste->Enabled(false);
            if (!mDragColumns.empty()) {
                const String active = lstTable(mActiveTableIndex)->Tag();
                if (active != Hold(mDragColumns.front()->Table())->Tag())
                    mnuTableDefinitionPaste->Enabled(true);
            }
            mnuTableDefinitionDelete->Enabled(true);
        } else if (source == menuSource::canvas) {
            Ref<clsJoinLine> hit;
            if (JoinHitTest(hit, X, Y)) {
                mnuJoinShowDefinition->Enabled(true);
                mnuJoinDelete->Enabled(true);
            }
        } else if (source == menuSource::grid) {
            mnuColumnDefinitionPaste->Enabled(!mDragColumns.empty());
            std::int32_t column = 0;
            std::int32_t row = 0;
            basZandor::SpreadHitTest(mLife, column, row, *sprColumn, mPopupX, mPopupY);
            if (column >= 1 && !sprColumn->TextMatrix(row::field, column).empty())
                mnuColumnDefinitionDelete->Enabled(true);
        }
        if (mReadOnly)
            for (const auto* change :
                 {&mnuTableDefinitionPaste, &mnuTableDefinitionDelete, &mnuJoinDelete,
                  &mnuColumnDefinitionPaste, &mnuColumnDefinitionDelete})
                (*change)->Enabled(false);
        if (const auto checked = mHooks.MenuChecked) checked(source);
    });
}

void Zandor::SwitchSpecialMenusOff() {
    Guard(u"SwitchSpecialMenusOff", [&] {
        mnuColumnDefinitionDelete->Enabled(false);
        mnuColumnDefinitionPaste->Enabled(false);
        mnuJoinDelete->Enabled(false);
        mnuJoinShowDefinition->Enabled(false);
        mnuTableDefinitionCopy->Enabled(false);
        mnuTableDefinitionDelete->Enabled(false);
        mnuTableDefinitionPaste->Enabled(false);
    });
}

void Zandor::mnuZandor_Click() {
    Guard(u"mnuZandor_Click", [&] {
        if (!mMenuPrepared) SwitchSpecialMenusOff();
        mMenuPrepared = false;
        mnuJoinShowDefinition->Caption(LNGMnuShowJoinDef);
        mnuJoinDelete->Caption(LNGMnuDelJoin);
        mnuTableDefinitionCopy->Caption(LNGMnuCopyCol);
        mnuTableDefinitionPaste->Caption(LNGMnuCreateJoin);
        mnuTableDefinitionDelete->Caption(LNGMnuDelTable);
        mnuColumnDefinitionPaste->Caption(LNGMnuPasteCol);
        mnuColumnDefinitionDelete->Caption(LNGMnuDelCol);
    });
}

} // namespace TalvikDBxZandor
