#include "CriteriaReading.h"

using namespace zandor;

// Every way to go wrong says where, counting from 0, and what was expected.

namespace {

class ABadCriterion : public Criteria {
protected:
    void expectError(platform::StringView column, platform::StringView text, std::size_t position,
                     const std::string& what) const {
        const auto reading = read(column, text);
        ASSERT_TRUE(reading.error.has_value()) << platform::toUtf8(text);
        EXPECT_FALSE(reading.condition);
        EXPECT_EQ(reading.error->position, position) << platform::toUtf8(text);
        EXPECT_EQ(platform::toUtf8(reading.error->message.text()), what);
    }
};

} // namespace

TEST_F(ABadCriterion, LacksAValue) {
    expectError(u"whole", u">", 1, "a number is missing");
    expectError(u"text", u"= ", 2, "a text is missing");
    expectError(u"whole", u"1 Or", 4, "a number is missing");
    expectError(u"whole", u"1 And And 2", 6, "a number is missing");
    expectError(u"whole", u"Not", 3, "a number is missing");
    expectError(u"whole", u"()", 1, "a number is missing");
    expectError(u"whole", u"> > 1", 2, "a number is missing");
    expectError(u"whole", u"Or 1", 0, "a number is missing");
    expectError(u"whole", u", 1", 0, "a number is missing");
}

TEST_F(ABadCriterion, HasSomethingBehindItsEnd) {
    expectError(u"whole", u"1) ", 1,
                "put And or Or between two conditions, or quotes around a text");
    expectError(u"text", u"a 'b'", 2,
                "put And or Or between two conditions, or quotes around a text");
    expectError(u"text", u"'a' b", 4,
                "put And or Or between two conditions, or quotes around a text");
    expectError(u"text", u"'a' 'or' 'b'", 4,
                "put And or Or between two conditions, or quotes around a text");
    expectError(u"text", u"[text] .x", 7,
                "put And or Or between two conditions, or quotes around a text");
    expectError(u"text", u"Smith, John", 5,
                "put And or Or between two conditions, or quotes around a text");
    expectError(u"text", u"a=b", 1,
                "put And or Or between two conditions, or quotes around a text");
    expectError(u"text", u"Is Null x", 8,
                "put And or Or between two conditions, or quotes around a text");
}

TEST_F(ABadCriterion, LeavesSomethingOpen) {
    expectError(u"whole", u"(1", 2, "a closing ) is missing");
    expectError(u"whole", u"((1) Or 2", 9, "a closing ) is missing");
    expectError(u"text", u"'a", 2, "a closing ' is missing");
    expectError(u"text", u"'a''", 4, "a closing ' is missing");
    expectError(u"text", u"a Or \"b", 7, "a closing \" is missing");
    expectError(u"text", u"[a", 2, "a closing ] is missing");
    expectError(u"on_day", u"#2024-01-01", 11, "a closing # is missing");
    expectError(u"whole", u"In (1, 2", 8, "a comma or a closing ) is missing");
    expectError(u"whole", u"In (1 2)", 4, "this is no number, write it like 12 or 1.5");
    expectError(u"text", u"a]", 1, "a [ before this ] is missing");
}

TEST_F(ABadCriterion, BreaksOffWithinAKeywordsForm) {
    expectError(u"whole", u"Between 1", 9,
                "Between needs And and a second value, as in Between 1 And 5");
    expectError(u"whole", u"Between 1 Or 2", 10,
                "Between needs And and a second value, as in Between 1 And 5");
    expectError(u"whole", u"Between And 2", 8, "a number is missing");
    expectError(u"whole", u"Between 1 And", 13, "a number is missing");
    expectError(u"whole", u"In ()", 4, "a number is missing");
    expectError(u"whole", u"In (1,)", 6, "a number is missing");
    expectError(u"text", u"Not In a", 7, "after In comes a list in parentheses, as in In (1, 2)");
    expectError(u"text", u"Is", 2,
                "after Is comes Null or Not Null, and a text that begins so needs quotes");
    expectError(u"text", u"Is Not", 6,
                "after Is comes Null or Not Null, and a text that begins so needs quotes");
    expectError(u"text", u"Is land", 3,
                "after Is comes Null or Not Null, and a text that begins so needs quotes");
    expectError(u"text", u"Like", 4, "after Like comes a pattern, as in Like 'A*'");
    expectError(u"text", u"Like Or a", 5, "after Like comes a pattern, as in Like 'A*'");
}

TEST_F(ABadCriterion, ComparesWithNull) {
    const std::string what =
        "nothing is equal to Null, write Is Null for a missing value or 'Null' for the word";
    expectError(u"text", u"Null", 0, what);
    expectError(u"text", u"= null", 2, what);
    expectError(u"whole", u"<> NULL", 3, what);
    expectError(u"text", u"In (a, Null)", 7, what);
}

TEST_F(ABadCriterion, UsesAnOperatorOfAnotherLanguage) {
    expectError(u"whole", u"!= 1", 0, "write <> for unequal");
    expectError(u"text", u"a!b", 1, "write <> for unequal");
    expectError(u"whole", u"== 1", 1, "a number is missing");
    expectError(u"whole", u"=> 1", 1, "a number is missing");
}

TEST_F(ABadCriterion, UsesAPatternWhereThereIsNoText) {
    expectError(u"whole", u"1 Or Like '1*'", 5,
                "Like works only on columns that hold text, use =, < or > here");
    expectError(u"text", u"Like [t].[text]", 5,
                "after Like comes a pattern, as in Like 'A*', not a column");
    expectError(u"text", u"Like [text]", 5,
                "after Like comes a pattern, as in Like 'A*', not a column");
}

TEST_F(ABadCriterion, NamesAColumnThatCannotBeMeant) {
    expectError(u"whole", u"= [t].[nothing]", 2, "the query has no column t.nothing");
    expectError(u"whole", u"[x].whole", 0, "the query has no column x.whole");
    expectError(u"whole", u"[t].", 4, "the name of a column is missing behind the point");
    expectError(u"whole", u"[t].'x'", 4, "the name of a column is missing behind the point");
    expectError(u"whole", u"t.text", 0, "compare it with a column that holds a number");
    expectError(u"text", u"[]", 1, "a name is missing between the brackets");
}

TEST_F(ABadCriterion, NamesAColumnThatSeveralTablesHave) {
    query->addTable(described(u"u"));
    expectError(u"whole", u"1 Or [number]", 5,
                "several tables have this column, write the table too, as in [t].[number]");
}

TEST_F(ABadCriterion, HasACharacterThatNoTextCarries) {
    using namespace std::string_literals;
    const std::string half = "half a character stands here, type it afresh";
    expectError(u"text", u"a\0b"s, 1, "the character zero cannot stand here");
    expectError(u"text", u"'a\xD83D'"s, 2, half);
    expectError(u"text", u"\xDE00"s, 0, half);
    expectError(u"text", u"😀\xD83D"s, 2, half);
    expectError(u"text", u"\xD83D\xD83D\xDE00"s, 0, half);
}

TEST_F(ABadCriterion, IsTooLong) {
    const platform::String longest(10000, u'a');
    EXPECT_FALSE(read(u"text", longest).error);
    expectError(u"text", longest + u"a", 10000, "at most 10000 characters can stand here");
}

TEST_F(ABadCriterion, IsNestedTooDeep) {
    const auto nested = [](std::size_t depth) {
        return platform::String(depth, u'(') + u"1" + platform::String(depth, u')');
    };
    EXPECT_EQ(condition(u"whole", nested(100)), "t.whole = 1");
    expectError(u"whole", nested(101), 100, "this is nested too deep, 100 levels are the most");
    platform::String nots;
    for (int i = 0; i < 101; ++i) nots += u"Not ";
    expectError(u"whole", nots + u"1", 400, "this is nested too deep, 100 levels are the most");
    expectError(u"whole", platform::String(10000, u'('), 100,
                "this is nested too deep, 100 levels are the most");
}
