#pragma once

#include <Zandor/Zandor.h>
#include <Zandor/platform/Variant.h>
#include <Zandor/platform/export.h>

#include <span>

/// The whole public interface of the control as one table, for front ends and their checks.
namespace TalvikDBxZandor::automation {

enum class Kind { field, property, method };

enum class Type { none, String, Boolean, Integer, Zandor, ZDJoin, ZDTable, ZDColumn };

/// How a property is written. A getter always exists.
enum class Setter { none, byValue, byReference, object };

struct Parameter {
    platform::StringView name;
    bool byReference = false;
};

struct Member {
    std::uint32_t dispatchId;
    platform::StringView name;
    Kind kind;
    Type type;
    Setter setter = Setter::none;
    platform::StringView getterReport = {}; ///< the name a failure is reported under
    platform::StringView setterReport = {};
    platform::Variant (*get)(Zandor&) = nullptr;
    /// Throws error 13 when the value is not of the member's type, and sets nothing then.
    void (*set)(Zandor&, const platform::Variant&) = nullptr;
    std::span<const Parameter> parameters = {}; ///< of a method; all are strings
    /// Calls a method. Throws error 450 for another number of arguments than it has parameters,
    /// 13 when one is no string, and calls nothing then.
    void (*invoke)(Zandor&, std::span<const platform::Variant> arguments) = nullptr;
};

enum class Carries { nothing, definition, join, textAndNumber };

struct EventMember {
    Event number;
    platform::StringView name;
    Carries arguments;
};

/// In the order fields, property procedures, methods; dispatch ids ascend in the first and the last
/// group and descend in the second.
ZANDOR_CONTROL_EXPORT std::span<const Member> members();

ZANDOR_CONTROL_EXPORT std::span<const EventMember> events();

} // namespace TalvikDBxZandor::automation
