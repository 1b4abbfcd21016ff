#include "CriteriaReading.h"

// Every way to go wrong says where, counting from 1, and what was expected; the position that goes
// with it counts from 0.

namespace {

class ABadCriterion : public Criteria {
protected:
    void expectError(platform::StringView column, platform::StringView text, std::size_t position,
                     const std::string& what) const {
        const auto reading = read(column, text);
        ASSERT_TRUE(reading.error.has_value()) << platform::toUtf8(text);
        EXPECT_FALSE(reading.condition);
        EXPECT_EQ(reading.error->position, position) << platform::toUtf8(text);
        EXPECT_EQ(platform::toUtf8(reading.error->message),
                  "At character " + std::to_string(position + 1) + ": " + what + ".");
    }
};

} // namespace

TEST_F(ABadCriterion, LacksAValue) {
    expectError(u"whole", u">", 1, "expected a number");
    expectError(u"text", u"= ", 2, "expected a text");
    expectError(u"whole", u"1 Or", 4, "expected a number");
    expectError(u"whole", u"1 And And 2", 6, "expected a number");
    expectError(u"whole", u"Not", 3, "expected a number");
    expectError(u"whole", u"()", 1, "expected a number");
    expectError(u"whole", u"> > 1", 2, "expected a number");
    expectError(u"whole", u"Or 1", 0, "expected a number");
    expectError(u"whole", u", 1", 0, "expected a number");
}

TEST_F(ABadCriterion, HasSomethingBehindItsEnd) {
    expectError(u"whole", u"1) ", 1, "expected And, Or or the end");
    expectError(u"text", u"a 'b'", 2, "expected And, Or or the end");
    expectError(u"text", u"'a' b", 4, "expected And, Or or the end");
    expectError(u"text", u"Smith, John", 5, "expected And, Or or the end");
    expectError(u"text", u"a=b", 1, "expected And, Or or the end");
    expectError(u"text", u"Is Null x", 8, "expected And, Or or the end");
}

TEST_F(ABadCriterion, LeavesSomethingOpen) {
    expectError(u"whole", u"(1", 2, "expected a closing )");
    expectError(u"whole", u"((1) Or 2", 9, "expected a closing )");
    expectError(u"text", u"'a", 2, "expected a closing '");
    expectError(u"text", u"'a''", 4, "expected a closing '");
    expectError(u"text", u"a Or \"b", 7, "expected a closing \"");
    expectError(u"text", u"[a", 2, "expected a closing ]");
    expectError(u"on_day", u"#2024-01-01", 11, "expected a closing #");
    expectError(u"whole", u"In (1, 2", 8, "expected a comma or a closing )");
    expectError(u"whole", u"In (1 2)", 4, "expected a number");
    expectError(u"text", u"a]", 1, "expected a [ before this ]");
}

TEST_F(ABadCriterion, BreaksOffWithinAKeywordsForm) {
    expectError(u"whole", u"Between 1", 9, "expected And and the upper value");
    expectError(u"whole", u"Between 1 Or 2", 10, "expected And and the upper value");
    expectError(u"whole", u"Between And 2", 8, "expected a number");
    expectError(u"whole", u"Between 1 And", 13, "expected a number");
    expectError(u"whole", u"In ()", 4, "expected a number");
    expectError(u"whole", u"In (1,)", 6, "expected a number");
    expectError(u"text", u"Not In a", 7, "expected ( after In");
    expectError(u"text", u"Is", 2, "expected Null, a text that begins so needs quotes");
    expectError(u"text", u"Is Not", 6, "expected Null, a text that begins so needs quotes");
    expectError(u"text", u"Is land", 3, "expected Null, a text that begins so needs quotes");
    expectError(u"text", u"Like", 4, "expected a pattern, as in Like 'A*'");
    expectError(u"text", u"Like Or a", 5, "expected a pattern, as in Like 'A*'");
}

TEST_F(ABadCriterion, ComparesWithNull) {
    const std::string what =
        "expected a value, write Is Null for a missing one or 'Null' for the word";
    expectError(u"text", u"Null", 0, what);
    expectError(u"text", u"= null", 2, what);
    expectError(u"whole", u"<> NULL", 3, what);
    expectError(u"text", u"In (a, Null)", 7, what);
}

TEST_F(ABadCriterion, UsesAnOperatorOfAnotherLanguage) {
    expectError(u"whole", u"!= 1", 0, "expected an operator, write <> for unequal");
    expectError(u"whole", u"== 1", 1, "expected a number");
    expectError(u"whole", u"=> 1", 1, "expected a number");
}

TEST_F(ABadCriterion, UsesAPatternWhereThereIsNoText) {
    expectError(u"whole", u"1 Or Like '1*'", 5,
                "expected a comparison, Like works on columns that hold text");
    expectError(u"text", u"Like [t].[text]", 5,
                "expected a pattern, as in Like 'A*', not a column");
    expectError(u"text", u"Like [text]", 5, "expected a pattern, as in Like 'A*', not a column");
}

TEST_F(ABadCriterion, NamesAColumnThatCannotBeMeant) {
    expectError(u"whole", u"= [t].[nothing]", 2,
                "expected a column of the query, there is no t.nothing");
    expectError(u"whole", u"[x].whole", 0, "expected a column of the query, there is no x.whole");
    expectError(u"whole", u"[t].", 4, "expected the column's name");
    expectError(u"whole", u"[t].'x'", 4, "expected the column's name");
    expectError(u"whole", u"t.text", 0, "expected a column that holds a number");
    expectError(u"text", u"[]", 1, "expected a name between the brackets");
}

TEST_F(ABadCriterion, NamesAColumnThatSeveralTablesHave) {
    query->addTable(described(u"u"));
    expectError(u"whole", u"1 Or [number]", 5,
                "expected the table too, as in [t].[number], several tables have this column");
}

TEST_F(ABadCriterion, HasACharacterThatNoTextCarries) {
    using namespace std::string_literals;
    const std::string half = "expected a character, found half of one";
    expectError(u"text", u"a\0b"s, 1, "expected a character, found the character zero");
    expectError(u"text", u"'a\xD83D'"s, 2, half);
    expectError(u"text", u"\xDE00"s, 0, half);
    expectError(u"text", u"😀\xD83D"s, 2, half);
    expectError(u"text", u"\xD83D\xD83D\xDE00"s, 0, half);
}

TEST_F(ABadCriterion, IsTooLong) {
    const platform::String longest(10000, u'a');
    EXPECT_FALSE(read(u"text", longest).error);
    expectError(u"text", longest + u"a", 10000,
                "expected the end, a criterion has at most 10000 characters");
}

TEST_F(ABadCriterion, IsNestedTooDeep) {
    const auto nested = [](std::size_t depth) {
        return platform::String(depth, u'(') + u"1" + platform::String(depth, u')');
    };
    EXPECT_EQ(condition(u"whole", nested(100)), "t.whole = 1");
    expectError(u"whole", nested(101), 100, "expected less nesting, 100 levels are the most");
    platform::String nots;
    for (int i = 0; i < 101; ++i) nots += u"Not ";
    expectError(u"whole", nots + u"1", 400, "expected less nesting, 100 levels are the most");
    expectError(u"whole", platform::String(10000, u'('), 100,
                "expected less nesting, 100 levels are the most");
}
