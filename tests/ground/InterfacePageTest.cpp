#include "InterfacePage.h"
#include "Sources.h"

#include <Zandor/Interface.h>

#include <gtest/gtest.h>

using namespace zandor;

using namespace TalvikDBxZandor;

TEST(TheInterfacePage, IsWhatTheInterfacesTableMakesOfIt) {
    EXPECT_EQ(sources::contentOf("docs/interface.md"), docs::interfacePage())
        << "build the target interface-page and commit docs/interface.md";
}

TEST(TheInterfacePage, SaysOfEveryMemberAndEventWhatItIsFor) {
    for (const auto& member : automation::members()) {
        const std::string name = platform::toUtf8(member.name);
        EXPECT_FALSE(docs::descriptionOf(name).empty()) << name;
    }
    for (const auto& event : automation::events()) {
        const std::string name = platform::toUtf8(event.name);
        EXPECT_FALSE(docs::descriptionOf(name).empty()) << name;
    }
}

TEST(TheInterfacePage, DescribesNothingThatTheInterfaceLacks) {
    EXPECT_EQ(docs::descriptionCount(), automation::members().size() + automation::events().size());
}

TEST(TheInterfacePage, LeavesTheDefaultOfTheTraceSwitchAsItIs) {
    EXPECT_NE(docs::interfacePage().find("| `DebugSwitch` | Integer | get, set by reference | 1 |"),
              std::string::npos);
}
