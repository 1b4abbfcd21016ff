#pragma once

#include <Zandor/DatabaseReader.h>
#include <Zandor/sql/Builder.h>

#include <map>
#include <memory>
#include <string>
#include <vector>

/// The corpus of queries: drawings as data, with the statements that they are and a reference
/// query, written by hand, that finds the same rows. tests/corpus/README.md describes the files.
namespace corpus {

using Names = std::pair<std::string, std::string>; ///< of a table in the query and a column

struct Column {
    Names what;
    std::string synonym;
    int sort = 0;
    bool visible = true;
    std::vector<std::string> criteria; ///< of the first row, the second one, ...
    std::string expression{};          ///< instead of a column
    zandor::model::Total total = zandor::model::Total::None;
    int priority = 0; ///< of its sort
};

struct Join {
    Names left;
    Names right;
    int type = 0;
    int comparison = 0;
};

struct Table {
    std::string source;
    std::string name;   ///< in the query; empty: as it comes
    bool query = false; ///< one of those saved, and no table of the database
};

struct ExpectedFinding {
    std::string kind;
    std::string text;
    int row = 0;
    int position = 0;
};

struct Case {
    std::string name;
    std::map<std::string, std::shared_ptr<const Case>> queries; ///< saved ones, by name
    std::vector<Table> tables;
    std::vector<Join> joins;
    std::vector<Column> columns;
    bool collated = false; ///< depends on which texts are the same, and in what order
    std::map<std::string, std::string> answers;    ///< to parameters, as a user types them
    std::map<std::string, std::string> sql;        ///< by dialect, with the values written out
    std::vector<ExpectedFinding> findings;         ///< for the first dialect of `sql`, else SQLite
    std::map<std::string, std::string> references; ///< by dialect; none when nothing is to be run
    zandor::model::QueryOptions options;
};

/// The cases of every file of a directory, in the order of the files' names. Throws
/// std::runtime_error for a file that does not say what a case needs.
std::vector<Case> read(const std::string& directory);

/// The name that the corpus has for a dialect: "sqlite", "postgresql", "mysql", "sqlserver",
/// "standard".
std::string nameOf(zandor::model::sql::Dialect dialect);

std::string nameOf(zandor::model::Finding::Kind kind);

/// The query that a case draws, over the tables of a database.
zandor::platform::Ref<zandor::model::Query> draw(const Case& drawn,
                                                 zandor::reader::DatabaseReader& database);

} // namespace corpus
