#pragma once

#include <Zandor/Zandor.h>
#include <Zandor/comforts/Field.h>
#include <Zandor/control/rows.h>

#include <optional>

namespace zandor::comforts {

/// The editors that stand over a cell.
enum class Editor { none, text, sortOrder, visibility };

namespace row = TalvikDBxZandor::row;

/// The way from the comforts into the control: all of its procedures that they act by, and no more.
///
/// Its members throw what the control's parts and the host's model throw, and end the procedure at
/// hand in quiet once the control has ended: `act` is a procedure of the control like any other,
/// and the rules that are written at `Life` are its rules.
class Door {
public:
    using String = platform::String;
    template <class T>
    using Ref = platform::Ref<T>;

    explicit Door(TalvikDBxZandor::Zandor& control) : mControl(&control) {}
    Door(const Door&) = delete;
    Door& operator=(const Door&) = delete;
    /// The control stays as it is; nobody listens to it any more.
    ~Door() { shut(); }

    void listen(TalvikDBxZandor::Hooks hooks) { control().mHooks = std::move(hooks); }
    void
    listenToJoins(std::function<void(const TalvikDBxZandor::PlacedJoin&, platform::Line&)> placed) {
        control().mHooks.JoinPlaced = std::move(placed);
    }
    void shut();
    bool isOpen() const { return mControl && !mControl->mLife.ended(); }

    TalvikDBxZandor::Life& life() const { return control().mLife; }

    /// Whether the grid is on the control at all.
    bool hasGrid() const { return !control().mOnlyJoin; }
    bool isReadOnly() const { return control().ReadOnly(); }
    const MSFlexGridLib::MSFlexGrid& grid() const { return *control().sprColumn; }
    Ref<TalvikZandorLib::Zandor> model() { return control().Model(); }
    /// Than at the last call.
    bool hasAnotherModel();

    // Columns of the grid
    /// The last one with a field in it; 0 when there is none.
    std::int32_t lastColumn() const;
    bool isUsed(std::int32_t column) const;
    /// The one with a key number, `first` when it has it; 0 when none has.
    std::int32_t columnWith(std::int32_t keyNumber, std::int32_t first) const;
    /// Nothing for a column that is tied to none.
    TalvikDBxZandor::Held<TalvikZandorLib::ZDColumnDefinition> definitionOf(std::int32_t column);
    /// The one tied to a definition's key; 0 when none is.
    std::int32_t columnOfKey(const String& key) const;
    /// Of all tables on the canvas, by their slots.
    std::vector<Field> fields() const;
    bool has(const Field& field) const;
    bool hasTables() const { return !tables().empty(); }
    /// Nothing where the model has dropped the table behind an element.
    Ref<TalvikZandorLib::ZDTable> tableOf(const TalvikTabulet::Tabulet& element);
    /// Whether the model keeps the order of its definitions, so that columns can be moved.
    bool keepsOrder() { return static_cast<bool>(control().Ordered()); }
    bool moveColumn(std::int32_t column, std::int32_t position) {
        return control().MoveColumn(column, position);
    }
    void setWidth(std::int32_t column, float width) {
        control().sprColumn->ColWidth(column, width);
    }
    /// As SizedDefinition has it; nothing where the column's definition keeps no width.
    std::optional<std::int32_t> storedWidth(std::int32_t column);
    /// Has the column's definition keep another width. Returns the definition when that is news to
    /// it.
    TalvikDBxZandor::Held<TalvikZandorLib::ZDColumnDefinition> storeWidth(std::int32_t column,
                                                                          std::int32_t width);
    void
    tellModified(const TalvikDBxZandor::Held<TalvikZandorLib::ZDColumnDefinition>& definition) {
        control().Raise(TalvikDBxZandor::Event::ColumnModified, {.Definition = definition});
    }
    /// Gives a column's definition another field, unless it has that already.
    void changeField(std::int32_t column, const Field& field);
    /// Marks the entries whose columns come out in the rows, or none.
    void markOutput(bool marks);
    void clearNotes();
    void note(std::int32_t row, std::int32_t column, const String& text) {
        control().sprColumn->CellNote(row, column, text);
    }
    /// Writes a text into a definition of whatever model, as the control does for a cell of a row;
    /// false when there is nothing to change or the row has no text of its own.
    bool store(const Ref<TalvikZandorLib::ZDColumnDefinition>& definition, std::int32_t row,
               const String& text) {
        if (row != row::synonym && row <= row::visible) return false;
        return control().StoreText(control().Hold(definition), row, text);
    }
    /// Makes an output column of an entry (1-based) of the table in a slot, as dropping it on a
    /// grid column does. What was copied for a later "Paste Column" stays.
    void drop(std::int16_t table, std::int32_t entry, std::int32_t column);

    // Canvas and menu
    void drawJoins() { control().DrawJoins(); }
    /// The join of a line as it is spoken; empty for a line of none.
    String nameOf(const platform::Line& line);
    /// Opens the menu as over the list of the table in a slot.
    void popUpOver(std::int16_t table);
    /// In the menu, as the last of the entries that are about tables.
    std::unique_ptr<platform::MenuEntry>
    addTableEntry(platform::StringView name, const String& caption, platform::PlainEvent click);
    String keyOfActiveTable() const;

    // Tables
    TalvikTabulet::ColumnList& entriesOf(std::int16_t table) {
        return control().lstTable(table)->ColumnItems();
    }

    // The current cell
    void goTo(std::int32_t row, std::int32_t column);
    void showCurrentCell() { control().sprColumn->EnsureVisible(); }
    void focusGrid() { control().sprColumn->SetFocus(); }

    // Editors
    Editor editor() const;
    void openEditor() { control().EditCell(); }
    /// Drops the list of the open editor down.
    void dropDown();
    /// Brings the open editor over the current cell.
    void placeEditor();
    void closeEditors() { control().MakeGetValueFieldsInvisible(); }
    /// What stands in the open editor: its text, or the number of the item chosen.
    String editorValue() const;
    /// The same of what the model holds for a cell; nothing where the column has no definition.
    std::optional<String> storedValue(std::int32_t row, std::int32_t column);
    void type(const String& text) { control().txtValue->Text(text); }
    void chooseVisibility(bool visible) { control().cobVisibility->ListIndex(visible ? 0 : 1); }
    /// Presses the "&Set" of an editor, for the current cell.
    void set(Editor editor);

private:
    TalvikDBxZandor::Held<TalvikZandorLib::SizedDefinition> sizedDefinitionOf(std::int32_t column);
    /// The elements on the canvas and their slots; held, for a host may unload them meanwhile.
    std::vector<std::pair<std::int16_t, Ref<TalvikTabulet::Tabulet>>> tables() const;

    TalvikDBxZandor::Zandor& control() const {
        TalvikDBxZandor::require(isOpen());
        return *mControl;
    }

    TalvikDBxZandor::Zandor* mControl;
    std::weak_ptr<TalvikZandorLib::Zandor> mModel; ///< the one last seen
    bool mMarked = false;                          ///< whether an entry has ever been marked
};

} // namespace zandor::comforts
