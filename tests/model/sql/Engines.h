#pragma once

#include "PostgresCopy.h"
#include "support/PostgresServer.h"

#include <Zandor/DatabaseReader.h>
#include <Zandor/sql/Builder.h>

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

    zandor::reader::DatabaseReader& reader() { return *mReader; }
    Outcome run(zandor::model::sql::Dialect dialect, const QString& statement,
                const QVariantList& values = {}) const;
    /// Runs a query's statement, with answers to its parameters.
    Outcome run(zandor::model::sql::Dialect dialect, const zandor::model::sql::Text& text,
                const std::map<std::string, std::string>& answers = {}) const;

private:
    const QSqlDatabase& database(zandor::model::sql::Dialect dialect) const;

    QTemporaryDir mDirectory;
    QSqlDatabase mSqlite;
    QSqlDatabase mPostgres;
    std::unique_ptr<zandor::reader::DatabaseReader> mReader;
};

/// The engines of this program, each made when it is first asked for. They end with the program.
Engines& sampleEngines(); ///< the sample database and the tables with odd names
Engines& smallEngines();  ///< the same with a few rows a table

/// Stops the server, if it was started. Before the application object goes.
void stopEngines();
