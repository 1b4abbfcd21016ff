#include "CriteriaReading.h"

using namespace zandor;

// Comparisons, their joining, columns and parameters.

namespace {
class ACondition : public Criteria {};
} // namespace

TEST_F(ACondition, IsNoneWhenTheTextIsBlank) {
    EXPECT_EQ(condition(u"text", u""), "blank");
    EXPECT_EQ(condition(u"text", u" \t\r\n\u00A0\u2003\u3000"), "blank");
}

TEST_F(ACondition, TakesEachOfTheSixComparisons) {
    EXPECT_EQ(condition(u"whole", u"= 1"), "t.whole = 1");
    EXPECT_EQ(condition(u"whole", u"<>1"), "t.whole <> 1");
    EXPECT_EQ(condition(u"whole", u"< 1"), "t.whole < 1");
    EXPECT_EQ(condition(u"whole", u">1"), "t.whole > 1");
    EXPECT_EQ(condition(u"whole", u"<= 1"), "t.whole <= 1");
    EXPECT_EQ(condition(u"whole", u">=1"), "t.whole >= 1");
    EXPECT_EQ(condition(u"whole", u"= -1"), "t.whole = -1");
}

TEST_F(ACondition, ReadsItsKeywordsInAnyCase) {
    EXPECT_EQ(condition(u"whole", u"BETWEEN 1 aNd 2"), "t.whole BETWEEN 1 AND 2");
    EXPECT_EQ(condition(u"text", u"iS nOt NULL"), "t.text IS NOT NULL");
    EXPECT_EQ(condition(u"text", u"not LIKE 'a' oR in ('b')"),
              "t.text NOT LIKE 'a' OR t.text IN ('b')");
}

TEST_F(ACondition, BindsNotBeforeAndBeforeOr) {
    EXPECT_EQ(condition(u"whole", u"1 Or 2 And 3"), "t.whole = 1 OR (t.whole = 2 AND t.whole = 3)");
    EXPECT_EQ(condition(u"whole", u"1 And 2 Or 3"), "(t.whole = 1 AND t.whole = 2) OR t.whole = 3");
    EXPECT_EQ(condition(u"whole", u"(1 Or 2) And 3"),
              "(t.whole = 1 OR t.whole = 2) AND t.whole = 3");
    EXPECT_EQ(condition(u"whole", u"Not 1 And 2"), "NOT (t.whole = 1) AND t.whole = 2");
    EXPECT_EQ(condition(u"whole", u"Not (1 And 2)"), "NOT (t.whole = 1 AND t.whole = 2)");
    EXPECT_EQ(condition(u"whole", u"Not 1 Or 2"), "NOT (t.whole = 1) OR t.whole = 2");
    EXPECT_EQ(condition(u"whole", u"1 And (2 And (3 And 4))"),
              "t.whole = 1 AND t.whole = 2 AND t.whole = 3 AND t.whole = 4");
    EXPECT_EQ(condition(u"whole", u"Between 1 And 2 And 3 Or 4"),
              "(t.whole BETWEEN 1 AND 2 AND t.whole = 3) OR t.whole = 4");
}

TEST_F(ACondition, MayBeBetweenTwoValues) {
    EXPECT_EQ(condition(u"text", u"Between A b And C d"), "t.text BETWEEN 'A b' AND 'C d'");
    EXPECT_EQ(condition(u"on_day", u"Not Between 2024-01-01 And #2024-12-31#"),
              "t.on_day NOT BETWEEN '2024-01-01' AND '2024-12-31'");
    EXPECT_EQ(condition(u"whole", u"Between [low] And t.number"),
              "t.whole BETWEEN :low AND t.number");
}

TEST_F(ACondition, MayBeOneOfAList) {
    EXPECT_EQ(condition(u"text", u"In (New York,'a,b', \"c\" , :p, [t].[text])"),
              "t.text IN ('New York', 'a,b', 'c', :p, t.text)");
    EXPECT_EQ(condition(u"whole", u"Not In(1)"), "t.whole NOT IN (1)");
    EXPECT_EQ(condition(u"text", u"In between"), "t.text = 'In between'");
}

TEST_F(ACondition, MayBeAPattern) {
    EXPECT_EQ(condition(u"text", u"Like A*"), "t.text LIKE 'A%'");
    EXPECT_EQ(condition(u"text", u"Like '?_*%'"), "t.text LIKE '__%%'");
    EXPECT_EQ(condition(u"text", u"Not Like *x y*"), "t.text NOT LIKE '%x y%'");
    EXPECT_EQ(condition(u"text", u"Like 'a[*][?][[]'"), "t.text LIKE 'a*?['");
    EXPECT_EQ(condition(u"text", u"Like '[%][_]'"), "t.text LIKE '\\%\\_' ESCAPE '\\'");
    EXPECT_EQ(condition(u"text", u"Like a[*]b[%]"), "t.text LIKE 'a*b\\%' ESCAPE '\\'");
    EXPECT_EQ(condition(u"text", u"Like x[*].[%]"), "t.text LIKE 'x*.\\%' ESCAPE '\\'");
    EXPECT_EQ(condition(u"text", u"Like '\\'"), "t.text LIKE '\\\\' ESCAPE '\\'");
    EXPECT_EQ(condition(u"text", u"Like '[x] [] ['"), "t.text LIKE '[x] [] ['");
    EXPECT_EQ(condition(u"text", u"Like ''"), "t.text LIKE ''");
    EXPECT_EQ(condition(u"anything", u"Like 4*"), "t.anything LIKE '4%'");
    EXPECT_EQ(condition(u"text", u"Like [the pattern]"),
              "t.text LIKE :\"the pattern\" ESCAPE '\\'");
}

TEST_F(ACondition, MayAskForAPatternWhichIsMarkedAsOne) {
    const auto reading = read(u"text", u"Like :p Or :q");
    const auto& either = std::get<model::sql::Or>(reading.condition->node);
    const auto& like = std::get<model::sql::Like>(either.terms[0]->node);
    const auto& compare = std::get<model::sql::Compare>(either.terms[1]->node);
    EXPECT_EQ(std::get<model::sql::Parameter>(like.pattern->node),
              (model::sql::Parameter{u"p", model::ColumnType::Text, true}));
    EXPECT_EQ(std::get<model::sql::Parameter>(compare.right->node),
              (model::sql::Parameter{u"q", model::ColumnType::Text, false}));
}

TEST_F(ACondition, MayBeOfNothing) {
    EXPECT_EQ(condition(u"whole", u"Is Null"), "t.whole IS NULL");
    EXPECT_EQ(condition(u"whole", u"Not Is Null"), "NOT (t.whole IS NULL)");
    EXPECT_EQ(condition(u"text", u"'Null'"), "t.text = 'Null'");
    EXPECT_EQ(condition(u"text", u"Nullarbor"), "t.text = 'Nullarbor'");
}

TEST_F(ACondition, MayNameAColumnInAnyMixOfBracketsAndCases) {
    for (const auto* text : {u"t.number", u"[t].[number]", u"t.[number]", u"[t].number",
                             u"T.NUMBER", u"[number]", u"= [Number]"})
        EXPECT_EQ(condition(u"whole", text), "t.whole = t.number") << platform::toUtf8(text);
}

TEST_F(ACondition, TakesABareNameThatIsNoColumnAsWhatTheColumnHolds) {
    EXPECT_EQ(condition(u"text", u"t.nothing"), "t.text = 't.nothing'");
    EXPECT_EQ(condition(u"whole", u"t.nothing"),
              "At character 1: this is no number, write it like 12 or 1.5.");
    EXPECT_EQ(condition(u"text", u"number"), "t.text = 'number'");
}

TEST_F(ACondition, IsNeverMisledByATableThatIsNamedLikeANumber) {
    query->addTable({u"", u"1", {{u"5", model::ColumnType::Decimal}}});
    EXPECT_EQ(condition(u"number", u"1.5"), "t.number = 1.5");
    EXPECT_EQ(condition(u"number", u"[1].[5]"), "t.number = \"1\".\"5\"");
}

TEST_F(ACondition, ReachesAColumnWhoseNameHasBracketsAndDots) {
    query->addTable({u"", u"a.b ]c", {{u"[x].y", model::ColumnType::Text}}});
    EXPECT_EQ(condition(u"text", u"[a.b ]]c].[[x]].y]"), "t.text = \"a.b ]c\".\"[x].y\"");
}

TEST_F(ACondition, AsksForWhatIsNoColumn) {
    EXPECT_EQ(condition(u"text", u"[Which one?]"), "t.text = :\"Which one?\"");
    EXPECT_EQ(condition(u"text", u":name_1"), "t.text = :name_1");
    EXPECT_EQ(condition(u"whole", u"> [How many]"), "t.whole > :\"How many\"");
    const auto reading = read(u"on_day", u"[When]");
    const auto& compare = std::get<model::sql::Compare>(reading.condition->node);
    EXPECT_EQ(std::get<model::sql::Parameter>(compare.right->node),
              (model::sql::Parameter{u"When", model::ColumnType::Date, false}));
}

TEST_F(ACondition, TakesAColonThatBeginsNoNameAsText) {
    EXPECT_EQ(condition(u"text", u":)"),
              "At character 2: put And or Or between two conditions, or quotes around a text.");
    EXPECT_EQ(condition(u"text", u":-|"), "t.text = ':-|'");
    EXPECT_EQ(condition(u"text", u":"), "t.text = ':'");
    EXPECT_EQ(condition(u"whole", u":1"), "At character 2: a parameter needs a name, as in :year.");
}
