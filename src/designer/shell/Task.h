#pragma once

#include <Zandor/files/Output.h>
#include <Zandor/reader/Result.h>
#include <Zandor/sql/Dialect.h>

#include <QMap>
#include <QStringList>

#include <optional>

class QCommandLineOption;
class QCommandLineParser;

/// What the designer does in a shell, without a window.
namespace zandor::designer::shell {

enum class Format { csv, json };

struct Task {
    enum class Kind { printStatement, runQuery, drawStatements };

    Kind kind = Kind::printStatement;
    QString query = {};          ///< the file
    QStringList statements = {}; ///< files to be drawn; "-" is the standard input stream
    QString drawing = {};        ///< the query file, or the folder for several, that is written
    std::optional<model::sql::Dialect> dialect = {}; ///< nothing: that of the query's database
    Format format = Format::csv;
    QString database = {}; ///< an address; empty: the one that the query names
    std::optional<qint64> limit = {};
    QMap<QString, QString> values = {}; ///< of the parameters
};

/// The options by which a task is given.
QList<QCommandLineOption> options();
/// The task that a command line asks for; nothing when it asks for none.
reader::Result<std::optional<Task>> taskOf(const QCommandLineParser& parser);

/// Does a task, and returns the program's exit code. Needs a QCoreApplication and no display. What
/// went wrong is on the standard error stream, in one line.
int perform(const Task& task);

// What perform() is made of.
int printStatement(const Task& task);
int runQuery(const Task& task);
int drawStatements(const Task& task);
files::Stream standardOutput();

inline constexpr int allWell = 0;
inline constexpr int failed = 1;   ///< the statement could not be written, run or drawn
inline constexpr int unusable = 2; ///< arguments, a file or the database

/// Writes to the standard output stream; what could not be written is complained about. Returns the
/// exit code.
int print(const QByteArray& text);

/// Writes a line to the standard error stream, with the program's name before it.
void complain(const QString& what);

} // namespace zandor::designer::shell
