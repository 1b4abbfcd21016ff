#include "Corpus.h"
#include "Engines.h"
#include "RandomQueries.h"
#include "RandomTotals.h"
#include "ReaderSchema.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>
#include <set>

using namespace zandor;

// What the printer writes is read into a drawing that is written the same. ZANDOR_SEED makes other
// random ones, ZANDOR_READINGS more or fewer, ZANDOR_DIALECT those of one ("mysql"); ZANDOR_SHOW
// shows what is written otherwise.

namespace {

using model::sql::Dialect;
using model::sql::ValueForm;
using platform::toUtf8;

/// What a record says by names, whatever the keys are and in which order tables and joins came.
std::string described(const model::QueryRecord& record) {
    std::map<platform::String, std::string> names;
    std::multiset<std::string> unordered;
    for (const auto& table : record.tables) {
        names[table.key] = toUtf8(table.name);
        for (const auto& column : table.columns)
            names[column.key] = toUtf8(table.name + u'.' + column.description.name);
        unordered.insert(toUtf8(table.name + u" = " + table.schema + u'.' + table.sourceName) +
                         (table.query ? described(table.query->record) : ""));
    }
    for (const auto& join : record.joins)
        unordered.insert(names[join.left.column] + ' ' + std::to_string(join.type) + ' ' +
                         std::to_string(join.comparison) + ' ' + names[join.right.column]);
    std::string all = std::to_string(record.options.distinct) + ' ' +
                      std::to_string(record.options.first) + '\n';
    for (const std::string& each : unordered) all += each + '\n';
    for (const auto& definition : record.definitions) {
        all += names[definition.column] + toUtf8(definition.expression) + " as " +
               toUtf8(definition.synonym) + ' ' + std::to_string(definition.visible) +
               std::to_string(definition.sortOrder) + std::to_string(definition.sortPriority) +
               std::to_string(static_cast<int>(definition.total));
        for (const auto& criterion : definition.criteria)
            all += " | " + std::to_string(criterion.row) + ": " + toUtf8(criterion.text);
        all += '\n';
    }
    return all;
}

/// Writes queries, reads them, and writes them again.
class ReadingBack {
public:
    ReadingBack(Engines& engines, Dialect dialect)
        : mEngines(engines), mDialect(dialect), mSchema(schemaOf(engines.reader())) {}

    /// Why the query is not drawn; empty where it is.
    std::string tryOn(model::Query& query) {
        const auto written = model::sql::statementText(query, mDialect, ValueForm::literal);
        if (!written.runnable()) return {};
        // Such a drawing says that its joins can be read in two ways; its text says one of them.
        const bool open = std::any_of(
            written.findings.begin(), written.findings.end(), [](const model::Finding& finding) {
                return finding.kind == model::Finding::Kind::ambiguousOuterJoin;
            });
        ++mTried;
        SCOPED_TRACE(corpus::nameOf(mDialect) + '\n' + toUtf8(written.text));
        const auto drawn = sql_reader::read(written.text, mDialect, mSchema);
        if (!drawn) {
            show(written.text, drawn.error());
            if (open) return ++mOpen, std::string();
            ++mRefused;
            return toUtf8(drawn.error());
        }
        const auto again = model::sql::statementText(**drawn, mDialect, ValueForm::literal);
        if (again.text != written.text) {
            ++(open ? mOpen : mOther);
            show(written.text, again.text);
            expectSameRows(written, again);
        }
        expectSettled(again.text, (*drawn)->record());
        return {};
    }

    void report() const {
        std::cout << corpus::nameOf(mDialect) << ": " << mTried << " tried, " << mOther
                  << " written otherwise, " << mRefused << " refused, " << mOpen
                  << " of two ways to read their joins written in the other\n";
    }
    int tried() const { return mTried; }
    int writtenOtherwise() const { return mOther; }

private:
    static void show(const platform::String& written, const platform::String& instead) {
        if (std::getenv("ZANDOR_SHOW"))
            std::cout << toUtf8(written) << "\n--> " << toUtf8(instead) << "\n\n";
    }

    /// Once read, a drawing is always read as itself.
    void expectSettled(const platform::String& text, const model::QueryRecord& record) const {
        const auto drawn = sql_reader::read(text, mDialect, mSchema);
        ASSERT_TRUE(drawn) << toUtf8(drawn.error()) << '\n' << toUtf8(text);
        EXPECT_EQ(toUtf8(model::sql::statementText(**drawn, mDialect, ValueForm::literal).text),
                  toUtf8(text));
        EXPECT_EQ(described((*drawn)->record()), described(record)) << toUtf8(text);
    }

    void expectSameRows(const model::sql::Text& written, const model::sql::Text& again) const {
        const auto there = mEngines.dialects();
        const bool runs = std::find(there.begin(), there.end(), mDialect) != there.end();
        if (!runs || !written.bindings.empty()) return;
        const auto run = [&](const model::sql::Text& text) {
            return mEngines.run(mDialect, QString::fromStdU16String(text.text));
        };
        const Outcome one = run(written);
        const Outcome other = run(again);
        EXPECT_EQ(one.error.toStdString(), other.error.toStdString()) << toUtf8(again.text);
        // Of unsorted rows the first ones are any.
        if (written.text.find(u"LIMIT") != platform::String::npos) return;
        EXPECT_EQ(sorted(one.rows).join(u'\n').toStdString(),
                  sorted(other.rows).join(u'\n').toStdString())
            << toUtf8(again.text);
    }

    Engines& mEngines;
    const Dialect mDialect;
    const sql_reader::Schema mSchema;
    int mTried = 0;
    int mRefused = 0;
    int mOther = 0;
    int mOpen = 0;
};

} // namespace

TEST(ReadBack, OfTheCorpusIsTheSameText) {
    const auto cases = corpus::read(CORPUS);
    for (const Dialect dialect : model::sql::allDialects) {
        ReadingBack reading(sampleEngines(), dialect);
        for (const auto& drawn : cases) {
            const auto why = reading.tryOn(*corpus::draw(drawn, sampleEngines().reader()));
            // SQL Server groups by no constant, so that its text does not say it.
            const bool expected = dialect == Dialect::SqlServer &&
                                  why.find("neither grouped") != std::string::npos;
            EXPECT_TRUE(why.empty() || expected) << drawn.name << ": " << why;
        }
        reading.report();
        EXPECT_GT(reading.tried(), 420);
        EXPECT_EQ(reading.writtenOtherwise(), 0);
    }
}

TEST(ReadBack, OfRandomQueriesIsTheSameText) {
    const auto seed = fromEnvironment("ZANDOR_SEED", 20240501);
    const auto howMany = fromEnvironment("ZANDOR_READINGS", 300);
    const char* const only = std::getenv("ZANDOR_DIALECT");
    for (const Dialect dialect : model::sql::allDialects) {
        if (only && corpus::nameOf(dialect) != only) continue;
        SCOPED_TRACE("ZANDOR_SEED=" + std::to_string(seed));
        ReadingBack reading(smallEngines(), dialect);
        RandomQueries random(seed, smallEngines().reader());
        RandomTotals totals(seed, smallEngines().reader());
        for (std::uint32_t n = 0; n < howMany && !testing::Test::HasFailure(); ++n) {
            EXPECT_EQ(reading.tryOn(*random.next()), "");
            EXPECT_EQ(reading.tryOn(*totals.next()), "");
        }
        reading.report();
        EXPECT_GT(reading.tried(), static_cast<int>(howMany));
        EXPECT_LE(reading.writtenOtherwise(), reading.tried() / 1000);
    }
}
