#include "Functions.h"

#include <Zandor/Interface.h>

using namespace zandor;
using TalvikDBxZandor::automation::Carries;
using TalvikDBxZandor::automation::Kind;
using TalvikDBxZandor::automation::Member;
using TalvikDBxZandor::automation::Setter;
using TalvikDBxZandor::automation::Type;

namespace {

const char* rawTypeOf(Type type) {
    switch (type) {
    case Type::String: return "BSTR";
    case Type::Boolean: return "VARIANT_BOOL";
    case Type::Integer: return "short";
    case Type::Zandor: return "_ZDQuery*";
    case Type::ZDJoin: return "_ZDJoin*";
    case Type::ZDTable: return "_ZDTable*";
    case Type::ZDColumn: return "_ZDColumn*";
    case Type::none: break;
    }
    return "";
}

void add(Functions& functions, const Member& member) {
    const auto id = static_cast<DISPID>(member.dispatchId);
    const std::string name = platform::toUtf8(member.name);
    const std::string type = rawTypeOf(member.type);
    if (member.kind == Kind::method) {
        std::string parameters;
        for (const auto& parameter : member.parameters) {
            if (!parameters.empty()) parameters += ", ";
            parameters += parameter.byReference ? "in out BSTR* " : "in BSTR ";
            parameters += platform::toUtf8(parameter.name);
        }
        functions.emplace(id, name + "(" + parameters + ")");
        return;
    }
    functions.emplace(id, "get " + name + "(out " + type + "*)");
    switch (member.setter) {
    case Setter::none: break;
    case Setter::byValue: functions.emplace(id, "put " + name + "(in " + type + ")"); break;
    case Setter::byReference:
        functions.emplace(id, "put " + name + "(in out " + type + "*)");
        break;
    case Setter::object: functions.emplace(id, "set " + name + "(in " + type + ")"); break;
    }
}

} // namespace

Functions functionsOfTheTable() {
    Functions functions;
    for (const Member& member : TalvikDBxZandor::automation::members()) add(functions, member);
    return functions;
}

Functions eventsOfTheTable() {
    Functions functions;
    for (const auto& event : TalvikDBxZandor::automation::events()) {
        const char* parameters = "";
        switch (event.arguments) {
        case Carries::nothing: break;
        case Carries::definition: parameters = "in IDispatch* Definition"; break;
        case Carries::join: parameters = "in IDispatch* Join"; break;
        case Carries::textAndNumber: parameters = "in BSTR Text, in long Number"; break;
        }
        functions.emplace(static_cast<DISPID>(event.number),
                          platform::toUtf8(event.name) + "(" + parameters + ")");
    }
    return functions;
}
