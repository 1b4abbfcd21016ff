#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/control/basZandor.h>
#include <Zandor/platform/export.h>

namespace TalvikDBxZandor {

/// One dragged or copied column. It holds its four objects until it ends, whatever became of the
/// table: a table list that has been unloaded, and its entries, still say their texts.
class ZANDOR_CONTROL_EXPORT clsDragColumn {
public:
    static constexpr platform::StringView ModuleName = u"TalvikDBxZandor.clsDragColumn";

    explicit clsDragColumn(platform::MessageBoxes& boxes) : mBoxes(boxes) {}
    clsDragColumn(const clsDragColumn&) = delete;
    clsDragColumn& operator=(const clsDragColumn&) = delete;
    ~clsDragColumn() { Class_Terminate(); }

    std::int16_t TableIndex() const;
    void TableIndex(std::int16_t value);
    platform::Ref<TalvikTabulet::Tabulet> Table() const;
    void Table(const platform::Ref<TalvikTabulet::Tabulet>& value);
    platform::Ref<TalvikTabulet::ColumnItem> Column() const;
    void Column(const platform::Ref<TalvikTabulet::ColumnItem>& value);
    platform::Ref<TalvikZandorLib::ZDTable> ZDTable() const;
    void ZDTable(const platform::Ref<TalvikZandorLib::ZDTable>& value);
    platform::Ref<TalvikZandorLib::ZDColumn> ZDColumn() const;
    void ZDColumn(const platform::Ref<TalvikZandorLib::ZDColumn>& value);

private:
    template <class Body>
    void Guard(platform::StringView procedure, Body&& body) const;
    void Class_Terminate();

    platform::MessageBoxes& mBoxes;
    std::int16_t mTableIndex = 0;
    platform::Ref<TalvikTabulet::Tabulet> mTable;
    platform::Ref<TalvikTabulet::ColumnItem> mColumn;
    platform::Ref<TalvikZandorLib::ZDTable> mZDTable;
    platform::Ref<TalvikZandorLib::ZDColumn> mZDColumn;
};

} // namespace TalvikDBxZandor
