#include "frontends/qt/JoinName.h"

#include "frontends/qt/LineEnds.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/control/symbols.h>

#include <Zandor/Zandor.h>
#include <Zandor/platform/KeyedCollection.h>
#include <Zandor/qt/Text.h>

#include <array>

namespace zandor::platform::qt {

namespace {

QString phrase(const TalvikDBxZandor::Zandor& control, const QString& left, StringView symbol,
               const QString& right) {
    return toQt(control.Words().Join).arg(left, toQt(symbol), right);
}

QString field(const String& table, const String& column) {
    return asSigns(toQt(table) + u'.' + toQt(column));
}

/// Empty for a type or an operator that there is none of.
template <std::size_t size>
StringView textOf(std::int16_t code, const std::array<StringView, size>& texts) {
    return code >= 0 && static_cast<std::size_t>(code) < size
               ? texts[static_cast<std::size_t>(code)]
               : StringView();
}

QString describe(TalvikDBxZandor::Zandor& control, const TalvikZandorLib::ZDJoin& join) {
    // A normal join needs no word.
    const std::array<StringView, 4> types = {u"", control.LNGJoinTypeLeftOuter,
                                             control.LNGJoinTypeRightOuter,
                                             control.LNGJoinTypeBothOuter};
    const QString sides =
        phrase(control, field(join.LeftTable()->Name(), join.LeftColumn()->Name()),
               textOf(join.CompareOperator(), TalvikDBxZandor::operatorSymbols),
               field(join.RightTable()->Name(), join.RightColumn()->Name()));
    const StringView type = textOf(join.JoinType(), types);
    return type.empty() ? sides : sides + QStringLiteral(", ") + toQt(type);
}

} // namespace

QString joinName(TalvikDBxZandor::Zandor& control, const LineEnds& ends) {
    const auto west = ends.west.lock();
    const auto east = ends.east.lock();
    if (!west || !east || !west->table() || !east->table()) return {};
    const auto isSide = [](const TableEntry& entry, const Ref<TalvikZandorLib::ZDTable>& table,
                           const Ref<TalvikZandorLib::ZDColumn>& column) {
        return table->Key() == entry.table()->Tag() && column->Key() == entry.Key();
    };
    try {
        const auto model = control.P_GET_Zandor();
        for (const auto& join : Each(model->Joins())) {
            const auto runs = [&](const TableEntry& left, const TableEntry& right) {
                return isSide(left, join->LeftTable(), join->LeftColumn()) &&
                       isSide(right, join->RightTable(), join->RightColumn());
            };
            if (runs(*west, *east) || runs(*east, *west)) return describe(control, *join);
        }
    } catch (...) {
        // A name is no reason for a box: what the canvas knows by itself will do.
    }
    return phrase(control, field(west->table()->Text(), west->Text()), u"=",
                  field(east->table()->Text(), east->Text()));
}

} // namespace zandor::platform::qt
