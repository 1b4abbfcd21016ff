#include "frontends/qt/JoinName.h"

#include "frontends/qt/LineEnds.h"
#include "frontends/qt/ShownText.h"

#include <Zandor/comforts/Spoken.h>
#include <Zandor/qt/Text.h>

namespace zandor::platform::qt {

namespace {

comforts::JoinSide sideOf(const TableEntry& entry) {
    const TalvikTabulet::Tabulet& table = *entry.table();
    return {table.Tag(), entry.Key(), table.Text() + u'.' + entry.Text()};
}

} // namespace

QString joinName(TalvikDBxZandor::Zandor& control, const LineEnds& ends) {
    const auto west = ends.west.lock();
    const auto east = ends.east.lock();
    if (!west || !east || !west->table() || !east->table()) return {};
    return asSigns(toQt(comforts::nameOfJoin(control, sideOf(*west), sideOf(*east))));
}

} // namespace zandor::platform::qt
