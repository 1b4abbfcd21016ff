#include "Corpus.h"
#include "Engines.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>
#include <set>

using namespace zandor;

using corpus::Case;
using model::Finding;
using model::sql::Dialect;
using model::sql::ValueForm;
using platform::toUtf8;

namespace {

const std::vector<Case>& cases() {
    static const std::vector<Case> all = corpus::read(CORPUS);
    return all;
}

bool isSorted(const Case& drawn) {
    return std::any_of(drawn.columns.begin(), drawn.columns.end(),
                       [](const corpus::Column& column) { return column.sort != 0; });
}

std::string described(const Rows& rows) {
    return std::to_string(rows.size()) + " rows, first\n" +
           Rows(rows.mid(0, 5)).join(u'\n').toStdString();
}

/// Such as a full outer join in MySQL.
bool cannotBeSaid(const model::sql::Text& text) {
    return std::any_of(text.findings.begin(), text.findings.end(), [](const Finding& finding) {
        return finding.kind == Finding::Kind::notInDialect ||
               finding.kind == Finding::Kind::nameNotCarried;
    });
}

std::string parts(const corpus::ExpectedFinding& finding) {
    return finding.kind + " row " + std::to_string(finding.row) + " position " +
           std::to_string(finding.position) + ": " + finding.text + "\n";
}

} // namespace

TEST(TheCorpus, HasCasesEnoughAndNoNameTwice) {
    std::set<std::string> names;
    std::size_t inAllDialects = 0;
    std::size_t withReference = 0;
    for (const Case& drawn : cases()) {
        EXPECT_TRUE(names.insert(drawn.name).second) << drawn.name;
        inAllDialects += drawn.sql.size() == std::size(model::sql::allDialects);
        withReference += !drawn.references.empty();
    }
    EXPECT_GE(cases().size(), 380u);
    EXPECT_GE(inAllDialects, 40u);
    EXPECT_GE(withReference, 350u);
    std::cout << cases().size() << " cases, " << inAllDialects << " in all dialects, "
              << withReference << " with a reference query\n";
}

TEST(TheCorpus, IsWrittenInEachDialectAsExpected) {
    for (const Case& drawn : cases()) {
        SCOPED_TRACE(drawn.name);
        const auto query = corpus::draw(drawn, sampleEngines().reader());
        for (const Dialect dialect : model::sql::allDialects) {
            const auto expected = drawn.sql.find(corpus::nameOf(dialect));
            if (expected == drawn.sql.end()) continue;
            const auto text = model::sql::statementText(*query, dialect, ValueForm::literal);
            EXPECT_EQ(toUtf8(text.text), expected->second) << corpus::nameOf(dialect);
        }
    }
}

TEST(TheCorpus, HasTheFindingsItExpects) {
    for (const Case& drawn : cases()) {
        SCOPED_TRACE(drawn.name);
        const auto query = corpus::draw(drawn, sampleEngines().reader());
        std::string expected;
        for (const auto& finding : drawn.findings) expected += parts(finding);
        std::string found;
        for (const auto& finding : model::sql::validate(*query, Dialect::SQLite))
            found += parts({corpus::nameOf(finding.kind), toUtf8(finding.text()), finding.row,
                            static_cast<int>(finding.position)});
        EXPECT_EQ(found, expected);
    }
}

TEST(TheCorpus, FindsTheRowsOfItsReferenceQueriesOnAllEngines) {
    for (const Case& drawn : cases()) {
        if (drawn.references.empty()) continue;
        SCOPED_TRACE(drawn.name);
        const auto query = corpus::draw(drawn, sampleEngines().reader());
        std::map<Dialect, Rows> found;
        for (const Dialect dialect : sampleEngines().dialects()) {
            SCOPED_TRACE(corpus::nameOf(dialect));
            const auto text = model::sql::statementText(*query, dialect, ValueForm::bound);
            if (dialect == Dialect::MySQL && cannotBeSaid(text)) continue;
            ASSERT_TRUE(text.runnable());
            Outcome ours = sampleEngines().run(dialect, text, drawn.answers);
            const auto reference = drawn.references.find(corpus::nameOf(dialect));
            ASSERT_NE(reference, drawn.references.end()) << "no reference here";
            Outcome theirs =
                sampleEngines().runCommon(dialect, QString::fromStdString(reference->second));
            ASSERT_EQ(ours.error.toStdString(), "") << toUtf8(text.text);
            ASSERT_EQ(theirs.error.toStdString(), "") << reference->second;
            if (drawn.collated && dialect == Dialect::MySQL) continue;
            EXPECT_FALSE(theirs.rows.isEmpty()) << "a reference that proves nothing";
            EXPECT_TRUE(sorted(ours.rows) == sorted(theirs.rows))
                << toUtf8(text.text) << "\nours: " << described(ours.rows)
                << "\ntheirs: " << described(theirs.rows);
            if (isSorted(drawn)) {
                EXPECT_TRUE(ours.rows == theirs.rows) << "in another order";
            }
            found[dialect] = sorted(ours.rows);
        }
        for (const auto& [dialect, rows] : found)
            EXPECT_TRUE(rows == found[Dialect::SQLite])
                << corpus::nameOf(dialect) << ": " << described(rows)
                << "\nSQLite: " << described(found[Dialect::SQLite]);
    }
}

// What is shown to a user says what is run.
TEST(TheCorpus, FindsTheSameRowsWithTheValuesWrittenOut) {
    for (const Case& drawn : cases()) {
        if (drawn.references.empty() || !drawn.answers.empty()) continue;
        SCOPED_TRACE(drawn.name);
        const auto query = corpus::draw(drawn, sampleEngines().reader());
        for (const Dialect dialect : sampleEngines().dialects()) {
            const auto bound = model::sql::statementText(*query, dialect, ValueForm::bound);
            const auto literal = model::sql::statementText(*query, dialect, ValueForm::literal);
            if (cannotBeSaid(bound)) continue;
            const Outcome outcome =
                sampleEngines().run(dialect, QString::fromStdU16String(literal.text));
            ASSERT_EQ(outcome.error.toStdString(), "") << toUtf8(literal.text);
            EXPECT_TRUE(sorted(outcome.rows) == sorted(sampleEngines().run(dialect, bound).rows))
                << toUtf8(literal.text);
        }
    }
}
