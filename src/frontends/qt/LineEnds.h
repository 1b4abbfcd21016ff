#pragma once

#include <Zandor/platform/Tabulet.h>

#include <memory>

namespace zandor::platform::qt {

/// An entry that knows where it stands.
class TableEntry : public TalvikTabulet::ColumnItem {
public:
    /// nullptr once the table list has gone.
    virtual const TalvikTabulet::Tabulet* table() const = 0;
};

/// The entries that a line runs between. Lines are laid between the edges of entries: the entries
/// whose edges were asked for last are those of the line that is placed next.
struct LineEnds {
    std::weak_ptr<const TableEntry> west;
    std::weak_ptr<const TableEntry> east;
};

} // namespace zandor::platform::qt
