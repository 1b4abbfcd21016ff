#include <Zandor/Zandor.h>

#include <Zandor/control/KeyNumber.h>

#include <Zandor/platform/Numbers.h>

namespace TalvikDBxZandor {

using platform::single;

/// The definition tied to a grid column. Error 5 when the model holds none under its key.
Held<TalvikZandorLib::ZDColumnDefinition> Zandor::DefinitionOf(std::int32_t column) {
    const String key = keyOfNumber(sprColumn->ColData(column));
    return Definitions().Item(key);
}

void Zandor::SetCell(const String& text, std::int16_t alignment) const {
    sprColumn->Text(text);
    sprColumn->CellAlignment(alignment);
    if (const auto written = mHooks.CellWritten) written(sprColumn->Col());
}

void Zandor::FitColumn(std::int32_t column, const String& fieldName) {
    sprColumn->ColWidth(column, single(mToolkit->TextWidth(fieldName) + 120));
}

void Zandor::AddNewAndCriterium(const ZDColumnRef& sourceColumn, std::int32_t column) {
    Guard(u"AddNewAndCriterium", [&] {
        const auto definition = Hold(mLibrary->NewZDColumnDefinition());
        definition->Column(sourceColumn);
        definition->Visible(true);
        definition->SortOrder(0);
        definition->Synonym({});
        const std::int32_t binding = mBinding;
        const auto stored = Hold(Model()->AddColumnDefinition(definition));
        const std::int32_t number = numberOfKey(stored->Key());
        require(binding == mBinding);
        sprColumn->ColData(column, number);
    });
}

void Zandor::MakeGetValueFieldsInvisible() {
    Guard(u"MakeGetValueFieldsInvisible", [&] {
        // A copy, as the one above: what it does may end the control.
        if (const auto closing = mHooks.EditorsClosing) closing();
        HideEditors();
        if (mLastJoin && mLastJoin->JoinLineIndex() != -1)
            linJoin(mLastJoin->JoinLineIndex())->BorderWidth(1);
    });
}

void Zandor::HideEditors() {
    fraValue->Visible(false);
    fraSortOrder->Visible(false);
    fraVisibility->Visible(false);
}

void Zandor::GetTextValue(const String& cellText) {
    Guard(u"GetTextValue", [&] {
        txtValue->Text(cellText);
        OpenEditor(fraValue, cmdSetTextValue);
        txtValue->SetFocus();
    });
}

void Zandor::GetSortOrder(const String& cellText) {
    Guard(u"GetSortOrder", [&] {
        cobSortOrder->ListIndex(cellText == mWords.Ascending    ? 1
                                : cellText == mWords.Descending ? 2
                                                                : 0);
        OpenEditor(fraSortOrder, cmdSetSortOrder);
        cobSortOrder->SetFocus();
    });
}

void Zandor::GetVisibility(const String& cellText) {
    Guard(u"GetVisibility", [&] {
        cobVisibility->ListIndex(cellText == mWords.NotVisible ? 1 : 0);
        OpenEditor(fraVisibility, cmdSetVisibility);
        cobVisibility->SetFocus();
    });
}

void Zandor::OpenEditor(const Part<platform::Frame>& frame,
                        const Part<platform::CommandButton>& set) {
    PlaceEditor(frame);
    frame->Visible(true);
    frame->ZOrder();
    set->Default(true);
    if (const auto opened = mHooks.EditorOpened) opened();
}

/// Centres an editor over the current cell, inside the control but for its upper edge. The grid's
/// top is added, its left is not; nor is there a lower bound for the top.
void Zandor::PlaceEditor(const Part<platform::Frame>& frame) {
    constexpr float margin = 30;
    const float width = frame->Width();
    const float height = frame->Height();

    float left = single(sprColumn->CellLeft() + sprColumn->CellWidth() / 2 - width / 2);
    if (single(left + width) <= mToolkit->ScaleWidth()) {
        if (left < margin) left = margin;
    } else {
        left = single(mToolkit->ScaleWidth() - width - margin);
    }
    float top =
        single(sprColumn->Top() + sprColumn->CellTop() + sprColumn->CellHeight() / 2 - height / 2);
    if (single(top + height) > mToolkit->ScaleHeight())
        top = single(mToolkit->ScaleHeight() - height - margin);

    frame->setBounds({left, top, width, height});
}

} // namespace TalvikDBxZandor
