#pragma once

#include <Zandor/TalvikZandorLib.h>
#include <Zandor/platform/export.h>

namespace TalvikDBxZandor {

namespace platform = zandor::platform;

/// The ten events of the control under the numbers that the raising code uses.
enum class Event : std::int16_t {
    TableDeleted = -120,
    TableMoved = -121,
    Activate = -122,
    ColumnCreated = -123,
    ColumnModified = -124,
    ColumnRemoved = -125,
    Error = -126,
    JoinCreated = -127,
    JoinModified = -128,
    JoinRemoved = -129,
};

/// What an event carries; only the members that its kind names are filled.
struct EventArguments {
    platform::Ref<TalvikZandorLib::ZDColumnDefinition> Definition{}; ///< the Column... events
    platform::Ref<TalvikZandorLib::ZDJoin> Join{};                   ///< the Join... events
    platform::String Text{};                                         ///< Error
    std::int32_t Number = 0;                                         ///< Error
};

/// The host's end of the events.
class ZANDOR_CONTROL_EXPORT ZandorEvents {
public:
    virtual ~ZandorEvents() = default;
    virtual void Raise(Event event, const EventArguments& arguments) = 0;
};

} // namespace TalvikDBxZandor
