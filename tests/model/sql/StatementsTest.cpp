#include "Corpus.h"
#include "Engines.h"
#include "ReaderSchema.h"

#include <gtest/gtest.h>

#include <fstream>
#include <iostream>
#include <regex>

using namespace zandor;

// Statements as people write them: each is drawn and finds the rows that it found, or is refused in
// the words that stand below it behind "  -> ". ZANDOR_WRITE_STATEMENTS writes the files anew, to be
// read before they are kept.

namespace {

using model::sql::Dialect;
using platform::fromUtf8;
using platform::toUtf8;

struct Given {
    std::string text;
    std::string refusal; ///< empty: it is drawn
};

std::string fileOf(Dialect dialect) {
    return std::string(STATEMENTS) + '/' + corpus::nameOf(dialect) + ".txt";
}

/// One a line; a line break within is written \n.
std::vector<Given> statementsOf(Dialect dialect) {
    std::ifstream file(fileOf(dialect));
    std::vector<Given> all;
    const std::string arrow = "  -> ";
    for (std::string line; std::getline(file, line);) {
        if (line.rfind(arrow, 0) == 0)
            all.back().refusal = line.substr(arrow.size());
        else if (!line.empty() && line.front() != '#')
            all.push_back({line, {}});
    }
    return all;
}

platform::String textOf(const Given& statement) {
    return fromUtf8(std::regex_replace(statement.text, std::regex(R"(\\n)"), "\n"));
}

/// Whether only the number of rows is told: which come first is not, nor how many digits MySQL's
/// averages have.
bool isAny(const std::string& statement, Dialect dialect) {
    static const std::regex first("limit|top |fetch ", std::regex::icase);
    static const std::regex average("avg", std::regex::icase);
    return std::regex_search(statement, first) ||
           (dialect == Dialect::MySQL && std::regex_search(statement, average));
}

class Statements : public testing::TestWithParam<Dialect> {
protected:
    void expectSameRows(const Given& statement, model::Query& drawn) const {
        const auto text = model::sql::statementText(drawn, GetParam(),
                                                    model::sql::ValueForm::literal);
        ASSERT_TRUE(text.runnable());
        if (!text.bindings.empty()) return; // nobody answers
        const auto run = [&](const platform::String& sql) {
            return sampleEngines().run(GetParam(), QString::fromStdU16String(sql));
        };
        const Outcome one = run(textOf(statement));
        const Outcome other = run(text.text);
        EXPECT_EQ(one.error.toStdString(), "");
        EXPECT_EQ(other.error.toStdString(), "") << toUtf8(text.text);
        if (isAny(statement.text, GetParam()))
            EXPECT_EQ(one.rows.size(), other.rows.size()) << toUtf8(text.text);
        else
            EXPECT_EQ(sorted(one.rows).join(u'\n').left(4000).toStdString(),
                      sorted(other.rows).join(u'\n').left(4000).toStdString())
                << toUtf8(text.text);
    }

    static bool runs() {
        const auto there = sampleEngines().dialects();
        return std::find(there.begin(), there.end(), GetParam()) != there.end();
    }
};

INSTANTIATE_TEST_SUITE_P(Each, Statements,
                         testing::Values(Dialect::SQLite, Dialect::PostgreSQL, Dialect::MySQL,
                                         Dialect::SqlServer),
                         [](const auto& tested) { return corpus::nameOf(tested.param); });

} // namespace

TEST_P(Statements, AreDrawnWithTheirRowsOrRefusedWithAReason) {
    const auto statements = statementsOf(GetParam());
    ASSERT_GT(statements.size(), 20u);
    const auto schema = schemaOf(sampleEngines().reader());
    const bool writes = std::getenv("ZANDOR_WRITE_STATEMENTS") != nullptr;
    std::ofstream file;
    if (writes) file.open(fileOf(GetParam()));
    int drawnOnes = 0;
    for (const Given& statement : statements) {
        SCOPED_TRACE(statement.text);
        const auto drawn = sql_reader::read(textOf(statement), GetParam(), schema);
        drawnOnes += static_cast<bool>(drawn);
        if (writes) {
            file << statement.text << '\n';
            if (!drawn) file << "  -> " << toUtf8(drawn.error()) << '\n';
        } else {
            EXPECT_EQ(drawn ? "" : toUtf8(drawn.error()), statement.refusal);
        }
        if (drawn && runs()) expectSameRows(statement, **drawn);
    }
    std::cout << statements.size() << " statements, " << drawnOnes << " drawn\n";
}
