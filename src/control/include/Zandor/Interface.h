#pragma once

#include <Zandor/Zandor.h>
#include <Zandor/platform/Variant.h>
#include <Zandor/platform/export.h>

#include <span>

/// The whole public interface of the control as one table, for front ends and their checks.
namespace TalvikDBxZandor::automation {

/// A plain value, a property procedure, or what is called.
enum class Kind { field, property, method };

/// Of a value; an Integer has 16 bits.
enum class Type { none, String, Boolean, Integer, Zandor, ZDJoin, ZDTable, ZDColumn };

/// How a property is written. A getter always exists.
enum class Setter { none, byValue, byReference, object };

/// Of a method.
struct Parameter {
    platform::StringView name; ///< as automation hosts write it
    bool byReference = false;  ///< as it is declared; it is never written
};

/// A member of the interface.
struct Member {
    std::uint32_t dispatchId;                    ///< never given twice
    platform::StringView name;                   ///< unique
    Kind kind;                                   ///< what it is
    Type type;                                   ///< none for a method
    Setter setter = Setter::none;                ///< how it is written
    platform::StringView getterReport = {};      ///< the name a failure is reported under
    platform::StringView setterReport = {};      ///< the same for setting
    platform::Variant (*get)(Zandor&) = nullptr; ///< of what has a value
    /// Throws error 13 when the value is not of the member's type, and sets nothing then.
    void (*set)(Zandor&, const platform::Variant&) = nullptr;
    std::span<const Parameter> parameters = {}; ///< of a method; all are strings
    /// Calls a method. Throws error 450 for another number of arguments than it has parameters,
    /// 13 when one is no string, and calls nothing then.
    void (*invoke)(Zandor&, std::span<const platform::Variant> arguments) = nullptr;
};

/// The arguments of an event.
enum class Carries { nothing, definition, join, textAndNumber };

/// An event of the interface.
struct EventMember {
    Event number;              ///< under which it is raised
    platform::StringView name; ///< unique
    Carries arguments;         ///< in the order of their names
};

/// In the order fields, property procedures, methods; dispatch ids ascend in the first and the last
/// group and descend in the second.
ZANDOR_CONTROL_EXPORT std::span<const Member> members();

/// In the order of their numbers, from -120 downwards.
ZANDOR_CONTROL_EXPORT std::span<const EventMember> events();

} // namespace TalvikDBxZandor::automation
