#include <Zandor/control/clsDragColumn.h>

namespace TalvikDBxZandor {

using platform::Ref;

template <class Body>
void clsDragColumn::Guard(platform::StringView procedure, Body&& body) const {
    basZandor::Guard(mBoxes, ModuleName, procedure, std::forward<Body>(body));
}

std::int16_t clsDragColumn::TableIndex() const {
    std::int16_t result = 0;
    Guard(u"P_GET TableIndex", [&] { result = mTableIndex; });
    return result;
}

void clsDragColumn::TableIndex(std::int16_t value) {
    Guard(u"P_LET TableIndex", [&] { mTableIndex = value; });
}

Ref<TalvikTabulet::Tabulet> clsDragColumn::Table() const {
    Ref<TalvikTabulet::Tabulet> result;
    Guard(u"P_GET Table", [&] { result = mTable; });
    return result;
}

void clsDragColumn::Table(const Ref<TalvikTabulet::Tabulet>& value) {
    Guard(u"P_SET Table", [&] { mTable = value; });
}

Ref<TalvikTabulet::ColumnItem> clsDragColumn::Column() const {
    Ref<TalvikTabulet::ColumnItem> result;
    Guard(u"P_GET Column", [&] { result = mColumn; });
    return result;
}

void clsDragColumn::Column(const Ref<TalvikTabulet::ColumnItem>& value) {
    Guard(u"P_SET Column", [&] { mColumn = value; });
}

Ref<TalvikZandorLib::ZDTable> clsDragColumn::ZDTable() const {
    Ref<TalvikZandorLib::ZDTable> result;
    Guard(u"P_GET ZDTable", [&] { result = mZDTable; });
    return result;
}

void clsDragColumn::ZDTable(const Ref<TalvikZandorLib::ZDTable>& value) {
    Guard(u"P_SET ZDTable", [&] { mZDTable = value; });
}

Ref<TalvikZandorLib::ZDColumn> clsDragColumn::ZDColumn() const {
    Ref<TalvikZandorLib::ZDColumn> result;
    Guard(u"P_GET ZDColumn", [&] { result = mZDColumn; });
    return result;
}

void clsDragColumn::ZDColumn(const Ref<TalvikZandorLib::ZDColumn>& value) {
    Guard(u"P_SET ZDColumn", [&] { mZDColumn = value; });
}

void clsDragColumn::Class_Terminate() {
    Guard(u"Class_Terminate", [&] {
        mTable = nullptr;
        mColumn = nullptr;
        mZDTable = nullptr;
        mZDColumn = nullptr;
    });
}

} // namespace TalvikDBxZandor
