#include "Reading.h"

// What takes each with each, or each way through a tree, would never end here.

namespace {

std::u16string number(int value) { return zandor::platform::decimal(value); }

/// `count` texts, with `between` two.
std::u16string list(int count, zandor::platform::StringView between, auto each) {
    std::u16string all;
    for (int n = 0; n < count; ++n) {
        if (n > 0) all += between;
        all += each(n);
    }
    return all;
}

} // namespace

using LargeStatements = Reading;

TEST_F(LargeStatements, OfThousandsOfGroupsThatDoNotComeOutAreRead) {
    read(u"SELECT id FROM orders GROUP BY " +
         list(4'000, u", ", [](int n) { return u"id + " + number(n); }) + u", id");
    ASSERT_EQ(record.definitions.size(), 4'001U);
    EXPECT_EQ(column(1), "(group(orders.id + 0))");
    EXPECT_EQ(column(4'000), "(group(orders.id + 3999))");
    EXPECT_EQ(column(4'001), "group(orders.id)");
}

TEST_F(LargeStatements, OfThousandsOfConditionsWithACommentEachAreRead) {
    read(u"SELECT id FROM orders WHERE " + list(3'000, u" AND", [](int n) {
             return u"\n--" + number(n) + u"\n(id + " + number(n) + u") <> 7";
         }));
    EXPECT_EQ(record.definitions.size(), 3'001U);
    EXPECT_EQ(record.options.comments.size(), 3'000U);
}

TEST_F(LargeStatements, OfThousandsOfConditionsOnOneColumnAreRefusedWhereTheyDoNotFit) {
    for (const char16_t* word : {u" AND ", u" OR "})
        EXPECT_NE(refusal(u"SELECT id FROM orders WHERE " +
                          list(5'000, word, [](int n) { return u"id <> " + number(n); })),
                  "drawn");
}

TEST_F(LargeStatements, SortedByThousandsOfValuesAreRead) {
    read(u"SELECT id FROM orders ORDER BY " +
         list(4'000, u", ", [](int n) { return u"id + " + number(n); }));
    EXPECT_EQ(record.definitions.size(), 4'001U);
}

TEST_F(LargeStatements, OfComparisonsWithinEachOtherAreRead) {
    std::u16string compared = u"id = 1";
    std::u16string chosen = u"id = 1";
    std::u16string joined = u"name";
    for (int n = 0; n < 40; ++n) {
        compared = u'(' + compared + u") = 1";
        chosen = u"(iif(" + chosen + u", id, 3) = 1)";
        joined = u'(' + joined + u" || name)";
    }
    EXPECT_EQ(refusal(u"SELECT id FROM orders WHERE " + compared), "drawn");
    EXPECT_EQ(refusal(u"SELECT id FROM orders WHERE " + chosen), "drawn");
    EXPECT_EQ(refusal(u"SELECT " + joined + u" AS names FROM customers"), "drawn");
}

TEST_F(LargeStatements, ThatWriteAValueAnewForEachChoiceAreRefusedWhereItGrowsTooLong) {
    std::u16string chosen = u"id";
    for (int n = 0; n < 60; ++n)
        chosen = u"CASE " + chosen + u" WHEN 1 THEN 2 WHEN 2 THEN 4 ELSE 5 END";
    const std::string said = refusal(u"SELECT " + chosen + u" AS x FROM orders");
    EXPECT_NE(said.find("at most 10000 characters can stand here"), std::string::npos) << said;
}

TEST_F(LargeStatements, OfThousandsOfWaysToHoldAreCompared) {
    read(u"SELECT id FROM orders WHERE " + list(12, u" AND ", [](int n) {
             return u"(id > " + number(n) + u" OR customer_id < " + number(n) + u')';
         }));
    EXPECT_EQ(record.definitions.size(), 1U);
}

TEST_F(LargeStatements, OfQueriesWithinQueriesAreRefusedWhereTheyStandTooDeep) {
    const auto within = [](int depth) {
        return u"WITH " +
               list(depth, u", ",
                    [](int n) {
                        return u'w' + number(n) + u" AS (SELECT id FROM " +
                               (n == 0 ? std::u16string(u"orders") : u'w' + number(n - 1)) + u')';
                    }) +
               u" SELECT id FROM w" + number(depth - 1);
    };
    constexpr int deepest = zandor::model::deepestSavedQuery;
    EXPECT_EQ(refusal(within(deepest)), "drawn");
    EXPECT_EQ(refusal(within(deepest + 1)),
              "Line 1, column 240: too much stands within each other here to be drawn.");
    // Not only what WITH names counts.
    EXPECT_EQ(refusal(u"SELECT id FROM (" + within(deepest) + u") q"),
              "Line 1, column 17: too much stands within each other here to be drawn.");
}

TEST_F(LargeStatements, WithMoreCommentsThanAFileHoldsAreRefused) {
    std::u16string comments;
    for (int n = 0; n < 10'001; ++n) comments += u"/*a*/";
    const std::string said = "no more than 10000 comments can be kept; leave some out.";
    EXPECT_EQ(refusal(u"SELECT id " + comments + u" FROM orders"), "Line 1, column 8: " + said);
    EXPECT_EQ(refusal(u"SELECT id FROM (SELECT id " + comments + u" FROM orders) q"),
              "Line 1, column 24: " + said);
}
