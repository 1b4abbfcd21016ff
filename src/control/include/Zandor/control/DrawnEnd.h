#pragma once

#include <Zandor/platform/Tabulet.h>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// Where one end of a join was found when it was drawn, so that it need not be looked for at every
/// step of a move. It counts only as long as a look at the list tells the same.
struct DrawnEnd {
    std::int16_t Slot = 0;                         ///< of the table list
    std::int32_t Position = 0;                     ///< of the entry in the list, from 1
    std::int32_t Count = 0;                        ///< of the list's entries
    platform::Ref<TalvikTabulet::ColumnItem> Item; ///< the entry; nothing: not found yet
};

} // namespace TalvikDBxZandor
