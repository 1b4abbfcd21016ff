#include "RandomTotals.h"
#include "Corpus.h"
#include "Engines.h"
#include "Evaluator.h"

#include <gtest/gtest.h>

#include <iostream>

using namespace zandor;

// Thousands of random expressions and totals. ZANDOR_SEED makes other ones, ZANDOR_QUERIES more or
// fewer.

namespace {

using model::Finding;
using model::sql::Dialect;
using platform::toUtf8;

} // namespace

TEST(RandomTotals, AreOnAllEnginesWhatTheyAreWithoutSql) {
    const auto seed = fromEnvironment("ZANDOR_SEED", 20240501);
    const auto howMany = fromEnvironment("ZANDOR_QUERIES", 2000);
    RandomTotals random(seed, smallEngines().reader());
    Evaluator evaluator(smallEngines().database(Dialect::SQLite));
    std::map<Finding::Kind, int> findings;
    int agreed = 0;
    int withRows = 0;
    for (std::uint32_t n = 0; n < howMany; ++n) {
        const auto query = random.next();
        // Of unsorted rows the first ones are any, so that of some queries a number is asked for.
        if (n % 5 == 0)
            query->options({.distinct = query->options().distinct,
                            .first = static_cast<std::int32_t>(1 + n % 7)});
        const auto built = model::sql::build(*query);
        for (const auto& finding : built.findings) ++findings[finding.kind];
        for (const Dialect dialect : smallEngines().dialects()) {
            const auto text =
                model::sql::statementText(*query, dialect, model::sql::ValueForm::bound);
            if (!text.runnable()) continue;
            SCOPED_TRACE("ZANDOR_SEED=" + std::to_string(seed) + " query " + std::to_string(n) +
                         '\n' + toUtf8(text.text));
            bool everything = false;
            for (const auto& item : built.statement->items)
                everything |= std::holds_alternative<model::sql::AllColumns>(item.what);
            if (everything) break;
            const Outcome outcome = smallEngines().run(dialect, text);
            ASSERT_EQ(outcome.error.toStdString(), "") << corpus::nameOf(dialect);
            Rows expected = sorted(evaluator.rows(*built.statement));
            if (const auto first = built.statement->limit) {
                ASSERT_EQ(outcome.rows.size(), std::min<qsizetype>(*first, expected.size()))
                    << corpus::nameOf(dialect);
                for (const QString& row : outcome.rows)
                    ASSERT_TRUE(expected.removeOne(row)) << row.toStdString();
                expected = sorted(outcome.rows);
            }
            ASSERT_EQ(sorted(outcome.rows).join(u'\n').toStdString(),
                      expected.join(u'\n').toStdString())
                << corpus::nameOf(dialect);
            ++agreed;
            withRows += !expected.isEmpty();
        }
    }
    std::cout << agreed << " statements agreed, " << withRows << " of them with rows\n";
    EXPECT_GT(agreed, static_cast<int>(howMany * smallEngines().dialects().size() / 2));
    EXPECT_GT(withRows, agreed / 3);
    EXPECT_GT(findings[Finding::Kind::criterionNotPlaced], 0);
}
