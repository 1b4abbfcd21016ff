#include "Sources.h"
#include "support/PublicInterface.h"

#include <Zandor/platform/String.h>

#include <gtest/gtest.h>

#include <map>
#include <regex>
#include <sstream>

using namespace zandor;

// A plain getter cannot be made to fail, so no run shows the name that it would report under. The
// names are read from the text instead.

namespace {

using promised::Property;
using promised::Setter;
using promised::Type;

/// Where the accessors are written: inline in the class, in these two files otherwise.
const std::string& accessorText() {
    static const std::string text = sources::contentOf("src/control/include/Zandor/Zandor.h") +
                                    sources::contentOf("src/control/properties.cpp") +
                                    sources::contentOf("src/control/binding.cpp");
    return text;
}

/// "report::NAME.get" or "report::NAME.let" as the text that stands for it.
std::string reportNamed(const std::string& name, bool get) {
    static const std::string text =
        sources::contentOf("src/control/include/Zandor/control/report.h");
    const std::regex row("\\bProperty " + name + R"re(\{u"([^"]*)"(?:, u"([^"]*)")?\};)re");
    std::smatch match;
    if (!std::regex_search(text, match, row)) return "no report name of " + name;
    return get ? match[1] : match[2];
}

/// What the one function whose head ends in `head` reports under: the first name in its body.
std::string firstNameOf(const std::string& head) {
    const std::string& text = accessorText();
    const std::size_t at = text.find(head);
    if (at == std::string::npos) return "no function " + head;
    if (text.find(head, at + 1) != std::string::npos) return "more than one function " + head;
    static const std::regex use(R"re(\breport::(\w+)\.(get|let)\b)re");
    std::smatch match;
    const std::string body = text.substr(at + head.size(), text.find("}", at + head.size()) - at);
    if (!std::regex_search(body, match, use)) return "no name in " + head;
    return reportNamed(match[1], match[2] == "get");
}

/// The one of two heads that is there: written within the class or outside.
std::string nameOf(const std::string& head) {
    const std::string inside = firstNameOf(" " + head);
    return inside.starts_with("no function") ? firstNameOf("Zandor::" + head) : inside;
}

std::string getterHead(const Property& property) {
    if (property.type == Type::Zandor) return "P_GET_Zandor() {";
    return platform::toUtf8(property.name) + "() const {";
}

/// The control's procedures that report at all, with the name that each reports under.
std::map<std::string, std::string> procedureReports() {
    static const std::regex head(R"re(^\w.*\bZandor::(\w+)\(.*)re");
    static const std::regex guard(R"re(.*\bGuard\(u"([^"]*)".*)re");
    std::map<std::string, std::string> reports;
    for (const std::string& file : sources::below("src/control")) {
        std::istringstream lines(sources::contentOf(file));
        std::string procedure;
        std::smatch match;
        for (std::string line; std::getline(lines, line);) {
            if (std::regex_match(line, match, head))
                procedure = match[1];
            else if (line == "}")
                procedure.clear();
            else if (!procedure.empty() && std::regex_match(line, match, guard))
                reports.emplace(procedure, match[1]);
        }
    }
    return reports;
}

std::string setterHead(const Property& property) {
    if (property.setter == Setter::object)
        return "P_SET_Zandor(const Ref<TalvikZandorLib::Zandor>& given) {";
    const std::string type = property.type == Type::Boolean ? "bool" : "std::int16_t";
    return platform::toUtf8(property.name) + "(" + type + " v) {";
}

} // namespace

TEST(EveryPropertyGetter, ReportsUnderThePromisedName) {
    for (const Property& property : promised::properties)
        EXPECT_EQ(nameOf(getterHead(property)), platform::toUtf8(property.getterReport))
            << platform::toUtf8(property.name);
}

TEST(EveryPropertySetter, ReportsUnderThePromisedName) {
    for (const Property& property : promised::properties) {
        if (property.setter == Setter::none) continue;
        EXPECT_EQ(nameOf(setterHead(property)), platform::toUtf8(property.setterReport))
            << platform::toUtf8(property.name);
    }
}

TEST(EveryProcedure, ReportsUnderItsOwnNameUnlessHostsKnowItByAnother) {
    auto reports = procedureReports();
    const std::map<std::string, std::string> known = {
        {"fraTable_MouseUp", "lstTable_MouseUp"},
        {"lstTable_GotFocus", "lstTable_GotFOcus"},
        {"SetEnabledJoinOperators", "SetEnabledJoinTypes"},
        {"ReadOnly", "P_LET ReadOnly"},
    };
    for (const auto& [procedure, report] : known) {
        EXPECT_EQ(reports[procedure], report);
        reports.erase(procedure);
    }
    for (const Property& property : promised::properties)
        reports.erase(platform::toUtf8(property.name));
    for (const auto& [procedure, report] : reports) EXPECT_EQ(report, procedure);
    for (const char* procedure :
         {"UserControl_Initialize", "UserControl_Paint", "UserControl_Resize",
          "UserControl_Terminate", "ResizeControls", "SetZandor", "RemoveAllTables", "Terminate",
          "SetCurrentTable", "SelectColumnNames"})
        EXPECT_EQ(reports.count(procedure), 1U) << procedure << " reports nothing";
}
