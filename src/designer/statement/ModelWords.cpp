#include "designer/statement/ModelWords.h"

#include <QCoreApplication>
#include <QRegularExpression>

#include <vector>

namespace zandor::designer {

namespace {

constexpr const char* messages[] = {
    // the query
    QT_TRANSLATE_NOOP("Model", "The query has no tables: add one first."),
    QT_TRANSLATE_NOOP("Model", "The table of an output column is no longer in the query: delete "
                               "the output column, or choose another field for it."),
    QT_TRANSLATE_NOOP("Model", "%1.* stands for all columns and cannot be sorted by: add the "
                               "column that is to decide, and sort by that."),
    QT_TRANSLATE_NOOP("Model", "%1.* stands for all columns and cannot have a criterion: add the "
                               "column that is meant, and write the criterion there."),
    QT_TRANSLATE_NOOP("Model", "Two output columns are named %1, so that nobody can tell them "
                               "apart: give one of them a synonym."),
    // joins
    QT_TRANSLATE_NOOP("Model", "%1 and %2 hold different kinds of values, so that their join finds "
                               "nothing or fails: join columns that hold the same."),
    QT_TRANSLATE_NOOP(
        "Model",
        "The outer join between %1 and %2 keeps no more rows than a normal one, for normal joins "
        "connect these tables too: make it a normal join, or make the others outer ones."),
    QT_TRANSLATE_NOOP(
        "Model", "The outer joins around %1 and %2 contradict each other, and the one drawn first "
                 "decides which rows are kept: let all of them keep the rows of the same table."),
    QT_TRANSLATE_NOOP("Model", "The outer joins around %1 can be read in several ways, each with "
                               "other rows: change the type of one of them."),
    QT_TRANSLATE_NOOP("Model", "No join connects %1 with %2, so that every row of one comes with "
                               "every row of the other: draw a join between them, or delete one."),
    // dialects
    QT_TRANSLATE_NOOP("Model", "MySQL/MariaDB has no join that keeps all rows of both tables: let "
                               "this one keep those of one table."),
    QT_TRANSLATE_NOOP("Model",
                      "PostgreSQL keeps all rows of both tables only where a join asks for equal "
                      "values: choose the operator =, or let the join keep the rows of one table."),
    QT_TRANSLATE_NOOP("Model", "These are more conditions than SQLite takes, which is about 900: "
                               "write a long list of values as In (1, 2, 3)."),
    QT_TRANSLATE_NOOP("Model", "%1 takes no name that is empty: write one."),
    QT_TRANSLATE_NOOP("Model",
                      "%1 takes no name with the character zero in it: choose another one."),
    QT_TRANSLATE_NOOP("Model", "%1 takes no name with half a character in it: type it afresh."),
    QT_TRANSLATE_NOOP("Model",
                      "The name \"%1\" is too long for %2, which takes %3 bytes (one for a letter "
                      "from A to Z, more for most others): choose a shorter one."),
    QT_TRANSLATE_NOOP(
        "Model",
        "The name \"%1\" is too long for %2, which takes %3 characters: choose a shorter one."),
    QT_TRANSLATE_NOOP("Model", "The name \"%1\" has a rare character in it that %2 does not take, "
                               "such as an emoji: write it without."),
    QT_TRANSLATE_NOOP(
        "Model", "The name \"%1\" ends with a blank, which %2 does not take: write it without."),
    // criteria
    QT_TRANSLATE_NOOP("Model", "%1: At character %2: %3."),
    QT_TRANSLATE_NOOP("Model", "put And or Or between two conditions, or quotes around a text"),
    QT_TRANSLATE_NOOP("Model", "this is nested too deep, 100 levels are the most"),
    QT_TRANSLATE_NOOP("Model", "a closing %1 is missing"),
    QT_TRANSLATE_NOOP("Model", "after In comes a list in parentheses, as in In (1, 2)"),
    QT_TRANSLATE_NOOP("Model",
                      "after Is comes Null or Not Null, and a text that begins so needs quotes"),
    QT_TRANSLATE_NOOP("Model", "Like works only on columns that hold text, use =, < or > here"),
    QT_TRANSLATE_NOOP("Model", "after Like comes a pattern, as in Like 'A*', not a column"),
    QT_TRANSLATE_NOOP("Model", "after Like comes a pattern, as in Like 'A*'"),
    QT_TRANSLATE_NOOP("Model", "Between needs And and a second value, as in Between 1 And 5"),
    QT_TRANSLATE_NOOP("Model", "a comma or a closing ) is missing"),
    QT_TRANSLATE_NOOP(
        "Model",
        "nothing is equal to Null, write Is Null for a missing value or 'Null' for the word"),
    QT_TRANSLATE_NOOP("Model", "a parameter needs a name, as in :year"),
    QT_TRANSLATE_NOOP("Model", "the name of a column is missing behind the point"),
    QT_TRANSLATE_NOOP("Model", "the query has no column %1"),
    QT_TRANSLATE_NOOP("Model", "the table of this column was deleted from the query"),
    QT_TRANSLATE_NOOP("Model", "several tables have this column, write the table too, as in %1"),
    QT_TRANSLATE_NOOP("Model", "compare it with a column that holds %1"),
    QT_TRANSLATE_NOOP("Model", "a criterion has at most 10000 characters"),
    QT_TRANSLATE_NOOP("Model", "the character zero cannot stand in a criterion"),
    QT_TRANSLATE_NOOP("Model", "half a character stands here, type it afresh"),
    QT_TRANSLATE_NOOP("Model", "a [ before this ] is missing"),
    QT_TRANSLATE_NOOP("Model", "write <> for unequal"),
    QT_TRANSLATE_NOOP("Model", "a name is missing between the brackets"),
    QT_TRANSLATE_NOOP("Model", "a text is missing"),
    QT_TRANSLATE_NOOP("Model", "a number is missing"),
    QT_TRANSLATE_NOOP("Model", "a date (2024-12-31) is missing"),
    QT_TRANSLATE_NOOP("Model", "a time (23:59) is missing"),
    QT_TRANSLATE_NOOP("Model", "a date and time (2024-12-31 23:59) is missing"),
    QT_TRANSLATE_NOOP("Model", "true or false is missing"),
    QT_TRANSLATE_NOOP("Model", "Is Null, a column or a parameter is missing"),
    QT_TRANSLATE_NOOP("Model", "a value is missing"),
    QT_TRANSLATE_NOOP("Model", "this is no number, write it like 12 or 1.5"),
    QT_TRANSLATE_NOOP("Model", "decimals are written with a point, as in 1.5"),
    QT_TRANSLATE_NOOP("Model", "this is no date, write it like 2024-12-31"),
    QT_TRANSLATE_NOOP("Model", "this is no time, write it like 23:59"),
    QT_TRANSLATE_NOOP("Model", "this is no date and time, write it like 2024-12-31 23:59"),
    QT_TRANSLATE_NOOP("Model", "write true or false here"),
    QT_TRANSLATE_NOOP("Model", "only Is Null, a column or a parameter can stand here"),
    QT_TRANSLATE_NOOP("Model", "only dates and times stand between two #"),
    // what a column holds
    QT_TRANSLATE_NOOP("Model", "a text"),
    QT_TRANSLATE_NOOP("Model", "a number"),
    QT_TRANSLATE_NOOP("Model", "a date (2024-12-31)"),
    QT_TRANSLATE_NOOP("Model", "a time (23:59)"),
    QT_TRANSLATE_NOOP("Model", "a date and time (2024-12-31 23:59)"),
    QT_TRANSLATE_NOOP("Model", "true or false"),
    QT_TRANSLATE_NOOP("Model", "Is Null, a column or a parameter"),
    // databases
    QT_TRANSLATE_NOOP("Model", "There is no file \"%1\"; check the path."),
    QT_TRANSLATE_NOOP("Model", "\"%1\" is a folder; choose a database file in it."),
    QT_TRANSLATE_NOOP("Model", "\"%1\" is a device, not a file; choose a database file."),
    QT_TRANSLATE_NOOP("Model",
                      "The file \"%1\" cannot be read (%2); ask its owner for permission."),
    QT_TRANSLATE_NOOP("Model", "The file \"%1\" is empty; choose a file that holds a database."),
    QT_TRANSLATE_NOOP(
        "Model",
        "The file \"%1\" is not an SQLite database, or it is encrypted; choose another file."),
    QT_TRANSLATE_NOOP("Model",
                      "The Qt driver for %1 is missing; install it (Debian: apt install %2)."),
    QT_TRANSLATE_NOOP(
        "Model",
        "The list of tables cannot be read (the connection is closed): open the database afresh."),
    QT_TRANSLATE_NOOP("Model",
                      "The table \"%1\" is not in the database; read the list of tables afresh."),
    QT_TRANSLATE_NOOP("Model", "The address has an unknown option \"%1\"; known are %2 and host."),
    QT_TRANSLATE_NOOP(
        "Model", "The option %1 of the address has a semicolon in it; use a value without one."),
    QT_TRANSLATE_NOOP("Model", "The address of the database cannot be read; write it like %1, with "
                               "%XX for a character that means something else there."),
    QT_TRANSLATE_NOOP("Model", "There is no kind of database \"%1\"; write it like %2."),
    // what failed (what the engine said): what to do
    QT_TRANSLATE_NOOP("Model", "%1 (%2): %3."),
    QT_TRANSLATE_NOOP("Model", "The database %1 cannot be opened"),
    QT_TRANSLATE_NOOP("Model", "The list of tables cannot be read"),
    QT_TRANSLATE_NOOP("Model", "The table \"%1\" cannot be read"),
    QT_TRANSLATE_NOOP("Model", "The primary key of \"%1\" cannot be read"),
    QT_TRANSLATE_NOOP("Model", "The foreign keys of \"%1\" cannot be read"),
    QT_TRANSLATE_NOOP("Model", "give a password"),
    QT_TRANSLATE_NOOP("Model", "check the user name and the password"),
    QT_TRANSLATE_NOOP("Model", "ask the server's administrator to let you in"),
    QT_TRANSLATE_NOOP("Model", "check the name of the host"),
    QT_TRANSLATE_NOOP("Model", "see that the server runs, and check host and port"),
    QT_TRANSLATE_NOOP("Model", "see that the server can be reached, and check host and port"),
    QT_TRANSLATE_NOOP("Model", "check the name of the database"),
    QT_TRANSLATE_NOOP("Model", "ask the owner for permission"),
    QT_TRANSLATE_NOOP("Model", "check the user name"),
    QT_TRANSLATE_NOOP("Model", "open the database afresh"),
    QT_TRANSLATE_NOOP("Model", "another program is writing to it; try again in a moment"),
    QT_TRANSLATE_NOOP("Model", "see that you may read the file and its folder; a database in WAL "
                               "mode also needs permission to write to the folder"),
    QT_TRANSLATE_NOOP("Model", "the file is damaged; restore it from a copy"),
    QT_TRANSLATE_NOOP("Model", "it is damaged or encrypted; choose another file"),
    // files (what the system said); what to do
    QT_TRANSLATE_NOOP("Model", "\"%1\" is not a file; choose another name."),
    QT_TRANSLATE_NOOP("Model", "\"%1\" is not a file; choose a query file."),
    QT_TRANSLATE_NOOP("Model", "The file \"%1\" is write-protected; save under another name."),
    QT_TRANSLATE_NOOP("Model", "%1 (%2); %3."),
    QT_TRANSLATE_NOOP("Model", "The file \"%1\" cannot be saved"),
    QT_TRANSLATE_NOOP("Model", "The file \"%1\" cannot be read"),
    QT_TRANSLATE_NOOP("Model", "The output cannot be written"),
    QT_TRANSLATE_NOOP("Model", "The rows cannot be written"),
    QT_TRANSLATE_NOOP("Model", "check the path"),
    QT_TRANSLATE_NOOP("Model", "choose a shorter name"),
    QT_TRANSLATE_NOOP("Model", "ask the owner for permission, or choose another folder"),
    QT_TRANSLATE_NOOP("Model", "make room on the disk, or choose another one"),
    QT_TRANSLATE_NOOP("Model", "choose another disk"),
    QT_TRANSLATE_NOOP("Model", "choose a folder on another disk"),
    QT_TRANSLATE_NOOP("Model", "try again, or choose another folder"),
};

/// Whether what was put into a message may be messages of their own.
bool nests(QLatin1String english) {
    return english.endsWith(QLatin1String(": %3.")) || english.endsWith(QLatin1String("; %3.")) ||
           english.endsWith(QLatin1String("holds %1"));
}

/// A message as it is recognised: its own text around what was put into it.
struct Message {
    const char* english;
    QRegularExpression shape;
};

QRegularExpression shapeOf(const char* english) {
    static const QRegularExpression placeholder(QStringLiteral("\\\\%[1-9]"));
    QString shape = QRegularExpression::escape(QString::fromLatin1(english));
    shape.replace(placeholder, QStringLiteral("(.*?)"));
    return QRegularExpression(QRegularExpression::anchoredPattern(shape),
                              QRegularExpression::DotMatchesEverythingOption);
}

const std::vector<Message>& shapes() {
    static const std::vector<Message> all = [] {
        std::vector<Message> result;
        for (const char* english : messages) result.push_back({english, shapeOf(english)});
        return result;
    }();
    return all;
}

/// Puts texts in the place of %1 and so on, all at once: a name may have such a mark in it.
QString filled(const QString& pattern, const QStringList& texts) {
    QString result;
    for (qsizetype at = 0; at < pattern.size(); ++at) {
        const int number = at + 1 < pattern.size() ? pattern[at + 1].digitValue() : -1;
        if (pattern[at] == u'%' && number >= 1 && number <= texts.size()) {
            result += texts[number - 1];
            ++at;
        } else {
            result += pattern[at];
        }
    }
    return result;
}

} // namespace

QString inWords(const QString& message) {
    for (const auto& [english, shape] : shapes()) {
        const auto match = shape.match(message);
        if (!match.hasMatch()) continue;
        QStringList texts = match.capturedTexts().mid(1);
        if (nests(QLatin1String(english)))
            for (QString& text : texts) text = inWords(text);
        return filled(QCoreApplication::translate("Model", english), texts);
    }
    return message;
}

std::optional<QString> inWords(const std::optional<files::Error>& error) {
    if (!error) return {};
    return inWords(QString::fromStdString(error->text));
}

QStringList knownMessages() {
    QStringList result;
    for (const char* english : messages) result << QString::fromLatin1(english);
    return result;
}

} // namespace zandor::designer
