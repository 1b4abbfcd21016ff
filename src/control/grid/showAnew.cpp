#include "control/QueryPicture.h"

#include <Zandor/Zandor.h>

#include <unordered_set>

namespace TalvikDBxZandor {

void Zandor::ShowDefinitionsAnew(const QueryPicture& picture) {
    const std::int32_t row = sprColumn->Row();
    const std::int32_t col = sprColumn->Col();
    const std::int32_t edited = sprColumn->ColData(col);
    RemoveOtherColumns(picture);
    std::int32_t column = 0;
    std::int32_t current = col;
    for (const auto& definition : picture.definitions) {
        ShowDefinitionAnew(++column, definition);
        if (edited != 0 && definition.number == edited) current = column;
    }
    if (sprColumn->Row() != row) sprColumn->Row(row);
    if (sprColumn->Col() != current) sprColumn->Col(current);
    // An editor goes with its cell, and closes when that shows something else now.
    if (sprColumn->ColData(current) != edited)
        HideEditors();
    else if (current != col)
        for (const auto* frame : {&fraValue, &fraSortOrder, &fraVisibility})
            if ((*frame)->Visible()) PlaceEditor(*frame);
}

bool Zandor::IsBlank(std::int32_t column) const {
    if (sprColumn->ColData(column) != 0) return false;
    for (std::int32_t row = 0; row < sprColumn->Rows(); ++row)
        if (!sprColumn->TextMatrix(row, column).empty()) return false;
    return true;
}

/// Removes the columns whose definitions the model has no longer, those that no number ties to
/// theirs, and all but one of a definition; the others keep their order.
void Zandor::RemoveOtherColumns(const QueryPicture& picture) {
    std::unordered_set<std::int32_t> numbers;
    for (const auto& definition : picture.definitions) numbers.insert(definition.number);
    const std::int32_t last = sprColumn->Cols() - 1;
    for (std::int32_t column = last; column >= 1; --column) {
        const std::int32_t number = sprColumn->ColData(column);
        if ((number != 0 && numbers.erase(number) != 0) || IsBlank(column)) continue;
        ClearColumn(column);
        if (column != last) sprColumn->ColPosition(column, last);
    }
}

/// Brings the column of a definition to its place, from behind or out of a blank one, and writes
/// what it does not show yet.
void Zandor::ShowDefinitionAnew(std::int32_t column, const DefinitionPicture& definition) {
    const std::int32_t last = sprColumn->Cols() - 1;
    std::int32_t from = column;
    while (from <= last &&
           (definition.number == 0 || sprColumn->ColData(from) != definition.number))
        ++from;
    if (from > last) {
        from = last;
        if (!IsBlank(last)) ClearColumn(last); // it is written anew when its turn comes
        sprColumn->ColData(last, definition.number);
    }
    if (from != column) sprColumn->ColPosition(from, column);

    std::int32_t row = -1;
    for (const String& text : definition.cells) {
        if (sprColumn->TextMatrix(++row, column) == text) continue;
        sprColumn->Row(row);
        sprColumn->Col(column);
        const bool centred = row == 0 || row == 2 || row == 3;
        SetCell(text, centred ? MSFlexGridLib::alignCenterCenter : MSFlexGridLib::alignLeftCenter);
        if (row == 0) FitColumn(column, text);
    }
}

} // namespace TalvikDBxZandor
