#include "CriteriaReading.h"

#include <Zandor/model/Functions.h>

using namespace zandor;

using model::sql::Dialect;
using platform::fromUtf8;
using platform::String;
using platform::toUtf8;

namespace {

/// Expressions over the table with a column of each type.
class Expressions : public testing::Test, protected AllTypes {
protected:
    /// An expression as a dialect shows it, or its error.
    std::string in(Dialect dialect, const std::string& text) {
        const auto definition = platform::makeRef<model::ColumnDefinition>();
        definition->expression(fromUtf8(text));
        definition->Synonym(u"x");
        query->AddColumnDefinition(definition);
        const auto built =
            model::sql::statementText(*query, dialect, model::sql::ValueForm::literal);
        query->ColumnDefinitions().Remove(definition->Key());
        if (!built.findings.empty()) return toUtf8(built.findings.front().text());
        std::string sql = toUtf8(built.text);
        sql.erase(0, sql.find("    ") + 4);
        return sql.substr(0, std::min(sql.find(" AS x\n"), sql.find(" AS \"x\"\n")));
    }
    std::string shown(const std::string& text) { return in(Dialect::SQLite, text); }
};

constexpr auto lite = Dialect::SQLite;
constexpr auto postgres = Dialect::PostgreSQL;
constexpr auto mysql = Dialect::MySQL;
constexpr auto sqlServer = Dialect::SqlServer;
constexpr auto standard = Dialect::Standard;

} // namespace

TEST_F(Expressions, HoldTogetherAsTheyWereTyped) {
    EXPECT_EQ(shown("whole + number * 2"), "t.whole + t.number * 2");
    EXPECT_EQ(shown("(whole + number) * 2"), "(t.whole + t.number) * 2");
    EXPECT_EQ(shown("whole - (number - 1)"), "t.whole - (t.number - 1)");
    EXPECT_EQ(shown("whole - number - 1"), "t.whole - t.number - 1");
    EXPECT_EQ(shown("whole * (number * 2)"), "t.whole * (t.number * 2)");
    EXPECT_EQ(shown("-whole * -(-number)"), "-(t.whole) * (-(-(t.number)))");
    EXPECT_EQ(shown("-5 - -5"), "-5 - -5");
    EXPECT_EQ(shown("1e-3 - 1E+2 - 1e2"), "1e-3 - 1e+2 - 1e2");
    EXPECT_EQ(shown("1.5 - .5e-3"), "1.5 - 0.5e-3");
    EXPECT_EQ(shown("- -5"), "5");
    EXPECT_EQ(shown("text & whole + 1 & '!'"), "(t.text || CAST(t.whole + 1 AS TEXT)) || '!'");
    EXPECT_EQ(shown("Not whole = 1 Or number = 2 And truth"),
              "NOT (t.whole = 1) OR (t.number = 2 AND t.truth)");
    EXPECT_EQ(shown("(whole > 1) = truth"), "(t.whole > 1) = t.truth");
    EXPECT_EQ(shown("If(truth, 1, 2) + 1"), "CASE WHEN t.truth THEN 1 ELSE 2 END + 1");
    EXPECT_EQ(shown("If(text Is Null, 1, 2)"), "CASE WHEN t.text IS NULL THEN 1 ELSE 2 END");
    EXPECT_EQ(shown("If(text Is Not Null, 1, 2)"),
              "CASE WHEN t.text IS NOT NULL THEN 1 ELSE 2 END");
    EXPECT_EQ(shown("upper(text)"), "UPPER(t.text)");
}

TEST_F(Expressions, NameColumnsInEveryWay) {
    for (const char* text : {"whole", "t.whole", "[whole]", "[t].[whole]", "t.[whole]", "[t].whole",
                             "WHOLE", "T.Whole"})
        EXPECT_EQ(shown(text), "t.whole") << text;
    EXPECT_EQ(shown("whole+number"), "t.whole + t.number");
    EXPECT_EQ(shown("[whole]*2-1"), "t.whole * 2 - 1");
    EXPECT_EQ(shown("t.whole/2"), "CAST(t.whole AS REAL) / 2");
    EXPECT_EQ(shown(":a + 1"), ":a + 1");
    EXPECT_EQ(shown("[How many?] + 1"), ":\"How many?\" + 1");
}

TEST_F(Expressions, KnowTheKindsOfTheirValues) {
    EXPECT_EQ(in(postgres, "on_day > '2024-05-01'"), "t.on_day > DATE '2024-05-01'");
    EXPECT_EQ(in(postgres, "on_day + 1"), "(t.on_day + CAST(1 AS integer))");
    EXPECT_EQ(in(postgres, "1 + on_day"), in(postgres, "on_day + 1"));
    EXPECT_EQ(in(postgres, "on_day - 1"), "(t.on_day + CAST(-1 AS integer))");
    EXPECT_EQ(in(postgres, "moment + 1"), "(t.moment + CAST(1 AS integer) * INTERVAL '1 day')");
    EXPECT_EQ(in(postgres, "moment > on_day"), "t.moment > CAST(t.on_day AS timestamp)");
    EXPECT_EQ(in(postgres, "on_day < moment"), "CAST(t.on_day AS timestamp) < t.moment");
    EXPECT_EQ(in(postgres, "on_day - #2024-01-01#"),
              "(CAST(t.on_day AS date) - CAST(DATE '2024-01-01' AS date))");
    EXPECT_EQ(in(postgres, "Year(anything)"),
              "CAST(EXTRACT(YEAR FROM CAST(t.anything AS timestamp)) AS integer)");
    EXPECT_EQ(in(postgres, "Coalesce(on_day, '2024-05-01')"),
              "COALESCE(t.on_day, DATE '2024-05-01')");
    EXPECT_EQ(in(postgres, "on_day Between '2024-01-01' And moment"),
              "CAST(t.on_day AS timestamp) BETWEEN TIMESTAMP '2024-01-01 00:00:00' AND t.moment");
}

TEST_F(Expressions, AreSaidInEveryDialect) {
    EXPECT_EQ(in(lite, "whole / number"), "CAST(t.whole AS REAL) / t.number");
    EXPECT_EQ(in(postgres, "whole / number"),
              "CAST(t.whole AS double precision) / NULLIF(t.number, 0)");
    EXPECT_EQ(in(mysql, "whole / number"), "t.whole * 1e0 / t.number");
    EXPECT_EQ(in(sqlServer, "whole / 4"), "CAST(t.whole AS float) / 4");
    EXPECT_EQ(in(sqlServer, "whole / 0.0e1"), "CAST(t.whole AS float) / NULLIF(0.0e1, 0)");
    EXPECT_EQ(in(postgres, "whole * whole"), "CAST(t.whole AS bigint) * t.whole");
    EXPECT_EQ(in(postgres, "whole * 2"), "t.whole * 2");
    EXPECT_EQ(in(postgres, "whole * number"), "t.whole * t.number");
    EXPECT_EQ(in(mysql, "text & '!'"), "CONCAT(t.text, '!')");
    EXPECT_EQ(in(sqlServer, "text & whole"), "t.text + CAST(t.whole AS nvarchar(4000))");
    EXPECT_EQ(in(sqlServer, "whole > 1"),
              "CASE WHEN t.whole > 1 THEN 1 WHEN NOT (t.whole > 1) THEN 0 END");
    EXPECT_EQ(in(sqlServer, "If(truth, 1, 2)"), "CASE WHEN t.truth = 1 THEN 1 ELSE 2 END");
    EXPECT_EQ(in(sqlServer, "Length(text)"), "(LEN(t.text + N'.') - 1)");
    EXPECT_EQ(in(standard, "Left(text, 3)"), "SUBSTRING(\"t\".\"text\" FROM 1 FOR 3)");
    EXPECT_EQ(in(standard, "Round(number)"),
              "Standard SQL has nothing that says Round: leave it out, or calculate it from what "
              "was found.");
    EXPECT_EQ(in(postgres, "Left(text, whole)"),
              "LEFT(t.text, CAST(CASE WHEN t.whole < 0 THEN 0 ELSE t.whole END AS integer))");
    EXPECT_EQ(in(lite, "Mid(text, -3, 2)"), "SUBSTR(t.text, 1, 2)");
}

TEST_F(Expressions, HaveNoFunctionThatSomeDialectForgot) {
    const std::map<std::string, std::string> calls = {{"If", "If(truth, 1)"},
                                                      {"Round", "Round(number, 2)"},
                                                      {"Abs", "Abs(number)"},
                                                      {"Length", "Length(text)"},
                                                      {"Upper", "Upper(text)"},
                                                      {"Lower", "Lower(text)"},
                                                      {"Trim", "Trim(text)"},
                                                      {"Left", "Left(text, 1)"},
                                                      {"Right", "Right(text, 1)"},
                                                      {"Mid", "Mid(text, 1, 2)"},
                                                      {"Coalesce", "Coalesce(text, 'x')"},
                                                      {"Year", "Year(on_day)"},
                                                      {"Month", "Month(on_day)"},
                                                      {"Day", "Day(on_day)"},
                                                      {"DateDiff", "DateDiff(on_day, moment)"},
                                                      {"Today", "Today()"},
                                                      {"Now", "Now()"},
                                                      {"Text", "Text(whole)"},
                                                      {"Number", "Number(text)"},
                                                      {"Date", "Date(text)"}};
    EXPECT_EQ(model::criteria::functions().size(), calls.size());
    for (const auto& function : model::criteria::functions()) {
        const std::string name = toUtf8(function.name);
        ASSERT_TRUE(calls.contains(name)) << name;
        for (const Dialect dialect : model::sql::allDialects) {
            const bool unsaid = dialect == standard && (name == "Round" || name == "DateDiff");
            const std::string text = in(dialect, calls.at(name));
            EXPECT_EQ(text.find("has nothing that says") != std::string::npos, unsaid) << text;
            EXPECT_EQ(text.find('{'), std::string::npos) << text;
        }
    }
}

TEST_F(Expressions, SayWhatIsWrongWithThem) {
    const std::pair<const char*, const char*> cases[] = {
        {"whole +", "At character 8: a value is missing"},
        {"whole number", "At character 7: put an operator between two values, such as + or &"},
        {"(whole", "At character 7: a closing ) is missing"},
        {"(whole number)", "At character 8: put an operator between two values, such as + or &"},
        {"text + 1", "At character 6: texts are joined by &"},
        {"truth * 2", "At character 7: a number is needed here"},
        {"-text", "At character 1: a number is needed here"},
        {"on_day + 1.5", "At character 8: a whole number is needed here"},
        {"on_day + 7 / 2", "At character 8: a whole number is needed here"},
        {"1else", "At character 2: put an operator between two values, such as + or &"},
        {"Berlin", "At character 1: the query has no column Berlin, and a text stands in quotes"},
        {"t.Berlin",
         "At character 1: the query has no column t.Berlin, and a text stands in quotes"},
        {"[t].[Berlin]", "At character 1: the query has no column t.Berlin"},
        {"Sqrt(4)", "At character 1: there is no function Sqrt"},
        {"Sum(whole)", "At character 1: a total is no function: write what is to be put together, "
                       "and choose the total of the output column"},
        {"Left(text)", "At character 1: this is written Left(text, characters)"},
        {"Left(text, 1, 2)", "At character 1: this is written Left(text, characters)"},
        {"Left(text, 1.5)", "At character 12: a whole number is needed here"},
        {"Round(number, 16)",
         "At character 15: the number of decimals is needed here, from 0 to 15"},
        {"Round(number, whole)",
         "At character 15: the number of decimals is needed here, from 0 to 15"},
        {"Round(text)", "At character 7: a number is needed here"},
        {"Year(text)", "At character 6: a date is needed here, as in #2024-12-31#"},
        {"Today(1)", "At character 1: this is written Today()"},
        {"If(whole, 1, 2)", "At character 4: a condition is needed here, as in [price] > 5"},
        {"If(truth)", "At character 1: this is written If(condition, then, otherwise)"},
        {"If(truth, 1, 'x')", "At character 14: compare it with a number"},
        {"whole = text", "At character 7: compare it with a number"},
        {"text = Null", "At character 8: nothing is equal to Null, write Is Null for a missing "
                        "value or 'Null' for the word"},
        {"text Like whole", "At character 11: after Like comes a pattern, as in Like 'A*'"},
        {"whole Like 'a*'",
         "At character 7: Like works only on columns that hold text, use =, < or > here"},
        {"whole In 1", "At character 10: after In comes a list in parentheses, as in In (1, 2)"},
        {"whole Between 1", "At character 16: Between needs And and a second value, as in Between "
                            "1 And 5"},
        {"whole ; 1", "At character 7: ; means nothing here"},
        {"text & 'x", "At character 10: a closing ' is missing"},
        {"#Berlin#", "At character 1: only dates and times stand between two #"},
    };
    for (const auto& [text, error] : cases)
        EXPECT_EQ(shown(text), std::string("x: ") + error + ".") << text;
    const std::string deep = std::string(101, '(') + "1" + std::string(101, ')');
    EXPECT_NE(shown(deep).find("this is nested too deep, 100 levels are the most"),
              std::string::npos);
}

TEST_F(Criteria, TakeExpressionsOnBothSides) {
    EXPECT_EQ(condition(u"whole", u"> 2 + 3"), "t.whole > 2 + 3");
    EXPECT_EQ(condition(u"whole", u"5 + 3"), "t.whole = 5 + 3");
    EXPECT_EQ(condition(u"whole", u"-5"), "t.whole = -5");
    EXPECT_EQ(condition(u"whole", u"> [number] * 2"), "t.whole > t.number * 2");
    EXPECT_EQ(condition(u"whole", u"> t.number / 2 And < 9"),
              "t.whole > CAST(t.number AS REAL) / 2 AND t.whole < 9");
    EXPECT_EQ(condition(u"whole", u"[number] > 5"), "t.number > 5");
    EXPECT_EQ(condition(u"whole", u"([number] + 1) * 2 > 5"), "(t.number + 1) * 2 > 5");
    EXPECT_EQ(condition(u"whole", u"(5 Or 7)"), "t.whole = 5 OR t.whole = 7");
    EXPECT_EQ(condition(u"whole", u"(5 + 3)"), "t.whole = 5 + 3");
    EXPECT_EQ(condition(u"whole", u"Not Length([text]) In (1, 2)"),
              "NOT (LENGTH(t.text) IN (1, 2))");
    EXPECT_EQ(condition(u"whole", u"[text] Not Like 'a*' Or 3"),
              "t.text NOT LIKE 'a%' OR t.whole = 3");
    EXPECT_EQ(condition(u"on_day", u"< Today() - 7"),
              "t.on_day < date(date('now', 'localtime'), CAST(-7 AS TEXT) || ' days')");
    EXPECT_EQ(condition(u"moment", u"> Date('2024-05-01')"),
              "t.moment > datetime(date('2024-05-01'))");
    EXPECT_EQ(condition(u"whole", u"> [text]"), "At character 3: compare it with a column that "
                                                "holds a number.");
    EXPECT_EQ(condition(u"whole", u"> [text] & 'x'"), "At character 3: compare it with a number.");
}

TEST_F(Criteria, OfATextKeepTheirWords) {
    EXPECT_EQ(condition(u"text", u"C++"), "t.text = 'C++'");
    EXPECT_EQ(condition(u"text", u"A/B & Co - 5"), "t.text = 'A/B & Co - 5'");
    EXPECT_EQ(condition(u"text", u"Left alone"), "t.text = 'Left alone'");
    EXPECT_EQ(condition(u"text", u"a.b + 1"), "t.text = 'a.b + 1'");
    EXPECT_EQ(condition(u"text", u"[text] & '!'"), "t.text = t.text || '!'");
    EXPECT_EQ(condition(u"text", u"Left([text], 2)"), "t.text = SUBSTR(t.text, 1, 2)");
}
