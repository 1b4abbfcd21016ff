#include "InterfacePage.h"

#include <Zandor/Interface.h>
#include <Zandor/headless/Toolkit.h>

#include <array>
#include <cstdio>

using namespace zandor;

namespace docs {

namespace {

using namespace TalvikDBxZandor;
using automation::Kind;
using automation::Member;
using automation::Setter;
using automation::Type;
using platform::toUtf8;

/// The page needs a control to read defaults from, and none of these.
struct NoLibrary final : TalvikZandorLib::Library {
    platform::Ref<TalvikZandorLib::Zandor> NewZandor() override { return {}; }
    platform::Ref<TalvikZandorLib::ZDJoin> NewZDJoin() override { return {}; }
    platform::Ref<TalvikZandorLib::ZDColumnDefinition> NewZDColumnDefinition() override {
        return {};
    }
};

struct Nobody final : ZandorEvents {
    void Raise(Event, const EventArguments&) override {}
};

std::string hexadecimal(std::uint32_t id) {
    std::array<char, 11> text{};
    std::snprintf(text.data(), text.size(), "0x%08X", static_cast<unsigned>(id));
    return text.data();
}

std::string quoted(platform::StringView text) {
    return text.empty() ? std::string() : "\"" + toUtf8(text) + "\"";
}

std::string_view nameOf(Type type) {
    switch (type) {
    case Type::none: return "";
    case Type::String: return "String";
    case Type::Boolean: return "Boolean";
    case Type::Integer: return "Integer";
    case Type::Zandor: return "query model";
    case Type::ZDJoin: return "ZDJoin";
    case Type::ZDTable: return "ZDTable";
    case Type::ZDColumn: return "ZDColumn";
    }
    return "";
}

std::string_view access(Setter setter) {
    switch (setter) {
    case Setter::none: return "get";
    case Setter::byValue: return "get, set";
    case Setter::byReference: return "get, set by reference";
    case Setter::object: return "get, set an object";
    }
    return "";
}

std::string defaultOf(const Member& member, Zandor& control) {
    // The library makes the first model, and the first layout sets the scroll ranges.
    if (member.type == Type::Zandor) return "an empty model";
    if (member.name.ends_with(u"MaxScrollPos")) return "from the layout";
    const platform::Variant value = member.get(control);
    if (const auto* text = std::get_if<platform::String>(&value)) return "`" + quoted(*text) + "`";
    if (const auto* flag = std::get_if<bool>(&value)) return *flag ? "True" : "False";
    if (const auto* number = std::get_if<std::int16_t>(&value)) return std::to_string(*number);
    return "nothing";
}

std::string reports(const Member& member) {
    std::string text = quoted(member.getterReport);
    if (!member.setterReport.empty()) text += ", " + quoted(member.setterReport);
    return text;
}

std::string parametersOf(const Member& member) {
    std::string text;
    for (const automation::Parameter& parameter : member.parameters) {
        if (!text.empty()) text += ", ";
        text +=
            toUtf8(parameter.name) + " As String" + (parameter.byReference ? " by reference" : "");
    }
    return text.empty() ? "none" : text;
}

std::string_view argumentsOf(automation::Carries carries) {
    switch (carries) {
    case automation::Carries::nothing: return "none";
    case automation::Carries::definition: return "the output column's `ZDColumnDefinition`";
    case automation::Carries::join: return "the `ZDJoin`";
    case automation::Carries::textAndNumber: return "a text, a number";
    }
    return "";
}

class Page {
public:
    void text(std::string_view paragraph) { (mText += paragraph) += "\n"; }
    template <class... Cells>
    void row(const Cells&... cells) {
        mText += "|";
        ((((mText += " ") += cells) += " |"), ...);
        mText += "\n";
    }
    void describedRows(Kind kind, Zandor& control);
    void events();
    std::string take() { return std::move(mText); }

private:
    std::string mText;
};

void Page::describedRows(Kind kind, Zandor& control) {
    for (const Member& member : automation::members()) {
        if (member.kind != kind) continue;
        const std::string name = toUtf8(member.name);
        const std::string code = "`" + name + "`";
        const std::string id = hexadecimal(member.dispatchId);
        switch (kind) {
        case Kind::field:
            row(id, code, nameOf(member.type), defaultOf(member, control), descriptionOf(name));
            break;
        case Kind::property:
            row(id, code, nameOf(member.type), access(member.setter), defaultOf(member, control),
                descriptionOf(name), reports(member));
            break;
        case Kind::method: row(id, code, parametersOf(member), descriptionOf(name)); break;
        }
    }
}

void Page::events() {
    for (const automation::EventMember& event : automation::events()) {
        const std::string name = toUtf8(event.name);
        row(std::to_string(static_cast<int>(event.number)), "`" + name + "`",
            argumentsOf(event.arguments), descriptionOf(name));
    }
}

} // namespace

std::string interfacePage() {
    NoLibrary library;
    Nobody nobody;
    platform::headless::Toolkit toolkit;
    Zandor control(toolkit, library, nobody);
    Page page;
    page.text("# The public interface\n\n"
              "Made from the table in `src/control/Interface.cpp`; after a change there, build the "
              "target `interface-page`.\n\n"
              "Every front end offers these members under these names and dispatch ids. Integers "
              "have 16 bits, places and sizes are twips (1/1440 inch, 15 to a logical pixel), and "
              "an automation host sees True as -1. No member throws: a failure is shown in a box "
              "under the name in the last column, and a getter returns its result as it stood.\n\n"
              "## Texts and flags\n\n"
              "Plain values. They take effect where they are read next: menu flags when a model is "
              "handed over, grid titles when `OnlyJoin` is set to False, the other texts when the "
              "menu or the dialog opens. What is shown and spoken beside these texts is listed in "
              "[words.md](words.md).\n");
    page.row("Dispatch id", "Name", "Type", "Default", "Meaning");
    page.text("|---|---|---|---|---|");
    page.describedRows(Kind::field, control);
    page.text("\n## Properties\n");
    page.row("Dispatch id", "Name", "Type", "Access", "At first", "Meaning", "Reported as");
    page.text("|---|---|---|---|---|---|---|");
    page.describedRows(Kind::property, control);
    page.text("\n## Methods\n");
    page.row("Dispatch id", "Name", "Parameters", "Meaning");
    page.text("|---|---|---|---|");
    page.describedRows(Kind::method, control);
    page.text("\n## Events\n");
    page.row("Number", "Name", "Arguments", "Raised when");
    page.text("|---|---|---|---|");
    page.events();
    return page.take();
}

} // namespace docs
