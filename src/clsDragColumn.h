#pragma once

#include "basZandor.h"
#include "platform/TalvikZandorLib.h"

namespace TalvikDBxZandor {

/// One dragged or copied column. The model objects are held; the table list and its entry are only
/// referred to, so that a record never keeps the element of a removed table alive: asking for one
/// that has gone is reported as error 340 and yields nothing.
class clsDragColumn {
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
    /// A reference to a part of a control array's element.
    template <class T>
    struct Loose {
        std::weak_ptr<T> target;
        bool set = false;
    };

    template <class Body>
    void Guard(platform::StringView procedure, Body&& body) const;
    template <class T>
    platform::Ref<T> Follow(const Loose<T>& reference) const;
    void Class_Terminate();

    platform::MessageBoxes& mBoxes;
    std::int16_t mTableIndex = 0;
    Loose<TalvikTabulet::Tabulet> mTable;
    Loose<TalvikTabulet::ColumnItem> mColumn;
    platform::Ref<TalvikZandorLib::ZDTable> mZDTable;
    platform::Ref<TalvikZandorLib::ZDColumn> mZDColumn;
};

} // namespace TalvikDBxZandor
