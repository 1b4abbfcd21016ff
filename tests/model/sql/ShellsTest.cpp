#include "Corpus.h"
#include "Engines.h"

#include "model/criteria/Literals.h"

#include <QProcess>
#include <QRegularExpression>
#include <QStandardPaths>

#include <gtest/gtest.h>

#include <algorithm>
#include <iostream>

using namespace zandor;

using corpus::Case;
using model::sql::Dialect;
using model::sql::Parameter;
using model::sql::ValueForm;

// What is copied or printed to be run elsewhere, through the engines' own shells.

namespace {

struct Ended {
    QByteArray out;
    std::string error; ///< empty where all went well
};

/// A shell over the sample database: what it is given, line by line, is what a user would paste.
class Shell {
public:
    explicit Shell(Dialect dialect) : mDialect(dialect) {
        const QSqlDatabase& database = sampleEngines().database(dialect);
        switch (dialect) {
        case Dialect::PostgreSQL:
            mProgram = QStringLiteral("psql");
            mArguments = {u"-XqAt"_qs,
                          u"-F"_qs,
                          u"\t"_qs,
                          u"-v"_qs,
                          u"ON_ERROR_STOP=1"_qs,
                          u"-h"_qs,
                          database.hostName(),
                          u"-U"_qs,
                          u"postgres"_qs,
                          u"postgres"_qs};
            mFirst = "SET search_path = sample;\n";
            break;
        case Dialect::MySQL:
            mProgram = QStringLiteral("mariadb");
            mArguments = {u"--no-defaults"_qs,
                          u"--batch"_qs,
                          u"--skip-column-names"_qs,
                          u"--default-character-set=utf8mb4"_qs,
                          u"--user=root"_qs,
                          u"--socket="_qs + database.connectOptions().section(u'=', 1),
                          u"sample"_qs};
            // A variable has the session's collation, which has to be that of the columns.
            mFirst = "SET NAMES utf8mb4 COLLATE utf8mb4_uca1400_nopad_as_ci;\n";
            break;
        default:
            mProgram = QStringLiteral("sqlite3");
            mArguments = {u"-batch"_qs, u"-bail"_qs, u"-separator"_qs, u"\t"_qs,
                          database.databaseName()};
        }
    }

    bool isThere() const { return !QStandardPaths::findExecutable(mProgram).isEmpty(); }

    /// Gives a parameter a value, in the way of the shell's manual.
    void set(const QString& name, const Parameter& parameter, const std::string& answer) {
        const auto typed = platform::fromUtf8(answer);
        const auto value =
            parameter.pattern
                ? model::sql::Value{model::ColumnType::Text, model::criteria::likePattern(typed)}
                : model::criteria::literal(typed, parameter.type).value();
        const bool bytes = value.type == model::ColumnType::Blob;
        const QString text =
            (bytes ? u"\\x"_qs : QString()) + QString::fromStdU16String(value.text);
        const QString written = QString::fromStdU16String(model::sql::literal(value, mDialect));
        switch (mDialect) {
        case Dialect::PostgreSQL: mArguments << u"-v"_qs << name + u'=' + text; break;
        case Dialect::MySQL:
            mFirst += "SET @" + name.toUtf8() + " = " + written.toUtf8() + ";\n";
            break;
        default:
            mArguments << u"-cmd"_qs
                       << u".parameter set :%1 \"%2\""_qs.arg(
                              name, QString(written).replace(u'\\', u"\\\\"_qs));
        }
    }

    Ended run(const QByteArray& text) const {
        QProcess process;
        process.start(mProgram, mArguments);
        process.write(mFirst + text);
        process.closeWriteChannel();
        if (!process.waitForFinished(120'000)) return {{}, "it does not end"};
        const QByteArray said = process.readAllStandardError();
        Ended ended{process.readAllStandardOutput(), said.toStdString()};
        if (process.exitCode() != 0 && said.isEmpty()) ended.error = "it failed without a word";
        return ended;
    }

    /// A statement in words that all engines have.
    QByteArray common(const std::string& statement) const {
        const QByteArray text = QByteArray::fromStdString(statement) + ";\n";
        if (mDialect != Dialect::MySQL) return text;
        return "SET sql_mode = 'ANSI_QUOTES,PIPES_AS_CONCAT,NO_BACKSLASH_ESCAPES';\n" + text +
               "SET sql_mode = DEFAULT;\n";
    }

private:
    Dialect mDialect;
    QString mProgram;
    QStringList mArguments;
    QByteArray mFirst;
};

/// The lines in order, with numbers written alike.
QList<QByteArray> rowsOf(const QByteArray& out) {
    QList<QByteArray> rows;
    for (const QByteArray& line : out.split('\n')) {
        QList<QByteArray> cells;
        for (const QByteArray& cell : line.split('\t')) {
            bool number = false;
            const double value = cell.toDouble(&number);
            cells << (number ? QByteArray::number(value, 'g', 12) : cell);
        }
        rows << cells.join('\t');
    }
    std::sort(rows.begin(), rows.end());
    return rows;
}

/// A line between the rows of two statements.
QByteArray mark(std::size_t n) { return "~~~~ " + QByteArray::number(qulonglong(n)) + " ~~~~"; }

model::sql::Text script(const Case& drawn, Dialect dialect) {
    const auto query = corpus::draw(drawn, sampleEngines().reader());
    return model::sql::statementText(*query, dialect, ValueForm::script);
}

/// The names that the parameters of a statement have in its text, in their order.
QStringList shellNames(const QString& text) {
    // What is in quotes is none.
    static const QRegularExpression part(
        QStringLiteral("\"[^\"]*\"|`[^`]*`|:'(\\w+)'|'(?:[^']|'')*'|[:@](\\w+)"),
        QRegularExpression::UseUnicodePropertiesOption);
    QStringList names;
    for (auto all = part.globalMatch(text); all.hasNext();) {
        const auto match = all.next();
        const QString name = match.captured(1) + match.captured(2);
        if (!name.isEmpty()) names << name;
    }
    return names;
}

std::vector<Case> casesFor(Dialect dialect, bool answered) {
    std::vector<Case> cases;
    for (const Case& drawn : corpus::read(CORPUS))
        if (drawn.references.contains(corpus::nameOf(dialect)) &&
            drawn.answers.empty() != answered && !(drawn.collated && dialect == Dialect::MySQL) &&
            script(drawn, dialect).runnable())
            cases.push_back(drawn);
    return cases;
}

} // namespace

TEST(AShell, TakesTheCopiedStatementsOneBehindTheOther) {
    for (const Dialect dialect : sampleEngines().dialects()) {
        SCOPED_TRACE(corpus::nameOf(dialect));
        const Shell shell(dialect);
        ASSERT_TRUE(shell.isThere());
        const std::vector<Case> cases = casesFor(dialect, false);
        QByteArray ours;
        QByteArray theirs;
        for (std::size_t n = 0; n < cases.size(); ++n) {
            const QByteArray next = "SELECT '" + mark(n) + "';\n";
            const std::string text = platform::toUtf8(script(cases[n], dialect).text);
            EXPECT_EQ(text.back(), ';');
            ours += QByteArray::fromStdString(text) + '\n' + next;
            theirs += shell.common(cases[n].references.at(corpus::nameOf(dialect))) + next;
        }
        Ended found = shell.run(ours);
        Ended expected = shell.run(theirs);
        ASSERT_EQ(found.error, "");
        ASSERT_EQ(expected.error, "");
        for (std::size_t n = 0; n < cases.size(); ++n) {
            const auto taken = [n](QByteArray& out) {
                const qsizetype end = out.indexOf(mark(n));
                const QByteArray rows = out.left(end);
                out.remove(0, end + mark(n).size() + 1);
                return rowsOf(rows);
            };
            const auto rows = taken(found.out);
            EXPECT_GT(rows.size(), 1) << cases[n].name;
            EXPECT_EQ(rows, taken(expected.out)) << cases[n].name;
        }
        std::cout << corpus::nameOf(dialect) << ": " << cases.size() << " statements\n";
        EXPECT_GT(cases.size(), 300u);
    }
}

TEST(AShell, TakesItsOwnParametersInTheCopiedStatement) {
    for (const Dialect dialect : sampleEngines().dialects()) {
        SCOPED_TRACE(corpus::nameOf(dialect));
        int asked = 0;
        for (const Case& drawn : casesFor(dialect, true)) {
            SCOPED_TRACE(drawn.name);
            const auto text = script(drawn, dialect);
            Shell shell(dialect);
            const QStringList names = shellNames(QString::fromStdU16String(text.text));
            std::vector<Parameter> parameters;
            for (const auto& binding : text.bindings)
                if (const auto* parameter = std::get_if<Parameter>(&binding))
                    parameters.push_back(*parameter);
            ASSERT_EQ(names.size(), static_cast<qsizetype>(parameters.size()))
                << platform::toUtf8(text.text);
            for (std::size_t n = 0; n < parameters.size(); ++n)
                shell.set(names[static_cast<qsizetype>(n)], parameters[n],
                          drawn.answers.at(platform::toUtf8(parameters[n].name)));
            const Ended found = shell.run(QByteArray::fromStdString(platform::toUtf8(text.text)));
            const Ended expected =
                Shell(dialect).run(shell.common(drawn.references.at(corpus::nameOf(dialect))));
            ASSERT_EQ(found.error, "") << platform::toUtf8(text.text);
            ASSERT_EQ(expected.error, "");
            EXPECT_GT(rowsOf(found.out).size(), 1);
            EXPECT_EQ(rowsOf(found.out), rowsOf(expected.out)) << platform::toUtf8(text.text);
            ++asked;
        }
        std::cout << corpus::nameOf(dialect) << ": " << asked << " statements with parameters\n";
        EXPECT_GT(asked, 10);
    }
}
