#pragma once

#include "designer/run/fetch.h"

#include <QStringList>

#include <functional>

/// Queries as the tests want them drawn.

/// An output column: "table.column", and its criteria in the row "Criteria:" and below.
struct Drawn {
    QString column;
    QStringList criteria = {};
    int sorting = 0; ///< 1 up, 2 down
};

/// A query over tables of a database, without joins; a table named twice is in it twice.
zandor::platform::Ref<zandor::model::Query> draw(const QString& address, const QStringList& tables,
                                                 const std::vector<Drawn>& columns = {});
void addColumn(zandor::model::Query& query, const Drawn& column);

/// The statements of a table "numbers" with the whole numbers below `count` in "n", a text in
/// "word" and nothing in "missing".
QStringList numbersTable(int count);

/// A query over the table "numbers" that finds no row, which takes the engine minutes to see.
zandor::platform::Ref<zandor::model::Query> drawForMinutes(const QString& address);

/// Keeps rows as texts.
class Keeper final : public zandor::designer::Sink {
public:
    std::optional<QString> begin(const QStringList& names) override {
        columns = names;
        return {};
    }
    std::optional<QString> add(const zandor::designer::Row& row) override;
    std::optional<QString> finish() override {
        finished = true;
        return {};
    }

    QStringList columns;
    QStringList rows; ///< cells with " | " between, the kind's first letter before each
    std::vector<zandor::designer::Row> cells;
    bool finished = false;
    int refuseAfter = -1;                  ///< rows
    std::function<void()> afterFirst = {}; ///< done when one row has come
};

/// The command for a query without parameters.
zandor::designer::Command commandFor(const zandor::platform::Ref<zandor::model::Query>& query,
                                     zandor::model::sql::Dialect dialect,
                                     std::optional<qint64> limit = {});

/// Runs a query for every value of a table, with what the designer shows of it typed as the
/// criterion: one row is found, which has that value. No column has a value twice. What no clock or
/// calendar has, in the columns `outside`, is compared by its text.
void expectFoundByWhatIsShown(const QString& address, const QString& table,
                              zandor::model::sql::Dialect dialect, const QStringList& outside = {});
