#include "comforts/filled.h"

#include <Zandor/control/symbols.h>

#include <Zandor/Zandor.h>
#include <Zandor/comforts/Spoken.h>
#include <Zandor/platform/KeyedCollection.h>

#include <array>

namespace zandor::comforts {

using platform::String;
using platform::StringView;

String spokenOfEntry(const EntryWords& words, std::optional<platform::Picture> picture,
                     bool comesOut) {
    String said;
    if (picture == platform::Picture::key) said = words.KeyColumn;
    if (comesOut) said += (said.empty() ? u"" : u", ") + words.ComesOut;
    return said;
}

String titleOfCell(const platform::Words& words, const CellText& text, std::int32_t row,
                   std::int32_t col) {
    std::int32_t titled = row;
    while (titled > 0 && text(titled, 0).empty()) --titled;
    String title = text(titled, 0);
    if (title.ends_with(u':')) title.pop_back();
    const String field = text(0, col);
    return title + u", " + (field.empty() ? filled(words.Column, {platform::decimal(col)}) : field);
}

String nameOfCell(const platform::Words& words, const CellText& text, std::int32_t row,
                  std::int32_t col) {
    const String written = text(row, col);
    const String title = titleOfCell(words, text, row, col);
    return written.empty() ? title : title + u": " + written;
}

namespace {

/// The words as they were when the model was asked, whose code may be the end of the control.
struct JoinWords {
    explicit JoinWords(const TalvikDBxZandor::Zandor& control)
        : join(control.Words().Join),
          // A normal join needs no word.
          types{u"", control.LNGJoinTypeLeftOuter, control.LNGJoinTypeRightOuter,
                control.LNGJoinTypeBothOuter} {}

    const String join;
    const std::array<String, 4> types;
};

/// Empty for a type or an operator that there is none of.
template <class Texts>
StringView textOf(std::int16_t code, const Texts& texts) {
    return code >= 0 && static_cast<std::size_t>(code) < texts.size()
               ? StringView(texts[static_cast<std::size_t>(code)])
               : StringView();
}

String fieldOf(const TalvikZandorLib::ZDTable& table, const TalvikZandorLib::ZDColumn& column) {
    return table.Name() + u'.' + column.Name();
}

String describe(const JoinWords& words, const TalvikZandorLib::ZDJoin& join) {
    const String sides =
        filled(words.join, {fieldOf(*join.LeftTable(), *join.LeftColumn()),
                            textOf(join.CompareOperator(), TalvikDBxZandor::operatorSymbols),
                            fieldOf(*join.RightTable(), *join.RightColumn())});
    const StringView type = textOf(join.JoinType(), words.types);
    return type.empty() ? sides : sides + u", " + String(type);
}

} // namespace

String nameOfJoin(TalvikDBxZandor::Zandor& control, const JoinSide& west, const JoinSide& east) {
    const JoinWords words(control);
    const auto isSide = [](const JoinSide& side,
                           const platform::Ref<TalvikZandorLib::ZDTable>& table,
                           const platform::Ref<TalvikZandorLib::ZDColumn>& column) {
        return table->Key() == side.Table && column->Key() == side.Column;
    };
    try {
        const auto model = control.P_GET_Zandor();
        for (const auto& join : platform::Each(model->Joins())) {
            const auto runs = [&](const JoinSide& left, const JoinSide& right) {
                return isSide(left, join->LeftTable(), join->LeftColumn()) &&
                       isSide(right, join->RightTable(), join->RightColumn());
            };
            if (runs(west, east) || runs(east, west)) return describe(words, *join);
        }
    } catch (...) {
        // A name is no reason for a box: what the canvas knows by itself will do.
    }
    return filled(words.join, {west.Field, u"=", east.Field});
}

} // namespace zandor::comforts
