#include "Reading.h"

#include "model/criteria/QueryColumns.h"
#include "model/criteria/Writer.h"

using namespace zandor;

// Trees as people would type them: what is written reads as the same tree, and is short.

namespace {

class Writing : public testing::Test {
protected:
    Writing() {
        query->addTable({u"",
                         u"t",
                         {{u"n", model::ColumnType::Integer},
                          {u"text", model::ColumnType::Text},
                          {u"day", model::ColumnType::Date},
                          {u"at", model::ColumnType::Timestamp},
                          {u"yes", model::ColumnType::Boolean},
                          {u"bytes", model::ColumnType::Blob},
                          {u"odd ]name", model::ColumnType::Unknown}}});
    }

    std::string expression(platform::StringView typed) const {
        const model::criteria::QueryColumns columns(query->Tables());
        const auto reading = model::criteria::readExpression(typed, columns);
        if (reading.error) return "error: " + platform::toUtf8(reading.error->message.text());
        const auto written = model::criteria::written(reading.value);
        if (!written) return "no words";
        const auto again = model::criteria::readExpression(*written, columns);
        EXPECT_TRUE(model::sql::same(again.value, reading.value)) << platform::toUtf8(*written);
        return platform::toUtf8(*written);
    }

    std::string criterion(platform::StringView column, platform::StringView typed) const {
        const model::criteria::QueryColumns columns(query->Tables());
        const auto table = query->tableNamed(u"t");
        const model::criteria::Subject subject(
            model::criteria::columnRef(*table->columnNamed(column), *table));
        const auto reading = model::criteria::read(typed, subject, columns);
        if (reading.error) return "error: " + platform::toUtf8(reading.error->message.text());
        const auto written = model::criteria::written(reading.condition, subject, columns);
        if (!written) return "no words";
        const auto again = model::criteria::read(*written, subject, columns);
        EXPECT_TRUE(model::sql::same(again.condition, reading.condition))
            << platform::toUtf8(*written);
        return platform::toUtf8(*written);
    }

    const platform::Ref<model::Query> query = platform::makeRef<model::Query>();
};

} // namespace

TEST_F(Writing, PutsParenthesesOnlyWhereTheyAreNeeded) {
    EXPECT_EQ(expression(u"((n * (2)) + 1)"), "t.n * 2 + 1");
    EXPECT_EQ(expression(u"(n + 1) * 2"), "(t.n + 1) * 2");
    EXPECT_EQ(expression(u"n - (1 - 2)"), "t.n - (1 - 2)");
    EXPECT_EQ(expression(u"text & (text & 'x')"), "t.text & (t.text & 'x')");
    EXPECT_EQ(expression(u"(n = 1 Or yes) And Not (n < 5)"), "(t.n = 1 Or t.yes) And Not (t.n < 5)");
    EXPECT_EQ(expression(u"-(n + 1)"), "-(t.n + 1)");
}

TEST_F(Writing, HasAWordForEveryFunction) {
    EXPECT_EQ(expression(u"Round(n, 2) + Abs(n) + Length(text)"),
              "Round(t.n, 2) + Abs(t.n) + Length(t.text)");
    EXPECT_EQ(expression(u"Left(text, 2) & Right(text, 1) & Mid(text, 2, 3) & Upper(Lower(Trim(text)))"),
              "Left(t.text, 2) & Right(t.text, 1) & Mid(t.text, 2, 3) & Upper(Lower(Trim(t.text)))");
    EXPECT_EQ(expression(u"If(yes, 1, If(n > 2, 2))"), "If(t.yes, 1, If(t.n > 2, 2))");
    EXPECT_EQ(expression(u"day + 7 - 2"), "t.day + 7 + -2");
    EXPECT_EQ(expression(u"at - n"), "t.at + -t.n");
    EXPECT_EQ(expression(u"Today() - day"), "DateDiff(t.day, Today())");
    EXPECT_EQ(expression(u"Coalesce(n, Number(text), 0)"), "Coalesce(t.n, Number(t.text), 0)");
    EXPECT_EQ(expression(u"day = at"), "t.day = t.at");
    EXPECT_EQ(expression(u"Year(day) * 100 + Month(Now())"), "Year(t.day) * 100 + Month(Now())");
    EXPECT_EQ(expression(u"n & text"), "Text(t.n) & t.text");
}

TEST_F(Writing, WritesValuesSoThatTheyAreRead) {
    EXPECT_EQ(expression(u"day = '2024-05-01'"), "t.day = #2024-05-01#");
    EXPECT_EQ(expression(u"text = 'O''Brien'"), "t.text = 'O''Brien'");
    EXPECT_EQ(expression(u"bytes = x'0aff'"), "t.bytes = x'0AFF'");
    EXPECT_EQ(expression(u"[odd ]]name] Is Not Null"), "t.[odd ]]name] Is Not Null");
    EXPECT_EQ(expression(u"text Like '100 [%]?*[[]'"), "t.text Like '100 [%]?*[[]'");
    EXPECT_EQ(expression(u"n > :limit And n < [Which one?]"), "t.n > :limit And t.n < [Which one?]");
}

TEST_F(Writing, IsShortInTheCellOfItsColumn) {
    EXPECT_EQ(criterion(u"text", u"= 'New York'"), "New York");
    EXPECT_EQ(criterion(u"text", u"'x And y' Or Like 'A*'"), "'x And y' Or Like A*");
    EXPECT_EQ(criterion(u"text", u"'Null'"), "'Null'");
    EXPECT_EQ(criterion(u"text", u"'#1'"), "'#1'");
    EXPECT_EQ(criterion(u"text", u"''"), "''");
    EXPECT_EQ(criterion(u"text", u"'a*'"), "'a*'") << "without quotes it would look like a pattern";
    EXPECT_EQ(criterion(u"n", u"In (1,2) Or Between 5 And 7"), "In (1, 2) Or Between 5 And 7");
    EXPECT_EQ(criterion(u"n", u"Not (> 5 And < 7)"), "Not (> 5 And < 7)");
    EXPECT_EQ(criterion(u"yes", u"1"), "True");
    EXPECT_EQ(criterion(u"day", u"> #2024-12-31#"), "> 2024-12-31");
    EXPECT_EQ(criterion(u"at", u"2024-12-31"), "2024-12-31 00:00:00");
    EXPECT_EQ(criterion(u"n", u"> [t].[n] * 2"), "> t.n * 2");
    EXPECT_EQ(criterion(u"n", u"Length([t].[text]) < 12 And 5"), "Length(t.text) < 12 And 5");
    EXPECT_EQ(criterion(u"odd ]name", u"'5'"), "'5'") << "a bare one would be a number";
}

TEST_F(Writing, HasParenthesesAroundWhatWouldBeTakenForANumberBelowZero) {
    const model::criteria::QueryColumns columns(query->Tables());
    const auto value = [&](platform::StringView typed) {
        return model::criteria::readExpression(typed, columns).value;
    };
    const model::criteria::Subject subject(value(u"-t.n"), u"below");
    const auto condition = model::sql::make(model::sql::Compare{
        model::sql::Comparison::greater, value(u"-t.n"), value(u"-Length(t.text)")});
    const auto written = model::criteria::written(condition, subject, columns);
    ASSERT_TRUE(written);
    EXPECT_EQ(platform::toUtf8(*written), "> (-Length(t.text))");
}
