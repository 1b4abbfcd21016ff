#include "comforts/Door.h"

#include <Zandor/comforts/Comforts.h>

#include <algorithm>

// What is typed and chosen in the cells' editors.

namespace zandor::comforts {

namespace {

constexpr std::int16_t keyTab = 9;
constexpr std::int16_t keyEnter = 13;
constexpr std::int16_t keyLeft = 37;
constexpr std::int16_t keyUp = 38;
constexpr std::int16_t keyRight = 39;
constexpr std::int16_t keyDown = 40;
constexpr std::int16_t shiftHeld = 1;

} // namespace

void Comforts::editorOpened(Door& door) {
    mTyping.reset();
    if (!mFlags.KeepsTyping) return;
    Typing typing;
    typing.model = door.model();
    typing.row = door.grid().Row();
    typing.column = door.grid().Col();
    typing.keyNumber = door.grid().ColData(typing.column);
    // A bound column that is not shown reads "Invisible", which the control's list does not have.
    if (door.editor() == Editor::visibility)
        if (const auto definition = door.definitionOf(typing.column))
            door.chooseVisibility(definition->Visible());
    typing.value = door.editorValue();
    mTyping = std::move(typing);
    if (door.editor() != Editor::text) door.dropDown();
}

/// Whoever has the editors closed: what is in the open one goes into the cell that it was opened
/// over, if that is still there, and if it is not there already.
void Comforts::editorsClosing(Door& door) {
    const auto typing = std::exchange(mTyping, std::nullopt);
    const Editor editor = door.editor();
    if (!typing || editor == Editor::none || door.model() != typing->model) return;
    const std::int32_t column = door.columnWith(typing->keyNumber, typing->column);
    if (column == 0) return;
    const String value = door.editorValue();
    const auto stored = door.storedValue(typing->row, column);
    // A column without a definition has no place for it, and the control would only report that.
    if (!stored || value == typing->value || value == *stored) return;
    // By now the user may have gone to another cell, which is to stay the current one.
    const std::int32_t row = door.grid().Row();
    const std::int32_t col = door.grid().Col();
    door.goTo(typing->row, column);
    door.set(editor);
    if (door.isOpen()) door.goTo(row, col);
}

/// An open editor goes where its cell has gone.
void Comforts::placeEditor(Door& door) {
    if (!mTyping || door.model() != mTyping->model) return;
    const auto& grid = door.grid();
    if (grid.Row() == mTyping->row && grid.ColData(grid.Col()) == mTyping->keyNumber)
        door.placeEditor();
}

void Comforts::laidOut(Door& door) {
    placeEditor(door);
    if (mFields && mFields->IsOpen()) mFields->Close();
}

void Comforts::takeOver() {
    if (!mTyping) return;
    act(u"takeOver", [](Door& door) {
        if (door.editor() != Editor::none) door.closeEditors();
        return true;
    });
}

bool Comforts::writeTyping(const platform::Ref<TalvikZandorLib::Zandor>& copy) {
    if (!mTyping) return false;
    return act(u"writeTyping", [&](Door& door) {
        if (door.editor() != Editor::text || door.model() != mTyping->model) return false;
        const String text = door.editorValue();
        const std::int32_t column = door.columnWith(mTyping->keyNumber, mTyping->column);
        if (text == mTyping->value || column == 0) return false;
        const auto definition = door.definitionOf(column);
        if (!definition) return false;
        return door.store(copy->ColumnDefinitions().Item(definition->Key()), mTyping->row, text);
    });
}

bool Comforts::cellTyped(const String& text) {
    return act(u"cellTyped", [&](Door& door) {
        const std::int32_t row = door.grid().Row();
        const std::int32_t column = door.grid().Col();
        if (!door.hasGrid() || column == 0 || door.isReadOnly()) return false;
        if (mFlags.OffersFields && row == row::field) return offerFields(door, column, text);
        if (mFlags.OffersFields && !door.isUsed(column)) return true;
        if (!mFlags.KeepsTyping || row == row::field || !door.isUsed(column)) return false;
        if (text.empty() && (row == row::sort || row == row::visible)) return true;
        if (row == row::visible && text == u" ") {
            const auto definition = door.definitionOf(column);
            if (!definition) return false;
            door.chooseVisibility(!definition->Visible());
            door.set(Editor::visibility);
            return true;
        }
        door.showCurrentCell();
        door.openEditor();
        if (door.isOpen() && door.editor() == Editor::text && !text.empty()) door.type(text);
        return true;
    });
}

bool Comforts::editorKey(std::int16_t keyCode, std::int16_t shift, bool atStart, bool atEnd) {
    if (!mTyping) return false;
    return act(u"editorKey", [&](Door& door) {
        const bool inText = door.editor() == Editor::text;
        if (door.editor() == Editor::none) return false;
        // What the control does then is to discard; nothing is left to be taken over.
        if (keyCode == platform::keyEscape) return mTyping.reset(), false;
        if (keyCode == keyTab && (shift & ~shiftHeld) == 0)
            return goOn(door, 0, shift == shiftHeld ? -1 : 1, true);
        if (shift != 0) return false;
        if (keyCode == keyEnter) return goOn(door, 1, 0, false);
        if (keyCode == keyLeft && atStart) return goOn(door, 0, -1, false);
        if (keyCode == keyRight && atEnd) return goOn(door, 0, 1, false);
        // In a list these two walk its items.
        if (keyCode == keyUp && inText) return goOn(door, -1, 0, false);
        if (keyCode == keyDown && inText) return goOn(door, 1, 0, false);
        return false;
    });
}

/// Closes the editor, which takes over what is in it, and goes to a neighbour of its cell.
bool Comforts::goOn(Door& door, std::int32_t rows, std::int32_t columns, bool edits) {
    const auto& grid = door.grid();
    const std::int32_t row = std::clamp(grid.Row() + rows, 1, grid.Rows() - 1);
    const std::int32_t column = std::clamp(grid.Col() + columns, 1, grid.Cols() - 1);
    const bool stays = row == grid.Row() && column == grid.Col();
    door.closeEditors();
    if (!door.isOpen()) return true;
    door.goTo(row, column);
    door.showCurrentCell();
    if (door.isOpen()) door.focusGrid();
    if (door.isOpen() && edits && !stays && door.isUsed(column)) door.openEditor();
    return true;
}

bool Comforts::choiceMade() {
    if (!mTyping) return false;
    return act(u"choiceMade", [](Door& door) { return goOn(door, 0, 0, false); });
}

} // namespace zandor::comforts
