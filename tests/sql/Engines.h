#pragma once

#include "PostgresCopy.h"
#include "support/PostgresServer.h"

#include "model/reader/DatabaseReader.h"
#include "model/sql/Builder.h"

#include <QStringList>

#include <functional>
#include <memory>
#include <optional>

/// Rows as one text each, written alike for every engine: what is equal reads equal.
using Rows = QStringList;

/// What came of a statement: rows, or the engine's words.
struct Outcome {
    Rows rows;
    QString error;
};

/// A database with the same rows in an SQLite file and on a PostgreSQL server.
class Engines {
public:
    using Prepare = std::function<void(const QSqlDatabase& sqlite)>;

    /// A copy of the sample database, changed by `prepare`, in a database of the server's under
    /// `name`.
    Engines(PostgresServer& server, const QString& name, const Prepare& prepare);
    ~Engines();

    reader::DatabaseReader& reader() { return *mReader; }
    Outcome run(model::sql::Dialect dialect, const QString& statement,
                const QVariantList& values = {}) const;
    /// Runs a query's statement, with answers to its parameters.
    Outcome run(model::sql::Dialect dialect, const model::sql::Text& text,
                const std::map<std::string, std::string>& answers = {}) const;

private:
    const QSqlDatabase& database(model::sql::Dialect dialect) const;

    QTemporaryDir mDirectory;
    QSqlDatabase mSqlite;
    QSqlDatabase mPostgres;
    std::unique_ptr<reader::DatabaseReader> mReader;
};

/// The engines of this program, each made when it is first asked for. They end with the program.
Engines& sampleEngines(); ///< the sample database and the tables with odd names
Engines& smallEngines();  ///< the same with a few rows a table

/// Stops the server, if it was started. Before the application object goes.
void stopEngines();
