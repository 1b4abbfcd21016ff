#include <Zandor/Zandor.h>

#include <Zandor/control/rows.h>

namespace TalvikDBxZandor {

using TalvikZandorLib::ZDColumnDefinition;

namespace {

/// Escape takes an editor's input back and the editor away.
template <class TakeBack>
void discard(std::int16_t keyCode, const Part<platform::Frame>& frame, TakeBack takeBack) {
    if (keyCode != platform::keyEscape) return;
    takeBack();
    frame->Visible(false);
}

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
    if (mReadOnly) return;
    const std::int32_t row = sprColumn->Row();
    const String text = sprColumn->Text();
    if (row == row::sort)
        GetSortOrder(text);
    else if (row == row::visible)
        GetVisibility(text);
    else
        GetTextValue(text);
}

void Zandor::sprColumn_MouseUp(std::int16_t Button, std::int16_t, float X, float Y) {
    Guard(u"sprColumn_MouseUp", [&] {
        if (Button == platform::rightButton) PopupZandorMenu(menuSource::grid, X, Y);
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

    /// What a list has chosen goes to the definition of the current cell and into the cell.
    template <class Store>
    static void choose(Zandor& control, const Part<platform::ComboBox>& list,
                       const Part<platform::Frame>& frame, Store store) {
        if (control.Definitions().Count() != 0) {
            const EditedCell cell(control);
            const auto definition = control.DefinitionOf(cell.column());
            store(definition);
            control.Raise(Event::ColumnModified, {.Definition = definition});
            cell.set(list->Text(), MSFlexGridLib::alignCenterCenter);
        }
        frame->Visible(false);
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
        EditedCell::choose(*this, cobSortOrder, fraSortOrder, [&](const auto& definition) {
            definition->SortOrder(cobSortOrder->ListIndex());
        });
    });
}

void Zandor::cmdSetVisibility_Click() {
    Guard(u"cmdSetVisibility_Click", [&] {
        EditedCell::choose(*this, cobVisibility, fraVisibility, [&](const auto& definition) {
            definition->Visible(cobVisibility->ListIndex() == 0);
        });
    });
}

void Zandor::cmdSetTextValue_Click() {
    Guard(u"cmdSetTextValue_Click", [&] {
        if (Definitions().Count() != 0) {
            const EditedCell cell(*this);
            const auto definition = DefinitionOf(cell.column());
            const String text = txtValue->Text();
            // A drop under an open editor makes the new column's field current: nothing to write.
            if (cell.row() == row::synonym || cell.row() >= row::firstCriteria) {
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
    if (row == row::synonym) {
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
    Guard(u"cobSortOrder_KeyDown",
          [&] { discard(KeyCode, fraSortOrder, [&] { cobSortOrder->ListIndex(0); }); });
}

void Zandor::cobVisibility_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"cobVisibility_KeyDown",
          [&] { discard(KeyCode, fraVisibility, [&] { cobVisibility->ListIndex(0); }); });
}

void Zandor::txtValue_KeyDown(std::int16_t KeyCode, std::int16_t) {
    Guard(u"txtValue_KeyDown", [&] { discard(KeyCode, fraValue, [&] { txtValue->Text({}); }); });
}

} // namespace TalvikDBxZandor
