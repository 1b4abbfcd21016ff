#include "designer/shell/Task.h"

#include "designer/shell/Words.h"
#include "designer/statement/ModelWords.h"

#include <QCommandLineParser>

#include <unistd.h>

#include <cstdio>
#include <utility>

namespace zandor::designer::shell {

using model::sql::Dialect;
using reader::Error;

namespace {

const std::pair<const char*, Dialect> dialects[] = {{"sqlite", Dialect::SQLite},
                                                    {"postgresql", Dialect::PostgreSQL},
                                                    {"mysql", Dialect::MySQL},
                                                    {"sqlserver", Dialect::SqlServer},
                                                    {"standard", Dialect::Standard}};

std::optional<Dialect> dialectNamed(const QString& name) {
    for (const auto& [known, dialect] : dialects)
        if (name == QLatin1String(known)) return dialect;
    return {};
}

/// What is wrong with the options that say how to run, or nothing.
std::optional<QString> takeRun(const QCommandLineParser& parser, Task& task) {
    const QString format = parser.value(QStringLiteral("format"));
    if (format == QLatin1String("json"))
        task.format = Format::json;
    else if (parser.isSet(QStringLiteral("format")) && format != QLatin1String("csv"))
        return Words::tr("There is no format \"%1\"; write --format csv or --format json.")
            .arg(format);
    task.database = parser.value(QStringLiteral("database"));
    if (parser.isSet(QStringLiteral("limit"))) {
        bool whole = false;
        const qint64 limit = parser.value(QStringLiteral("limit")).toLongLong(&whole);
        constexpr qint64 most = 1'000'000'000'000;
        if (!whole || limit < 0 || limit > most)
            return Words::tr("--limit takes a number of rows; write --limit 100.");
        task.limit = limit;
    }
    for (const QString& setting : parser.values(QStringLiteral("set"))) {
        const qsizetype sign = setting.indexOf(u'=');
        if (sign < 1)
            return Words::tr("\"%1\" sets nothing; write --set NAME=VALUE.")
                .arg(setting.simplified());
        task.values.insert(setting.left(sign), setting.mid(sign + 1));
    }
    return {};
}

/// What is wrong with the files of --draw, or nothing.
std::optional<QString> takeDraw(const QCommandLineParser& parser, Task& task) {
    task.kind = Task::Kind::drawStatements;
    task.statements = parser.values(QStringLiteral("draw")) + parser.positionalArguments();
    task.database = parser.value(QStringLiteral("database"));
    if (task.statements.size() < 2 || task.statements.contains(QString()))
        return Words::tr("--draw takes two files; write --draw statement.sql query.json.");
    task.drawing = task.statements.takeLast();
    if (task.database.isEmpty())
        return Words::tr("--draw needs to know the tables; name their database with --database.");
    return {};
}

} // namespace

QList<QCommandLineOption> options() {
    QList<QCommandLineOption> result;
    for (const char* name : {"sql", "run", "draw", "dialect", "format", "database", "limit", "set"})
        result << QCommandLineOption(QLatin1String(name), {}, QStringLiteral("value"));
    return result;
}

reader::Result<std::optional<Task>> taskOf(const QCommandLineParser& parser) {
    const auto isSet = [&](const char* name) { return parser.isSet(QLatin1String(name)); };
    const bool prints = isSet("sql");
    const bool runs = isSet("run");
    const bool draws = isSet("draw");
    if (prints + runs + draws > 1)
        return Error{Words::tr("--sql, --run and --draw go one at a time.")};
    for (const char* name : {"format", "limit", "set"})
        if (isSet(name) && !runs)
            return Error{Words::tr("--%1 goes with --run only.").arg(QLatin1String(name))};
    if (isSet("database") && !runs && !draws)
        return Error{Words::tr("--database goes with --run and --draw only.")};
    if (isSet("dialect") && !prints) return Error{Words::tr("--dialect goes with --sql only.")};
    if (!prints && !runs && !draws) return std::optional<Task>();

    Task task;
    if (draws) {
        if (const auto wrong = takeDraw(parser, task)) return Error{*wrong};
        return std::optional<Task>(task);
    }
    task.kind = prints ? Task::Kind::printStatement : Task::Kind::runQuery;
    task.query = parser.value(prints ? QStringLiteral("sql") : QStringLiteral("run"));
    if (task.query.isEmpty())
        return Error{Words::tr("No query is named; write --%1 query.json.")
                         .arg(QLatin1String(prints ? "sql" : "run"))};
    if (isSet("dialect")) {
        const QString name = parser.value(QStringLiteral("dialect"));
        task.dialect = dialectNamed(name);
        if (!task.dialect)
            return Error{
                Words::tr("There is no dialect \"%1\"; known are sqlite, postgresql, mysql, "
                          "sqlserver and standard.")
                    .arg(name)};
    }
    if (const auto wrong = takeRun(parser, task)) return Error{*wrong};
    return std::optional<Task>(task);
}

int perform(const Task& task) {
    switch (task.kind) {
    case Task::Kind::printStatement: return printStatement(task);
    case Task::Kind::runQuery: return runQuery(task);
    case Task::Kind::drawStatements: break;
    }
    return drawStatements(task);
}

int print(const QByteArray& text) {
    files::Stream out = standardOutput();
    auto error = out.write({text.constData(), std::size_t(text.size())});
    if (!error) error = out.flush();
    if (!error) return allWell;
    complain(*inWords(error));
    return unusable;
}

files::Stream standardOutput() {
    // On a terminal one sees each row as it comes.
    return {STDOUT_FILENO, model::say<files::MessageCode::outputNotWritten>(),
            isatty(STDOUT_FILENO) ? files::Stream::nothingWaits : files::Stream::usuallyWaiting};
}

void complain(const QString& what) {
    const QByteArray line = "zandor-designer: " + what.simplified().toLocal8Bit() + '\n';
    std::fputs(line.constData(), stderr);
}

} // namespace zandor::designer::shell
