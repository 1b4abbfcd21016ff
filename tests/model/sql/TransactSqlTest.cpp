#include "Corpus.h"
#include "Engines.h"

#include <QProcess>

#include <gtest/gtest.h>

#include <iostream>

using namespace zandor;

using model::sql::Dialect;
using model::sql::ValueForm;

// There is no SQL Server here; parsers of its language, which are somebody else's, read what is
// written for it.

namespace {

constexpr int notInstalled = 77;

/// What the parser says of statements: a line for each that it does not take. Nothing where there
/// is no parser.
std::optional<QByteArray> readBack(const std::vector<std::string>& statements) {
    QByteArray all;
    for (const std::string& statement : statements)
        all += QByteArray::fromStdString(statement) + '\0';
    QProcess parser;
    // Debian's own, which its packages are for.
    parser.start(QStringLiteral("/usr/bin/python3"), {QStringLiteral(PARSER)});
    parser.write(all);
    parser.closeWriteChannel();
    if (!parser.waitForFinished(1'200'000) || parser.exitCode() == notInstalled) return {};
    return parser.readAllStandardOutput();
}

/// None of them knows that a bracket within a name is written twice.
bool hasBracketInName(const std::string& statement) {
    return statement.find("]]") != std::string::npos;
}

} // namespace

TEST(TransactSql, IsWhatAParserOfItReadsInTheWholeCorpus) {
    std::vector<std::string> statements;
    int left = 0;
    for (const corpus::Case& drawn : corpus::read(CORPUS)) {
        const auto query = corpus::draw(drawn, sampleEngines().reader());
        const auto text = model::sql::statementText(*query, Dialect::SqlServer, ValueForm::script);
        if (text.text.empty()) continue;
        statements.push_back(platform::toUtf8(text.text));
        if (!hasBracketInName(statements.back())) continue;
        statements.pop_back();
        ++left;
    }
    EXPECT_LT(left, 10);
    const auto said = readBack(statements);
    if (!said) GTEST_SKIP() << "sqlfluff and python3-sqlglot are not installed";
    const QByteArray count = said->trimmed().split('\n').constLast();
    EXPECT_EQ(said->count('\n'), 1) << said->toStdString();
    EXPECT_TRUE(count.startsWith("read " + QByteArray::number(qulonglong(statements.size()))));
    EXPECT_GT(count.split(' ').constLast().toUInt() + 30, statements.size());
    std::cout << count.toStdString() << ", " << left << " left out\n";
}

TEST(TransactSql, IsNotWhateverThatParserIsGiven) {
    const std::vector<std::string> foreign = {"SELECT a FROM t LIMIT 5;",
                                              "SELECT a FROM order;",
                                              "SELECT a || b FROM t;",
                                              "SELECT a FROM t OFFSET 1 ROWS;",
                                              "SELECT a FROM t WHERE a ILIKE 'x';",
                                              "SELECT `a` FROM t;"};
    const auto said = readBack(foreign);
    if (!said) GTEST_SKIP() << "sqlfluff and python3-sqlglot are not installed";
    EXPECT_EQ(said->count('\n'), static_cast<qsizetype>(foreign.size()) + 1) << said->toStdString();
}
