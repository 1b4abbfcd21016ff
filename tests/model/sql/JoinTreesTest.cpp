#include <Zandor/Library.h>
#include <Zandor/sql/Builder.h>

#include <gtest/gtest.h>

#include <algorithm>

using namespace zandor;

// Which tree the joins of a drawing become, whatever the tables and joins were added in.

namespace {

using platform::toUtf8;

/// "a>b" left outer, "a<b" right outer, "a=b" normal, "a#b" both outer. Tables are single letters.
struct Drawing {
    std::string tables;
    std::vector<std::string> joins;
};

std::string replaced(std::string text, const std::string& what, const std::string& by) {
    for (std::size_t at; (at = text.find(what)) != std::string::npos;)
        text.replace(at, what.size(), by);
    return text;
}

/// The FROM of a drawing in short: "a > b" for a LEFT JOIN b, conditions by their tables.
std::string from(const Drawing& drawing, model::Findings* findings = nullptr) {
    const auto query = platform::makeRef<model::Query>();
    model::Library library;
    const auto table = [&](char name) {
        return query->tableNamed(platform::String(1, static_cast<char16_t>(name)));
    };
    for (const char name : drawing.tables)
        query->addTable({u"",
                         platform::String(1, static_cast<char16_t>(name)),
                         {{u"x", model::ColumnType::Integer}}});
    for (const std::string& drawn : drawing.joins) {
        const auto join = library.NewZDJoin();
        join->LeftColumn(table(drawn[0])->columnNamed(u"x"));
        join->RightColumn(table(drawn[2])->columnNamed(u"x"));
        join->JoinType(static_cast<std::int16_t>(std::string("=><#").find(drawn[1])));
        query->AddJoin(join);
    }
    const auto text = model::sql::statementText(*query, model::sql::Dialect::SQLite,
                                                model::sql::ValueForm::literal);
    if (findings) *findings = text.findings;
    std::string sql = toUtf8(text.text);
    sql.erase(0, sql.find("FROM ") + 5);
    const std::pair<const char*, const char*> shorter[] = {
        {".x = ", ""},       {".x", ""},         {"\n", " "},         {"  ", " "},
        {"( ", "("},         {" )", ")"},        {"INNER JOIN", "="}, {"LEFT JOIN", ">"},
        {"RIGHT JOIN", "<"}, {"FULL JOIN", "#"}, {"CROSS JOIN", "*"}, {" ON ", " on "}};
    for (const auto& [what, by] : shorter) sql = replaced(sql, what, by);
    return sql;
}

} // namespace

TEST(JoinsBetweenTwoTables, StandInOneOnWithTheirTypesKind) {
    EXPECT_EQ(from({"ab", {"a=b"}}), "a = b on ab");
    EXPECT_EQ(from({"ab", {"a>b"}}), "a > b on ab");
    EXPECT_EQ(from({"ab", {"a#b"}}), "a # b on ab");
    EXPECT_EQ(from({"ab", {"a=b", "b=a"}}), "a = b on ab AND ba");
    EXPECT_EQ(from({"ab", {"a>b", "b<a"}}), "a > b on ab AND ba");
}

TEST(JoinsBetweenTwoTables, KeepTheSideThatWasDrawnInWhateverOrderTablesWereAdded) {
    for (const char* tables : {"ab", "ba"}) {
        EXPECT_EQ(from({tables, {"a>b"}}), "a > b on ab");
        EXPECT_EQ(from({tables, {"a<b"}}), "b > a on ab");
        EXPECT_EQ(from({tables, {"b<a"}}), "a > b on ba");
    }
}

TEST(JoinsBetweenTwoTables, TakeAnOuterJoinBesideANormalOneAsNormal) {
    model::Findings findings;
    EXPECT_EQ(from({"ab", {"a>b", "a=b"}}, &findings), "a = b on ab AND ab");
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_EQ(findings[0].join, u"j1");
}

TEST(JoinsBetweenTwoTables, FollowTheFirstDrawnWhenTheyContradict) {
    model::Findings findings;
    EXPECT_EQ(from({"ab", {"a>b", "a<b"}}, &findings), "a > b on ab AND ab");
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_EQ(findings[0].join, u"j2");
    EXPECT_EQ(from({"ab", {"a<b", "a>b"}}), "a < b on ab AND ab");
    EXPECT_EQ(from({"ab", {"a#b", "a>b"}}), "a # b on ab AND ab");
}

TEST(InnerJoins, AddEachTableAsSoonAsAJoinReachesIt) {
    EXPECT_EQ(from({"abc", {"a=b", "b=c"}}), "a = b on ab = c on bc");
    EXPECT_EQ(from({"acb", {"a=b", "b=c"}}), "a = b on ab = c on bc");
    EXPECT_EQ(from({"abcd", {"c=d", "a=d", "b=c"}}), "a = d on ad = c on cd = b on bc");
}

TEST(InnerJoins, CloseACycleInTheOnThatSeesAllOfIt) {
    EXPECT_EQ(from({"abc", {"a=b", "b=c", "c=a"}}), "a = b on ab = c on bc AND ca");
    EXPECT_EQ(from({"abcd", {"a=b", "b=c", "c=d", "d=a"}}),
              "a = b on ab = c on bc = d on cd AND da");
    EXPECT_EQ(from({"abcd", {"a=b", "c=d", "b=d", "a=c", "a=d"}}),
              "a = b on ab = c on ac = d on cd AND bd AND ad");
}

TEST(InnerJoins, LetATableInWhichAnOuterJoinReachesFirst) {
    EXPECT_EQ(from({"abc", {"a>b", "b=c", "c=a"}}), "a = c on ca = b on ab AND bc");
}

TEST(OuterJoins, FollowEachOtherInAChain) {
    EXPECT_EQ(from({"abc", {"a>b", "b>c"}}), "a > b on ab > c on bc");
    EXPECT_EQ(from({"cba", {"b>c", "a>b"}}), "a > b on ab > c on bc");
    EXPECT_EQ(from({"bca", {"b>c", "b<a"}}), "a > b on ba > c on bc");
}

TEST(OuterJoins, ComeInTheOrderOfDrawingWhenItDoesNotMatter) {
    EXPECT_EQ(from({"abc", {"a>c", "a>b"}}), "a > c on ac > b on ab");
    EXPECT_EQ(from({"abc", {"a#b", "a>c"}}), "a > c on ac # b on ab");
    EXPECT_EQ(from({"abcd", {"a#b", "b#c", "c#d"}}), "a # b on ab # c on bc # d on cd");
}

TEST(OuterJoins, TakeAnInnerGroupAsOneInParentheses) {
    EXPECT_EQ(from({"abc", {"a>b", "b=c"}}), "a > (b = c on bc) on ab");
    EXPECT_EQ(from({"abc", {"b=c", "a>c"}}), "a > (b = c on bc) on ac");
    EXPECT_EQ(from({"abc", {"a=b", "b>c"}}), "a = b on ab > c on bc");
    EXPECT_EQ(from({"abcd", {"a=b", "c=d", "b#c"}}), "a = b on ab # (c = d on cd) on bc");
    EXPECT_EQ(from({"bca", {"b=c", "a>b"}}), "a > (b = c on bc) on ab");
}

TEST(OuterJoins, OfOneGroupToTwoTablesOfAnotherShareTheOn) {
    EXPECT_EQ(from({"abc", {"b=c", "a>b", "a>c"}}), "a > (b = c on bc) on ab AND ac");
}

TEST(OuterJoins, WaitForAllThatATableIsFilledFrom) {
    model::Findings findings;
    EXPECT_EQ(from({"abc", {"a>c", "b>c", "a>b"}}, &findings), "a > b on ab > c on ac AND bc");
    EXPECT_TRUE(findings.empty());
}

TEST(OuterJoins, ThatFillOneTableFromTwoSidesAreAmbiguous) {
    model::Findings findings;
    EXPECT_EQ(from({"abc", {"a>b", "c>b"}}, &findings), "a > b on ab < c on cb");
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_EQ(findings[0].join, u"j2");
    from({"abc", {"a>b", "b#c"}}, &findings);
    EXPECT_EQ(findings.size(), 1u);
    from({"abc", {"a#b", "c>b"}}, &findings);
    EXPECT_EQ(findings.size(), 1u);
}

TEST(OuterJoins, ThatReadOneWayOnlyAreNotAmbiguous) {
    for (const auto& joins : std::vector<std::vector<std::string>>{{"a>b", "b>c"},
                                                                   {"a>b", "a>c"},
                                                                   {"a#b", "b#c"},
                                                                   {"a#b", "b>c"},
                                                                   {"a#b", "a>c"},
                                                                   {"a>b", "b=c"},
                                                                   {"a#b", "b=c"},
                                                                   {"a<b", "b>c"},
                                                                   {"a<b", "b<c"}}) {
        for (std::string tables : {"abc", "acb", "bac", "bca", "cab", "cba"}) {
            model::Findings findings;
            from({tables, joins}, &findings);
            EXPECT_TRUE(findings.empty()) << tables << ' ' << joins[0] << ' ' << joins[1] << ": "
                                          << toUtf8(findings[0].text());
        }
    }
}

TEST(OuterJoins, ThatFillTheFirstTableLeaveNothingOpenAlone) {
    model::Findings findings;
    EXPECT_EQ(from({"abc", {"b>a", "b>c", "c>b"}}, &findings), "a < b on ba > c on bc AND cb");
    ASSERT_EQ(findings.size(), 1u) << "that b and c contradict each other";
    EXPECT_EQ(findings[0].join, u"j3");
}

TEST(OuterJoins, InACircleOfFillingBeginAtTheFirstTable) {
    model::Findings findings;
    EXPECT_EQ(from({"abc", {"a>b", "b>c", "c>a"}}, &findings), "a > b on ab > c on bc AND ca");
    ASSERT_EQ(findings.size(), 1u);
    EXPECT_EQ(findings[0].join, u"j3");
}

TEST(Islands, AreCrossedInTheOrderOfTheirFirstTables) {
    EXPECT_EQ(from({"abcd", {"b=d"}}), "a * (b = d on bd) * c");
    EXPECT_EQ(from({"abcd", {"c>a", "b#d"}}), "c > a on ca * (b # d on bd)");
    EXPECT_EQ(from({"abc", {}}), "a * b * c");
}

TEST(AJoinWithinOneTable, ChoosesAmongItsRowsBeforeOuterJoinsDo) {
    EXPECT_EQ(from({"a", {"a=a"}}), "a WHERE aa");
    EXPECT_EQ(from({"ab", {"a>b", "b=b"}}), "a > b on ab AND bb");
    EXPECT_EQ(from({"ab", {"a>b", "a=a"}}), "a > b on ab WHERE aa");
    EXPECT_EQ(from({"abc", {"a>b", "b=c", "b=b", "c=c"}}), "a > (b = c on bc AND bb AND cc) on ab");
}
