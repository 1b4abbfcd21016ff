#include <Zandor/Zandor.h>

#include <initializer_list>
#include <utility>

// What the control says in cells and editors.

namespace TalvikDBxZandor {

using platform::String;

namespace {

constexpr std::int32_t sortRow = 2;
constexpr std::int32_t visibleRow = 3;

/// The item chosen stays so, in its new words.
void refill(const Part<platform::ComboBox>& box, std::initializer_list<String> items) {
    const std::int16_t chosen = box->ListIndex();
    box->Clear();
    for (const String& item : items) box->AddItem(item);
    box->ListIndex(chosen);
}

} // namespace

void Zandor::Words(const platform::Words& words) {
    Guard(u"Words", [&, given = words] {
        if (given == mWords) return;
        const platform::Words before = std::exchange(mWords, given);
        refill(cobSortOrder, {mWords.None, mWords.Ascending, mWords.Descending});
        refill(cobVisibility, {mWords.Visible, mWords.NotVisible});
        for (const auto* set : {&cmdSetSortOrder, &cmdSetVisibility, &cmdSetTextValue})
            (*set)->Caption(mWords.Set);
        using Word = platform::String platform::Words::*;
        const auto reword = [&](std::int32_t row, std::int32_t column,
                                std::initializer_list<Word> list) {
            const String text = sprColumn->TextMatrix(row, column);
            for (const Word word : list)
                if (text == before.*word && text != mWords.*word) {
                    sprColumn->TextMatrix(row, column, mWords.*word);
                    return true;
                }
            return false;
        };
        using platform::Words;
        for (std::int32_t column = 1; column < sprColumn->Cols(); ++column) {
            const bool sort =
                reword(sortRow, column, {&Words::None, &Words::Ascending, &Words::Descending});
            const bool visible = reword(visibleRow, column,
                                        {&Words::Visible, &Words::NotVisible, &Words::Invisible});
            const auto written = mHooks.CellWritten;
            if ((sort || visible) && written) written(column);
        }
        // An open editor may need another width for them.
        for (const auto* frame : {&fraValue, &fraSortOrder, &fraVisibility})
            if ((*frame)->Visible()) PlaceEditor(*frame);
    });
}

} // namespace TalvikDBxZandor
