#include <Zandor/Zandor.h>

namespace TalvikDBxZandor {

using TalvikZandorLib::ZDColumnDefinition;

namespace {

constexpr std::int32_t synonymRow = 1;
constexpr std::int32_t sortRow = 2;
constexpr std::int32_t visibleRow = 3;
constexpr std::int32_t firstCriteriaRow = 4;

} // namespace

void Zandor::sprColumn_MouseDown(std::int16_t Button, std::int16_t, float X, float Y) {
    Guard(u"sprColumn_MouseDown", [&] {
        MakeGetValueFieldsInvisible();
        if (Button != platform::leftButton) return;
        std::int32_t column = 0;
        std::int32_t row = 0;
        basZandor::SpreadHitTest(mLife, column, row, *sprColumn, X, Y);
        if (column == 0 || row == 0) return;
        sprColumn->Row(row);
        sprColumn->Col(column);
        EditCell();
    });
}

/// Opens the editor of the current cell.
void Zandor::EditCell() {
    const std::int32_t row = sprColumn->Row();
    const String text = sprColumn->Text();
    if (row == sortRow)
        GetSortOrder(text);
    else if (row == visibleRow)
        GetVisibility(text);
    else
        GetTextValue(text);
}

void Zandor::sprColumn_MouseUp(std::int16_t Button, std::int16_t, float X, float Y) {
    Guard(u"sprColumn_MouseUp", [&] {
        if (Button == platform::rightButton) PopupZandorMenu(2, X, Y);
    });
}

void Zandor::sprColumn_Scroll() {
    Guard(u"sprColumn_Scroll", [&] { MakeGetValueFieldsInvisible(); });
}

/// The cell that an editor was opened over, for what is written into it after the host has been
/// told: a host that shows its model anew then makes another cell the current one.
class Zandor::EditedCell {
public:
    explicit EditedCell(const Zandor& control)
        : mControl(control), mRow(control.sprColumn->Row()), mColumn(control.sprColumn->Col()),
          mNumber(control.sprColumn->ColData(mColumn)), mModel(control.mModel) {}

    std::int32_t row() const { return mRow; }
    std::int32_t column() const { return mColumn; }

    /// Writes nothing where the column has become another definition's.
    void set(const String& text, std::int16_t alignment) const {
        const auto& grid = mControl.sprColumn;
        if (mControl.mModel != mModel || grid->ColData(mColumn) != mNumber) return;
        grid->Col(mColumn);
        grid->Row(mRow);
        mControl.SetCell(text, alignment);
    }

private:
    const Zandor& mControl;
    const std::int32_t mRow;
    const std::int32_t mColumn;
    const std::int32_t mNumber;
    const Ref<TalvikZandorLib::Zandor> mModel;
};

void Zandor::cmdSetSortOrder_Click() {
    Guard(u"cmdSetSortOrder_Click", [&] {
        if (Definitions().Count() != 0) {
            const EditedCell cell(*this);
            const auto definition = DefinitionOf(cell.column());
            definition->SortOrder(cobSortOrder->ListIndex());
            Raise(Event::ColumnModified, {.Definition = definition});
            cell.set(cobSortOrder->Text(), MSFlexGridLib::alignCenterCenter);
        }
        fraSortOrder->Visible(false);
    });
}

void Zandor::cmdSetVisibility_Click() {
    Guard(u"cmdSetVisibility_Click", [&] {
        if (Definitions().Count() != 0) {
            const EditedCell cell(*this);
            const auto definition = DefinitionOf(cell.column());
            definition->Visible(cobVisibility->ListIndex() == 0);
            Raise(Event::ColumnModified, {.Definition = definition});
            cell.set(cobVisibility->Text(), MSFlexGridLib::alignCenterCenter);
        }
        fraVisibility->Visible(false);
    });
}

void Zandor::cmdSetTextValue_Click() {
    Guard(u"cmdSetTextValue_Click", [&] {
        if (Definitions().Count() != 0) {
            const EditedCell cell(*this);
            const auto definition = DefinitionOf(cell.column());
            const String text = txtValue->Text();
            // A drop under an open editor makes the new column's field current: nothing to write.
            if (cell.row() == synonymRow || cell.row() >= firstCriteriaRow) {
                if (StoreText(definition, cell.row(), text))
                    Raise(Event::ColumnModified, {.Definition = definition});
                cell.set(text, MSFlexGridLib::alignLeftCenter);
            }
        }
        fraValue->Visible(false);
    });
}

/// Writes the text of a synonym or criteria row. False when there was nothing to change.
bool Zandor::StoreText(const Held<ZDColumnDefinition>& definition, std::int32_t row,
                       const String& text) {
    if (row == synonymRow) {
        definition->Synonym(text);
        return true;
    }
    const String key = platform::decimal(row);
    if (!definition->HasCriterium(key)) {
        if (text.empty()) return false;
        definition->AddCriterium(text, key);
        return true;
    }
    const auto criteria = List(definition, &ZDColumnDefinition::Criteria);
    if (text.empty())
        criteria.Remove(key);
    else
        criteria.Item(key)->Criterium(text);
    return true;
}

void Zandor::cobSortOrder_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"cobSortOrder_KeyDown", [&] {
        if (KeyCode != platform::keyEscape) return;
        cobSortOrder->ListIndex(0);
        fraSortOrder->Visible(false);
    });
}

void Zandor::cobVisibility_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"cobVisibility_KeyDown", [&] {
        if (KeyCode != platform::keyEscape) return;
        cobVisibility->ListIndex(0);
        fraVisibility->Visible(false);
    });
}

void Zandor::txtValue_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"txtValue_KeyDown", [&] {
        if (KeyCode != platform::keyEscape) return;
        txtValue->Text({});
        fraValue->Visible(false);
    });
}

} // namespace TalvikDBxZandor
