#pragma once

#include <Zandor/platform/Ref.h>
#include <Zandor/platform/String.h>

#include <variant>

namespace TalvikZandorLib {
class Zandor;
class ZDJoin;
class ZDTable;
class ZDColumn;
} // namespace TalvikZandorLib

namespace zandor::platform {

/// A value of any type that crosses the automation boundary. Empty is std::monostate; an object is
/// held by counted reference, of its own type where the control's interface knows that.
using Variant = std::variant<std::monostate, bool, std::int16_t, std::int32_t, String,
                             Ref<TalvikZandorLib::Zandor>, Ref<TalvikZandorLib::ZDJoin>,
                             Ref<TalvikZandorLib::ZDTable>, Ref<TalvikZandorLib::ZDColumn>,
                             std::shared_ptr<void>>;

} // namespace zandor::platform
