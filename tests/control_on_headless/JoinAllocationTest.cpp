#include "Allocations.h"
#include "control/JoinScene.h"

#include <functional>

using namespace zandor;

namespace {

using platform::String;
using TalvikDBxZandor::clsJoinLine;

const String longText(100, u'x');

/// As many joins as there are numbers, some of which show the circle.
struct SixtyFourJoins : JoinScene {
    SixtyFourJoins() {
        for (std::int16_t n = 0; n < 64; ++n) join(static_cast<std::int16_t>(n % 4));
        bind();
        Back::DrawJoins(control);
    }

    template <class Action>
    static std::size_t allocationsOf(Action&& action) {
        const std::size_t before = allocations::count();
        action();
        return allocations::count() - before;
    }
};

TEST_F(SixtyFourJoins, AreDrawnAgainWithoutAnAllocation) {
    table(2).Left(4000);
    EXPECT_EQ(allocationsOf([this] { Back::DrawJoins(control); }), 0U);
    EXPECT_EQ(stage->look("shpJoin(1)").bounds.Left, 4000 - 140);
}

TEST_F(SixtyFourJoins, FollowATableThatIsMovingWithoutAnAllocation) {
    table(2).Left(4000);
    EXPECT_EQ(allocationsOf([this] { Back::lstTable_Moving(control, std::int16_t{2}); }), 0U);
    EXPECT_EQ(stage->look("shpJoin(1)").bounds.Left, 4000 - 140);
}

TEST_F(SixtyFourJoins, AreSearchedForAPointWithoutAnAllocation) {
    Record hit;
    const float x = (line().X1() + line().X2()) / 2;
    const float y = (line().Y1() + line().Y2()) / 2;
    EXPECT_EQ(allocationsOf([&] { Back::JoinHitTest(control, hit, x, y); }), 0U);
    EXPECT_EQ(hit, record());
}

// The record's property procedures, which only a failed allocation can make fail.

struct TheJoinRecordWithoutMemory : JoinScene {
    clsJoinLine row{stage->toolkit()};

    struct Text {
        String name;
        void (clsJoinLine::*let)(const String&);
        String (clsJoinLine::*get)() const;
    };
    const std::vector<Text> texts = {
        {u"LeftColumnName", &clsJoinLine::LeftColumnName, &clsJoinLine::LeftColumnName},
        {u"LeftColumnText", &clsJoinLine::LeftColumnText, &clsJoinLine::LeftColumnText},
        {u"RightColumnText", &clsJoinLine::RightColumnText, &clsJoinLine::RightColumnText},
        {u"RightColumnName", &clsJoinLine::RightColumnName, &clsJoinLine::RightColumnName},
        {u"LeftTableName", &clsJoinLine::LeftTableName, &clsJoinLine::LeftTableName},
        {u"RightTableName", &clsJoinLine::RightTableName, &clsJoinLine::RightTableName}};

    static Stage::Box outOfMemory(const String& procedure) {
        return errorBox(u"TalvikDBxZandor.clsJoinLine", procedure, 7, u"Out of memory");
    }
};

TEST_F(TheJoinRecordWithoutMemory, ReportsASetterByNameAndKeepsTheOldText) {
    for (const Text& text : texts) {
        (row.*text.let)(u"old");
        stage->boxes.clear();
        allocations::failNext();
        (row.*text.let)(longText);
        EXPECT_FALSE(allocations::disarm());
        EXPECT_EQ(stage->boxes, Boxes{outOfMemory(u"P_LET " + text.name)})
            << platform::toUtf8(text.name);
        EXPECT_EQ((row.*text.get)(), u"old");
    }
}

TEST_F(TheJoinRecordWithoutMemory, ReportsAGetterByNameAndAnswersWithNothing) {
    for (const Text& text : texts) {
        (row.*text.let)(longText);
        stage->boxes.clear();
        allocations::failNext();
        const String read = (row.*text.get)();
        EXPECT_FALSE(allocations::disarm());
        EXPECT_EQ(read, u"");
        EXPECT_EQ(stage->boxes, Boxes{outOfMemory(u"P_GET " + text.name)})
            << platform::toUtf8(text.name);
        EXPECT_EQ((row.*text.get)(), longText);
    }
}

TEST_F(TheJoinRecordWithoutMemory, ReportsItsTagLikeTheOthers) {
    const platform::Variant tag = longText;
    allocations::failNext();
    row.Tag(tag);
    EXPECT_FALSE(allocations::disarm());
    EXPECT_EQ(stage->boxes, Boxes{outOfMemory(u"P_LET Tag")});
    EXPECT_EQ(row.Tag(), platform::Variant());

    row.Tag(tag);
    stage->boxes.clear();
    allocations::failNext();
    const platform::Variant read = row.Tag();
    EXPECT_FALSE(allocations::disarm());
    EXPECT_EQ(read, platform::Variant());
    EXPECT_EQ(stage->boxes, Boxes{outOfMemory(u"P_GET Tag")});
}

} // namespace
