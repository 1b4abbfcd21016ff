#include "Queries.h"
#include "model/reader/OneMariaServer.h"
#include "model/reader/OneServer.h"
#include "support/CutLine.h"

#include <Zandor/DatabaseReader.h>

#include <iostream>

using namespace zandor;

using designer::Database;
using designer::Outcome;
using End = Outcome::End;

// A server that dies after any byte of what it says: while the connection is made, in the middle of
// a row, behind the last one.

namespace {

constexpr int rowsOfAll = 300;
constexpr int cuts = 40;
const QString statement = QStringLiteral("SELECT n, word FROM cut ORDER BY n");

QStringList tableToCut() {
    QStringList values;
    for (int n = 0; n < rowsOfAll; ++n) values << QStringLiteral("(%1, 'word %1')").arg(n);
    return {QStringLiteral("DROP TABLE IF EXISTS cut"),
            QStringLiteral("CREATE TABLE cut (n integer, word varchar(20))"),
            QStringLiteral("INSERT INTO cut VALUES ") + values.join(u',')};
}

struct Run {
    Keeper keeper;
    Outcome outcome;
};

Run runAt(const QString& address) {
    Run run;
    const std::atomic<bool> stop = false;
    run.outcome = designer::fetch(Database::connectorTo(address, {}),
                                  designer::Command{statement, {}, {}}, run.keeper, stop);
    return run;
}

/// What is not as it should be of a run whose line was cut.
std::string wrongWith(const Run& run, const QStringList& all) {
    const auto& [keeper, outcome] = run;
    std::string wrong;
    if (keeper.rows != all.mid(0, keeper.rows.size())) wrong += "rows that there are not; ";
    if (outcome.end == End::complete) {
        if (keeper.rows != all || !keeper.finished) wrong += "complete without all rows; ";
        return wrong;
    }
    if (outcome.end != End::unreachable && outcome.end != End::lost) wrong += "another end; ";
    if (outcome.message.trimmed().isEmpty()) wrong += "not a word; ";
    if (keeper.finished) wrong += "a file is closed as if it were whole; ";
    return wrong;
}

void cutEverywhere(CutLine& line, const QString& address) {
    const Run whole = runAt(address);
    ASSERT_EQ(whole.outcome.end, End::complete) << whole.outcome.message.toStdString();
    ASSERT_EQ(whole.keeper.rows.size(), rowsOfAll);
    line.mend();
    runAt(address);
    const std::int64_t bytes = line.passed();
    int unreachable = 0, lost = 0, complete = 0, midway = 0;
    for (int n = 0; n < cuts; ++n) {
        const std::int64_t at = bytes * n / cuts;
        line.cutAfter(at);
        const Run run = runAt(address);
        EXPECT_EQ(wrongWith(run, whole.keeper.rows), "")
            << "cut after byte " << at << ", end " << static_cast<int>(run.outcome.end) << ": "
            << run.outcome.message.toStdString();
        unreachable += run.outcome.end == End::unreachable;
        lost += run.outcome.end == End::lost;
        complete += run.outcome.end == End::complete;
        midway += run.outcome.end == End::lost && !run.keeper.rows.isEmpty();
    }
    line.mend();
    EXPECT_EQ(runAt(address).outcome.end, End::complete) << "the next run";
    std::cout << "[ FAULTS   ] cut " << cuts << " times within " << bytes
              << " bytes: while connecting " << unreachable << ", lost " << lost << " (" << midway
              << " with rows), complete " << complete << '\n';
    EXPECT_GT(unreachable, 0);
    EXPECT_GT(lost, 0);
}

} // namespace

TEST(ALineThatIsCut, EndsARunOnPostgres) {
    runOnServer(tableToCut());
    CutLine line(oneServer.server().folder() + QStringLiteral("/.s.PGSQL.5432"));
    cutEverywhere(line,
                  QStringLiteral("postgresql://postgres@localhost/postgres?host=") + line.folder());
}

TEST(ALineThatIsCut, EndsARunOnMaria) {
    if (const auto missing = MariaServer::missing()) GTEST_SKIP() << missing->toStdString();
    runOnMaria(
        QStringList{QStringLiteral("CREATE OR REPLACE DATABASE cuts"), QStringLiteral("USE cuts")} +
        tableToCut());
    CutLine line(oneMariaServer.server().socket());
    cutEverywhere(line, QStringLiteral("mariadb://root@localhost/cuts?host=") + line.socket());
}
