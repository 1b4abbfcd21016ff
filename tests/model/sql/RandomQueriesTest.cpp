#include "RandomQueries.h"
#include "Corpus.h"
#include "Engines.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>
#include <regex>
#include <set>
#include <sstream>

using namespace zandor;

// Thousands of random drawings. ZANDOR_SEED makes other ones, ZANDOR_QUERIES more or fewer.

namespace {

using model::Finding;
using model::sql::Dialect;
using model::sql::ValueForm;
using platform::toUtf8;

std::uint32_t seed() {
    static const std::uint32_t theSeed = fromEnvironment("ZANDOR_SEED", 20240501);
    std::cout << "ZANDOR_SEED=" << theSeed << '\n';
    return theSeed;
}

const std::uint32_t howMany = fromEnvironment("ZANDOR_QUERIES", 3000);

/// What a user typed, for the message of a failure.
std::string typed(model::Query& query) {
    std::string text;
    for (const auto& definition :
         platform::Each<TalvikZandorLib::ZDColumnDefinition>(query.ColumnDefinitions()))
        for (const auto& [row, criterium] :
             static_cast<model::ColumnDefinition&>(*definition).criteria().rows())
            text += "row " + std::to_string(row) + ": " + toUtf8(criterium->Criterium()) + '\n';
    return text;
}

/// Whether a statement has parameters: only hostile texts make some.
bool asks(const model::sql::Text& text) {
    return std::any_of(text.bindings.begin(), text.bindings.end(), [](const auto& binding) {
        return std::holds_alternative<model::sql::Parameter>(binding);
    });
}

/// Whether a statement with its values written out may put texts into an order: each engine has
/// letters in its own. Of two columns that are compared, it may be texts that they hold.
bool mayOrderTexts(const std::string& statement) {
    static const std::regex order(R"((BETWEEN|[^<]>=?|<=?) ['`a-z])");
    return std::regex_search(statement, order);
}

/// Of more rows than these, a product of tables, only the number is looked at a second time.
constexpr int mostRows = 20000;

} // namespace

TEST(RandomQueries, RunOnAllEnginesAndFindTheSameRows) {
    RandomQueries random(seed(), smallEngines().reader());
    std::map<Finding::Kind, int> findings;
    int run = 0;
    int withRows = 0;
    int onMaria = 0; // those whose rows have to be the others'
    for (std::uint32_t n = 0; n < howMany; ++n) {
        const auto query = random.next();
        std::map<Dialect, Rows> found;
        for (const Dialect dialect : smallEngines().dialects()) {
            const auto text = model::sql::statementText(*query, dialect, ValueForm::bound);
            if (dialect == Dialect::PostgreSQL)
                for (const auto& finding : text.findings) ++findings[finding.kind];
            if (!text.runnable() || asks(text)) continue;
            SCOPED_TRACE("query " + std::to_string(n) + '\n' + typed(*query) + toUtf8(text.text));
            ++run;
            Outcome outcome = smallEngines().run(dialect, text);
            ASSERT_EQ(outcome.error.toStdString(), "");
            if (outcome.rows.size() <= mostRows) {
                const auto written = model::sql::statementText(*query, dialect, ValueForm::literal);
                const Outcome shown =
                    smallEngines().run(dialect, QString::fromStdU16String(written.text));
                ASSERT_EQ(shown.error.toStdString(), "") << toUtf8(written.text);
                ASSERT_TRUE(sorted(shown.rows) == sorted(outcome.rows)) << toUtf8(written.text);
                if (dialect == Dialect::MySQL && mayOrderTexts(toUtf8(written.text))) continue;
            }
            found[dialect] = sorted(std::move(outcome.rows));
            onMaria += dialect == Dialect::MySQL;
        }
        if (found.empty()) continue;
        SCOPED_TRACE("query " + std::to_string(n) + '\n' + typed(*query));
        const auto& [first, rows] = *found.begin();
        withRows += found.size() > 1 && !rows.isEmpty();
        for (const auto& [dialect, others] : found) {
            ASSERT_EQ(others.size(), rows.size()) << corpus::nameOf(dialect);
            ASSERT_TRUE(others == rows) << corpus::nameOf(first) << '\n'
                                        << rows.join(u'\n').left(2000).toStdString() << "\n---\n"
                                        << corpus::nameOf(dialect) << '\n'
                                        << others.join(u'\n').left(2000).toStdString();
        }
    }
    std::cout << run << " statements run, " << withRows << " queries with rows, " << onMaria
              << " found by MariaDB too\n";
    EXPECT_GT(run, static_cast<int>(howMany)) << "most queries should run, on all engines";
    EXPECT_GT(withRows, static_cast<int>(howMany) / 6);
    if (smallEngines().dialects().size() > 2) {
        EXPECT_GT(onMaria, static_cast<int>(howMany) / 6);
    }
    for (const auto kind : {Finding::Kind::badCriterion, Finding::Kind::cartesianProduct,
                            Finding::Kind::ambiguousOuterJoin, Finding::Kind::notInDialect,
                            Finding::Kind::duplicateOutputName, Finding::Kind::sortOnAllColumns})
        EXPECT_GT(findings[kind], 0) << "kind " << static_cast<int>(kind) << " never came up";
}

// The statement with the values written out is, but for the values, the statement with
// placeholders: nothing that was typed became anything but a value.
TEST(RandomQueries, HaveTheSameShapeWithAndWithoutTheirValues) {
    RandomQueries random(seed() + 1, smallEngines().reader());
    for (std::uint32_t n = 0; n < howMany / 3; ++n) {
        const auto query = random.next();
        for (const Dialect dialect : {Dialect::SQLite, Dialect::PostgreSQL, Dialect::Standard}) {
            const auto bound = model::sql::statementText(*query, dialect, ValueForm::bound);
            const auto literal = model::sql::statementText(*query, dialect, ValueForm::literal);
            if (asks(bound)) continue; // shown by their names
            ASSERT_EQ(shape(toUtf8(literal.text)), shape(toUtf8(bound.text))) << typed(*query);
            ASSERT_EQ(std::count(bound.text.begin(), bound.text.end(), u'?') >=
                          static_cast<std::ptrdiff_t>(bound.bindings.size()),
                      true);
        }
    }
}

// A hostile text in a cell changes the condition only, and that is made of the words of conditions
// and of the query's own names.
TEST(RandomQueries, StayInTheirConditionWhateverIsTyped) {
    const std::set<std::string> conditionWords = {
        "WHERE", "AND",    "OR",   "NOT",  "LIKE", "ILIKE",     "BETWEEN", "IN", "IS",
        "NULL",  "ESCAPE", "'\\'", "CAST", "AS",   "text",      "(",       ")",  ",",
        ".",     "=",      "<",    ">",    "?",    "customers", "name",    "id"};
    RandomQueries random(seed() + 2, smallEngines().reader());
    const auto table = smallEngines().reader().table({u"", u"customers"});
    ASSERT_TRUE(table);
    const std::string plain = " SELECT customers . name , customers . id FROM customers";
    int good = 0;
    for (std::uint32_t n = 0; n < 2 * howMany; ++n) {
        const auto query = platform::makeRef<model::Query>();
        const auto customers = query->addTable(*table);
        for (const auto* column : {u"name", u"id"}) {
            const auto definition = platform::makeRef<model::ColumnDefinition>();
            definition->Column(customers->columnNamed(column));
            if (column[0] == u'n') definition->AddCriterium(random.hostileText(), u"4");
            query->AddColumnDefinition(definition);
        }
        const auto text = model::sql::statementText(*query, Dialect::SQLite, ValueForm::bound);
        const std::string found = shape(toUtf8(text.text));
        ASSERT_EQ(found.substr(0, plain.size()), plain) << typed(*query);
        std::istringstream rest(found.substr(plain.size()));
        for (std::string word; rest >> word;)
            ASSERT_TRUE(conditionWords.contains(word)) << word << '\n' << typed(*query);
        if (!text.runnable() || asks(text)) continue;
        ++good;
        if (n % 10 != 0) continue;
        for (const Dialect dialect : smallEngines().dialects()) {
            const Outcome outcome = smallEngines().run(
                dialect, model::sql::statementText(*query, dialect, ValueForm::bound));
            ASSERT_EQ(outcome.error.toStdString(), "") << typed(*query);
        }
    }
    std::cout << good << " hostile texts were criteria\n";
    EXPECT_GT(good, static_cast<int>(howMany) / 8);
}
