#include "Functions.h"

#include "frontends/windows/automation/com/ids.h"

#include <control.h>
#include <gtest/gtest.h>

#include <fstream>
#include <regex>

// The library as somebody else's reader of type libraries sees it: genidl of the mingw-w64 tools,
// which shares no line with the system's reader or with what made the library. The build has it
// write down what it finds in the file.

namespace {

/// As this system's readers name a type.
std::string typeRead(std::string text) {
    // It names what is declared elsewhere by its id.
    static const std::regex elsewhere(R"(talvikzandorlib\.tlb_([0-9A-F-]+)_\S+)");
    const std::pair<GUID, const char*> known[] = {{__uuidof(_ZDQuery), "_ZDQuery"},
                                                  {__uuidof(_ZDJoin), "_ZDJoin"},
                                                  {__uuidof(_ZDTable), "_ZDTable"},
                                                  {__uuidof(_ZDColumn), "_ZDColumn"}};
    if (std::smatch match; std::regex_search(text, match, elsewhere)) {
        std::string name = "?";
        for (const auto& [id, named] : known) {
            wchar_t spelled[40];
            StringFromGUID2(id, spelled, 40);
            const std::string letters = match[1];
            if (std::wstring(letters.begin(), letters.end()) == std::wstring(spelled + 1, 36))
                name = named;
        }
        text = std::regex_replace(text, elsewhere, name);
    }
    text = std::regex_replace(text, std::regex("WINBOOL"), "VARIANT_BOOL");
    return std::regex_replace(text, std::regex(" +\\*"), "*");
}

/// One of the lines that parameters stand in: "[out retval] BSTR *value,".
std::string parameterRead(const std::string& line, bool named) {
    static const std::regex form(R"(\s*\[(in out|in|out)(?: retval)?\] (.*?)(\w+),?)");
    std::smatch match;
    if (!std::regex_match(line, match, form)) return line;
    std::string type = typeRead(match[2]);
    // What stands before the name of a pointer has no blank of its own.
    if (!type.empty() && type.back() == ' ') type.pop_back();
    return match[1].str() + " " + type + (named ? " " + match[3].str() : "");
}

/// What a `dispinterface` of the text declares.
Functions read(const char* name) {
    std::ifstream text(ZANDOR_READ_BY_GENIDL);
    EXPECT_TRUE(text) << ZANDOR_READ_BY_GENIDL;
    static const std::regex attributes(R"(\s*\[(?:id\((0x[0-9a-f]+)\))?(?:, )?(prop\w+)?\])");
    static const std::regex declaration(R"(\s*(?:HRESULT|void) __stdcall (\w+) \((void\);)?)");
    Functions functions;
    bool inside = false;
    DISPID id = 0;
    std::string kind;
    std::string function;
    for (std::string line; std::getline(text, line);) {
        std::smatch match;
        const bool begins = line.starts_with("   dispinterface ") && !line.ends_with(";");
        if (begins)
            inside = line.starts_with(std::string("   dispinterface ") + name + " ") ||
                     line == std::string("   dispinterface ") + name;
        if (!inside || begins) continue;
        if (line == "   };") break;
        if (function.empty() && std::regex_match(line, match, attributes)) {
            // The one that follows upon the last is left out.
            id = match[1].matched ? static_cast<DISPID>(std::stoul(match[1], nullptr, 16)) : id + 1;
            kind = match[2];
        } else if (std::regex_match(line, match, declaration)) {
            // A line without attributes, too, has the id that follows.
            if (kind == "used") id += 1, kind = "";
            function = kind.empty() ? "" : kind == "propputref" ? "set " : kind.substr(4) + " ";
            function += match[1].str() + "(";
            if (match[2].matched) {
                functions.emplace(id, function + ")");
                function.clear();
                kind = "used";
            }
        } else if (line.find(");") != std::string::npos && !function.empty()) {
            functions.emplace(id, function + ")");
            function.clear();
            kind = "used";
        } else if (!function.empty()) {
            if (!function.ends_with('(')) function += ", ";
            function += parameterRead(line, kind.empty());
        }
    }
    return functions;
}

} // namespace

TEST(AReaderOfSomebodyElses, FindsTheMembersUnderTheirIdsAndTypes) {
    EXPECT_EQ(read("_Zandor"), functionsOfTheTable());
}

TEST(AReaderOfSomebodyElses, FindsTheEventsUnderTheirNumbers) {
    EXPECT_EQ(read("__Zandor"), eventsOfTheTable());
}
