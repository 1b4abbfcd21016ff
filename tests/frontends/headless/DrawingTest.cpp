#include <Zandor/headless/Drawing.h>

#include "support/Tables.h"

#include <Zandor/headless/Toolkit.h>

#include <gtest/gtest.h>

using namespace zandor;

namespace {

using platform::headless::svgOf;

class ADrawing : public testing::Test {
protected:
    std::string svg() { return svgOf(library, model); }
    static bool has(const std::string& text, const std::string& part) {
        return text.find(part) != std::string::npos;
    }
    static std::size_t count(const std::string& text, const std::string& part) {
        std::size_t found = 0;
        for (auto at = text.find(part); at != std::string::npos; at = text.find(part, at + 1))
            ++found;
        return found;
    }

    fake::Library library;
    platform::Ref<fake::Model> model = library.newModel();
};

} // namespace

TEST_F(ADrawing, HasTheTablesWhereTheyStand) {
    addOrders(*model);
    addCustomers(*model);
    const std::string drawn = svg();
    EXPECT_TRUE(has(drawn, "translate(20 20)")) << drawn; // 300 twips
    EXPECT_TRUE(has(drawn, "translate(400 20)")) << drawn;
    EXPECT_TRUE(has(drawn, ">ORDERS</text>"));
    EXPECT_TRUE(has(drawn, ">CUSTOMER</text>"));
    EXPECT_TRUE(has(drawn, "width=\"580\"")) << "to the right end of the last table, and a margin";
}

TEST_F(ADrawing, HasAJoinFromMarkToMarkWithItsNotes) {
    const auto orders = addOrders(*model);
    const auto customers = addCustomers(*model);
    const auto join = model->join(orders, u"CUSTOMER", customers, u"ID");
    join->joinType = 1;
    join->compareOperator = 2;
    const std::string drawn = svg();
    // The marks stand beside the tables, and the line leads from one to the other.
    EXPECT_TRUE(has(drawn, "<rect class=\"mark\" x=\"180\"")) << drawn;
    EXPECT_TRUE(has(drawn, "<circle class=\"mark\" cx=\"395.33\"")) << drawn;
    EXPECT_TRUE(has(drawn, "x1=\"189.33\"")) << drawn;
    EXPECT_TRUE(has(drawn, "x2=\"390.67\"")) << drawn;
    EXPECT_TRUE(has(drawn, ">all</text>"));
    EXPECT_TRUE(has(drawn, ">&lt;</text>"));
    EXPECT_TRUE(has(drawn, "<title>all rows of ORDERS"));
}

TEST_F(ADrawing, MarksKeysAndWhatComesOut) {
    const auto orders = addOrders(*model);
    orders->column(u"ID").marker = true;
    EXPECT_EQ(count(svg(), "class=\"key\""), 1U);
    EXPECT_EQ(count(svg(), "class=\"out\""), 0U);
    model->definition(orders, u"TOTAL");
    EXPECT_EQ(count(svg(), "class=\"out\""), 1U);
}

TEST_F(ADrawing, SaysHowManyColumnsATableHasNoRoomFor) {
    const auto table = model->table(u"T", {u"A", u"B", u"C", u"D", u"E", u"F"});
    table->place(300, 300, 2400, 345 + 3 * 225);
    const std::string drawn = svg();
    EXPECT_TRUE(has(drawn, ">B</text>"));
    EXPECT_FALSE(has(drawn, ">C</text>"));
    EXPECT_TRUE(has(drawn, ">… 4</text>")) << drawn;
}

TEST_F(ADrawing, EndsATableWithItsLastColumn) {
    const auto table = model->table(u"T", {u"A", u"B"});
    table->place(300, 300, 2400, 6000);
    EXPECT_TRUE(has(svg(), "width=\"160\" height=\"53\"")) << svg(); // 300 + 2 * 225 + 45 twips
}

TEST_F(ADrawing, EscapesWhatTheModelSays) {
    model->table(u"<&>", {u"a\u0007b", u"\uFFFF", u"\xD800"})->place(300, 300, 2400, 2400);
    const std::string drawn = svg();
    EXPECT_TRUE(has(drawn, ">&lt;&amp;&gt;</text>")) << drawn;
    EXPECT_TRUE(has(drawn, ">a b</text>"));
    EXPECT_EQ(count(drawn, ">\xEF\xBF\xBD</text>"), 2U) << drawn;
}

TEST_F(ADrawing, CutsALongNameBetweenCharacters) {
    platform::String name;
    for (int n = 0; n < 50; ++n) name += u"😀";
    model->table(name, {u"A"})->place(300, 300, 2400, 2400);
    const std::string drawn = svg();
    EXPECT_FALSE(has(drawn, platform::toUtf8(name)));
    EXPECT_TRUE(has(drawn, "😀…</text>")) << drawn;
    EXPECT_FALSE(has(drawn, "\xEF\xBF\xBD")) << drawn;
}

TEST_F(ADrawing, CutsNoNameThatFitsAndNoneWithinACharacter) {
    const platform::String fits = u"ABCDEFGHIJKLMNOPQRSTU"; // 21 letters of 7 pixels in 152
    model->table(fits, {u"A"})->place(300, 300, 2400, 2400);
    model->table(fits + u"V", {u"A"})->place(3000, 300, 2400, 2400);
    platform::String smileys = u"a";
    for (int n = 0; n < 50; ++n) smileys += u"😀";
    model->table(smileys, {u"A"})->place(6000, 300, 2400, 2400);
    const std::string drawn = svg();
    EXPECT_TRUE(has(drawn, ">ABCDEFGHIJKLMNOPQRSTU</text>")) << drawn;
    EXPECT_TRUE(has(drawn, ">ABCDEFGHIJKLMNOPQRST…</text>")) << drawn;
    EXPECT_TRUE(has(drawn, "😀…</text>")) << drawn;
    EXPECT_FALSE(has(drawn, "\xEF\xBF\xBD")) << drawn;
}

TEST_F(ADrawing, HasNoLineBreakInAName) {
    model->table(u"T", {u"a\nb\tc\u001Fd"})->place(300, 300, 2400, 2400);
    EXPECT_TRUE(has(svg(), ">a b c d</text>")) << svg();
}

TEST_F(ADrawing, EndsWithTheTableThatReachesFarthest) {
    model->table(u"EAST", {u"A", u"B"})->place(6000, 300, 2400, 2400);
    model->table(u"WEST", {u"A"})->place(300, 300, 2400, 2400);
    EXPECT_TRUE(has(svg(), "width=\"580\" height=\"93\"")) << svg();
}

TEST_F(ADrawing, OfNothingIsAnEmptyPicture) {
    const std::string drawn = svg();
    EXPECT_TRUE(has(drawn, "<svg "));
    EXPECT_EQ(count(drawn, "<text"), 0U);
    EXPECT_TRUE(has(drawn, "</svg>"));
}

TEST_F(ADrawing, ThatFailsIsAnErrorAndNoPicture) {
    addOrders(*model);
    model->fail("ZDTable.Name", platform::errors::typeMismatch());
    try {
        svg();
        FAIL() << "drawn all the same";
    } catch (const platform::RuntimeError& error) {
        EXPECT_EQ(error.Number, 440);
        EXPECT_NE(error.Description, u"");
    }
    try {
        svgOf(library, {});
        FAIL() << "drawn without a query";
    } catch (const platform::RuntimeError& error) {
        EXPECT_EQ(error.Number, 91);
    }
}

TEST(ACanvasWithoutAControl, CannotBeDrawn) {
    const platform::headless::Toolkit toolkit;
    EXPECT_THROW(svgOf(toolkit), std::logic_error);
}
