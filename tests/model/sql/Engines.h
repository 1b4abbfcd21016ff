#pragma once

#include "ServerCopy.h"
#include "support/MariaServer.h"
#include "support/PostgresServer.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/sql/Builder.h>

#include <QStringList>

#include <functional>
#include <map>
#include <memory>
#include <optional>

/// Rows as one text each, written alike for every engine: what is equal reads equal.
using Rows = QStringList;

inline Rows sorted(Rows rows) {
    rows.sort();
    return rows;
}

/// What came of a statement: rows, or the engine's words.
struct Outcome {
    Rows rows;
    QString error;
};

/// The servers that a program starts.
struct Servers {
    PostgresServer postgres;
    std::optional<MariaServer> maria; ///< nothing where it is not installed
};

/// A database with the same rows in an SQLite file and on the servers.
class Engines {
public:
    using Prepare = std::function<void(const QSqlDatabase& sqlite)>;

    /// A copy of the sample database, changed by `prepare`, in databases of the servers' under
    /// `name`.
    Engines(Servers& servers, const QString& name, const Prepare& prepare);
    ~Engines();

    /// Those that statements can be run on.
    std::vector<zandor::model::sql::Dialect> dialects() const;
    zandor::reader::DatabaseReader& reader() { return *mReader; }
    Outcome run(zandor::model::sql::Dialect dialect, const QString& statement,
                const QVariantList& values = {}) const;
    /// Runs a statement that is written in words that all engines have, with names in double
    /// quotes.
    Outcome runCommon(zandor::model::sql::Dialect dialect, const QString& statement) const;
    /// Runs a query's statement, with answers to its parameters.
    Outcome run(zandor::model::sql::Dialect dialect, const zandor::model::sql::Text& text,
                const std::map<std::string, std::string>& answers = {}) const;
    const QSqlDatabase& database(zandor::model::sql::Dialect dialect) const;

private:
    QTemporaryDir mDirectory;
    std::map<zandor::model::sql::Dialect, QSqlDatabase> mDatabases;
    std::unique_ptr<zandor::reader::DatabaseReader> mReader;
};

/// The engines of this program, each made when it is first asked for. They end with the program.
Engines& sampleEngines(); ///< the sample database and the tables with odd names
Engines& smallEngines();  ///< the same with a few rows a table

/// Stops the servers, if they were started. Before the application object goes.
void stopEngines();
