#include "designer/Arguments.h"

#include <QCommandLineParser>

namespace zandor::designer {

namespace {

/// Whether an option is there, alone or with "=" and a value.
bool hasAny(const QStringList& arguments, const QStringList& options) {
    for (const QString& argument : arguments) {
        if (argument == QLatin1String("--")) return false; // behind it everything is a file
        if (options.contains(argument.section(QLatin1Char('='), 0, 0))) return true;
    }
    return false;
}

} // namespace

reader::Result<Arguments> readArguments(const QStringList& arguments) {
    QCommandLineParser parser;
    const QCommandLineOption tables(QStringLiteral("tables"), {}, QStringLiteral("names"));
    const QCommandLineOption screenshot(QStringLiteral("screenshot"), {}, QStringLiteral("file"));
    const QCommandLineOption picture(QStringLiteral("picture"), {}, QStringLiteral("query"));
    const QCommandLineOption asShown(QStringLiteral("as-shown"));
    const QCommandLineOption dark(QStringLiteral("dark"));
    parser.addOptions({tables, screenshot, picture, asShown, dark});
    parser.addOptions(shell::options());
    // The parser takes the first argument for the program's name.
    if (!parser.parse(QStringList(QStringLiteral("zandor-designer")) + arguments))
        return reader::Error{parser.errorText() + QStringLiteral(" See --help.")};

    const QStringList files = parser.positionalArguments();
    const bool draws = parser.isSet(QStringLiteral("draw")); // any number of them
    if (files.size() > 1 && !draws)
        return reader::Error{QStringLiteral("There are %1 files; name one.").arg(files.size())};

    Arguments result;
    if (!files.isEmpty() && !draws) result.file = files.first();
    for (const QString& list : parser.values(tables))
        for (const QString& name : list.split(QLatin1Char(',')))
            if (const QString trimmed = name.trimmed(); !trimmed.isEmpty())
                result.tables.append(trimmed);
    if (parser.isSet(tables) && result.tables.isEmpty())
        return reader::Error{
            QStringLiteral("--tables names no table; write --tables customers,orders.")};
    result.screenshot = parser.value(screenshot);
    if (parser.isSet(screenshot) && result.screenshot.isEmpty())
        return reader::Error{
            QStringLiteral("--screenshot names no file; write --screenshot window.png.")};
    if (parser.isSet(picture)) {
        result.drawing = parser.value(picture);
        result.picture = std::exchange(result.file, {});
        if (result.drawing.isEmpty() || result.picture.isEmpty())
            return reader::Error{
                QStringLiteral("--picture takes two files; write --picture query.json out.svg.")};
        if (!result.tables.isEmpty() || !result.screenshot.isEmpty())
            return reader::Error{
                QStringLiteral("--picture opens no window; leave out what is for one.")};
    }
    result.asShown = parser.isSet(asShown);
    if (result.asShown && result.picture.isEmpty())
        return reader::Error{QStringLiteral("--as-shown goes with --picture only.")};
    result.dark = parser.isSet(dark);
    const auto task = shell::taskOf(parser);
    if (!task) return task.failure();
    result.task = *task;
    const bool window = !result.file.isEmpty() || !result.tables.isEmpty() ||
                        !result.screenshot.isEmpty() || !result.picture.isEmpty();
    if (result.task && window)
        return reader::Error{
            QStringLiteral("--sql, --run and --draw open no window; leave out what is for one.")};
    return result;
}

bool asksForHelp(const QStringList& arguments) {
    return hasAny(arguments, {QStringLiteral("--help"), QStringLiteral("-h")});
}

bool asksForVersion(const QStringList& arguments) {
    return hasAny(arguments, {QStringLiteral("--version"), QStringLiteral("-v")});
}

bool asksForPicture(const QStringList& arguments) {
    return hasAny(arguments, {QStringLiteral("--picture"), QStringLiteral("--screenshot")});
}

bool asksForTask(const QStringList& arguments) {
    return hasAny(arguments,
                  {QStringLiteral("--sql"), QStringLiteral("--run"), QStringLiteral("--draw")});
}

QString helpText() {
    return QStringLiteral(R"(Usage: zandor-designer [options] [FILE|ADDRESS|QUERY]
       zandor-designer --picture QUERY OUT [--as-shown]
       zandor-designer --sql QUERY [--dialect NAME]
       zandor-designer --run QUERY [--format csv|json] [--database ADDRESS]
                       [--limit N] [--set NAME=VALUE]...
       zandor-designer --draw STATEMENT... OUT --database ADDRESS
Designs a query over the tables of a database, which is only read: an SQLite
file, an address like postgresql://user@host/database, or the file of a query.

Without any of them the sample database is opened, with a small query to look
at.

Options:
  --tables NAMES   tables to begin with, with commas between them; otherwise
                   the drawing is empty
  --screenshot FILE
                   draw the window into a picture (PNG) and end
  --dark           dark colours, whatever the desktop uses

Without a window, over a file of a query:
  --picture QUERY OUT
                   draw its tables and joins into OUT, a picture by its name:
                   .png, .svg or .pdf
  --as-shown       with the tables as high as in the window, instead of with
                   all their columns
  --sql QUERY      print the statement
  --dialect NAME   for sqlite, postgresql, mysql, sqlserver or standard;
                   otherwise for the query's database
  --run QUERY      run it and print the rows; nothing is ever changed
  --format NAME    csv (otherwise) or json; blobs are in Base64
  --database ADDRESS
                   an SQLite file or postgresql://user@host:port/database,
                   instead of the one in the file; a password comes from
                   PGPASSWORD or is asked for on the terminal
  --limit N        no more than N rows
  --set NAME=VALUE the value of a parameter

Without a window, over SQL text:
  --draw STATEMENT... OUT
                   read SELECT statements as drawings over the tables of
                   --database: a file, or - for the standard input stream,
                   into a query file OUT; several into a folder OUT

  --help, -h       show this
  --version, -v    show the version

Exit codes: 0 all well, 1 the picture could not be written, the query not be
run or a statement not be drawn, 2 the arguments, a file, the database or the output cannot be used.
)");
}

QString versionText() { return QStringLiteral("zandor-designer " ZANDOR_VERSION "\n"); }

} // namespace zandor::designer
