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

/// The first literal in the body of the one function whose head ends in `head`.
std::string firstLiteralOf(const std::string& head) {
    const std::string& text = accessorText();
    const std::size_t at = text.find(head);
    if (at == std::string::npos) return "no function " + head;
    if (text.find(head, at + 1) != std::string::npos) return "more than one function " + head;
    const std::size_t open = text.find("u\"", at + head.size());
    const std::size_t begin = open + 2;
    return text.substr(begin, text.find('"', begin) - begin);
}

/// The one of two heads that is there: written within the class or outside.
std::string literalOf(const std::string& head) {
    const std::string inside = firstLiteralOf(" " + head);
    return inside.starts_with("no function") ? firstLiteralOf("Zandor::" + head) : inside;
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
        EXPECT_EQ(literalOf(getterHead(property)), platform::toUtf8(property.getterReport))
            << platform::toUtf8(property.name);
}

TEST(EveryPropertySetter, ReportsUnderThePromisedName) {
    for (const Property& property : promised::properties) {
        if (property.setter == Setter::none) continue;
        EXPECT_EQ(literalOf(setterHead(property)), platform::toUtf8(property.setterReport))
            << platform::toUtf8(property.name);
    }
}

TEST(EveryProcedure, ReportsUnderItsOwnNameUnlessHostsKnowItByAnother) {
    auto reports = procedureReports();
    const std::map<std::string, std::string> known = {
        {"fraTable_MouseUp", "lstTable_MouseUp"},
        {"lstTable_GotFocus", "lstTable_GotFOcus"},
        {"SetEnabledJoinOperators", "SetEnabledJoinTypes"},
        {"P_GET_Zandor", "P_GET Zandor"},
        {"P_SET_Zandor", "P_SET Zandor"},
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
