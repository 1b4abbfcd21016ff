#include "Dll.h"
#include "ScriptHost.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iterator>

using Lines = std::vector<std::string>;

// All ten events are received by scripts in the journey, where a user's deeds raise them.

namespace {

std::wstring textOf(const char* path) {
    std::ifstream file(path);
    const std::string bytes{std::istreambuf_iterator<char>(file), {}};
    return {bytes.begin(), bytes.end()};
}

} // namespace

TEST(TheEventsInAScript, AreNotMissedWhereThereIsNoProcedure) {
    const auto control = newControl();
    ScriptHost script(L"VBScript");
    script.lend(L"control", control.get());
    ASSERT_TRUE(script.run(L"Sub On_TableMoved() : WScript.Echo \"moved\" : End Sub\n"
                           L"WScript.ConnectObject control, \"On_\"\n"
                           L"Set control.Zandor = Nothing"))
        << script.failure();
    EXPECT_EQ(script.said(), Lines{});
}

TEST(TheEventsInAScript, OfAControlThatWasMadeWithAPrefixAreThoseOfTheExample) {
    ScriptHost script(L"VBScript");
    ASSERT_TRUE(script.run(textOf(ZANDOR_EXAMPLES_WINDOWS "/events.vbs"))) << script.failure();
    EXPECT_EQ(script.said(), Lines{"New Zanodr is nothing! (-1)"});
}
