#include "Corpus.h"
#include "Engines.h"
#include "model/sql/ReservedWords.h"

#include <QSqlError>
#include <QSqlQuery>

#include <gtest/gtest.h>
#include <sqlite3.h>

#include <iostream>
#include <set>

using namespace zandor;

using namespace model::sql;
using model::ColumnType;
using platform::fromUtf8;
using platform::String;
using platform::toUtf8;

// Every word that any engine knows, as the name of a table, of a column and of what comes out, and
// as another name for a table, on every engine: in quotes where quotes are written, and bare where
// none are.

namespace {

using Words = std::set<std::string>;

/// Those that MariaDB takes bare and MySQL does not.
const Words reservedElsewhere = {"_gb18030",
                                 "cube",
                                 "cume_dist",
                                 "database",
                                 "dense_rank",
                                 "empty",
                                 "external",
                                 "first_value",
                                 "function",
                                 "generated",
                                 "get",
                                 "grouping",
                                 "groups",
                                 "io_after_gtids",
                                 "io_before_gtids",
                                 "json_table",
                                 "lag",
                                 "last_value",
                                 "lateral",
                                 "lead",
                                 "library",
                                 "manual",
                                 "master_bind",
                                 "nth_value",
                                 "ntile",
                                 "of",
                                 "optimizer_costs",
                                 "option",
                                 "parallel",
                                 "percent_rank",
                                 "qualify",
                                 "rank",
                                 "row",
                                 "schema",
                                 "stored",
                                 "system",
                                 "tablesample",
                                 "virtual"};

QStringList column(Dialect dialect, const char* statement) {
    QSqlQuery query(smallEngines().database(dialect));
    if (!query.exec(QString::fromLatin1(statement)))
        throw std::runtime_error(query.lastError().text().toStdString());
    QStringList cells;
    while (query.next()) cells << query.value(0).toString().toLower();
    return cells;
}

void add(Words& words, const QStringList& more) {
    for (const QString& word : more) words.insert(word.toStdString());
}

bool isName(const std::string& word) {
    return word.find_first_not_of("abcdefghijklmnopqrstuvwxyz0123456789_") == std::string::npos;
}

/// What the engines say themselves, and what is known of those that are not here.
Words everyWord() {
    Words words;
    for (const Dialect dialect : allDialects)
        for (const auto word : reservedWords(dialect)) words.insert(toUtf8(word));
    for (int n = 0; n < sqlite3_keyword_count(); ++n) {
        const char* word = nullptr;
        int size = 0;
        sqlite3_keyword_name(n, &word, &size);
        add(words, {QString::fromLatin1(word, size).toLower()});
    }
    for (const Dialect dialect : smallEngines().dialects()) {
        if (dialect == Dialect::PostgreSQL)
            add(words, column(dialect, "SELECT word FROM pg_get_keywords()"));
        if (dialect == Dialect::MySQL) {
            add(words, column(dialect, "SELECT word FROM information_schema.keywords"));
            add(words, column(dialect, "SELECT concat('_', character_set_name) "
                                       "FROM information_schema.character_sets"));
        }
    }
    std::erase_if(words, [](const std::string& word) { return !isName(word); });
    return words;
}

SourceNode table(String name, String alias) {
    return std::make_shared<const Source>(Source{TableRef{{}, std::move(name), std::move(alias)}});
}

Node is(const String& table, const String& column) {
    return make(ColumnRef{table, column, ColumnType::Integer});
}

/// A word wherever a name can stand, in statements that find one row of one 1.
std::vector<Statement> statements(const String& word) {
    std::vector<Statement> all(3);
    const Node own = is(word, word);
    all[0].items = {{own, word}};
    all[0].from = {table(word, word)};
    all[0].where = make(Compare{Comparison::equal, own, own});
    all[0].group = {own};
    all[0].order = {{own, false}};
    all[1].items = {{is(word, u"x"), {}}};
    all[1].from = {std::make_shared<const Source>(
        Source{JoinSource{JoinKind::leftOuter,
                          table(u"plain", word),
                          table(u"plain", u"zz_other"),
                          make(Compare{Comparison::equal, is(word, u"x"), is(u"zz_other", u"x")}),
                          {}}})};
    all[2].items = {{is(u"zz_one", word), {}}};
    const Node same = make(Compare{Comparison::equal, is(u"zz_one", word), is(word, word)});
    all[2].from = {std::make_shared<const Source>(
        Source{JoinSource{JoinKind::inner, table(word, u"zz_one"), table(word, word), same, {}}})};
    return all;
}

std::string written(const Statement& statement, Dialect dialect) {
    const auto printed = print(statement, dialect, ValueForm::literal);
    return toUtf8(std::get<Printed>(printed).text);
}

bool findsItsRow(Dialect dialect, const std::string& statement) {
    const Outcome outcome = smallEngines().run(dialect, QString::fromStdString(statement));
    return outcome.error.isEmpty() && outcome.rows == QStringList{QStringLiteral("1")};
}

std::string replaced(std::string text, const std::string& what, const std::string& by) {
    for (std::size_t at = 0; (at = text.find(what, at)) != std::string::npos; at += by.size())
        text.replace(at, what.size(), by);
    return text;
}

std::string always(Dialect dialect, const std::string& name) {
    const char mark = dialect == Dialect::MySQL ? '`' : '"';
    return mark + name + mark;
}

} // namespace

TEST(EveryKeyword, IsANameOnEveryEngineAndStandsInQuotesOnlyWhereItHasTo) {
    const Words words = everyWord();
    for (const Dialect dialect : smallEngines().dialects()) {
        SCOPED_TRACE(corpus::nameOf(dialect));
        const QSqlDatabase& database = smallEngines().database(dialect);
        run(database, QStringLiteral("CREATE TEMPORARY TABLE plain (x integer)"));
        run(database, QStringLiteral("INSERT INTO plain VALUES (1)"));
        int inQuotes = 0;
        for (const std::string& word : words) {
            const std::string quoted = always(dialect, word);
            run(database, QString::fromStdString("CREATE TEMPORARY TABLE " + quoted + " (" +
                                                 quoted + " integer)"));
            run(database, QString::fromStdString("INSERT INTO " + quoted + " VALUES (1)"));
            const bool quotes = toUtf8(identifier(fromUtf8(word), dialect)) != word;
            bool couldBeBare = true;
            for (const Statement& statement : statements(fromUtf8(word))) {
                const std::string text = written(statement, dialect);
                EXPECT_TRUE(findsItsRow(dialect, text)) << text;
                couldBeBare = couldBeBare && findsItsRow(dialect, replaced(text, quoted, word));
            }
            inQuotes += quotes;
            const bool elsewhere = dialect == Dialect::MySQL && reservedElsewhere.contains(word);
            if (quotes && !elsewhere) {
                EXPECT_FALSE(couldBeBare) << word << " needs no quotes";
            }
            run(database, QString::fromStdString("DROP TABLE " + quoted));
        }
        run(database, QStringLiteral("DROP TABLE plain"));
        std::cout << corpus::nameOf(dialect) << ": " << words.size() << " words, " << inQuotes
                  << " of them in quotes\n";
    }
}

// Letters and signs beyond those of keywords: what stands bare is read as itself.
TEST(EveryCharacter, StandsBareInANameOnlyWhereTheEngineReadsItAsItself) {
    for (const Dialect dialect : smallEngines().dialects()) {
        SCOPED_TRACE(corpus::nameOf(dialect));
        const QSqlDatabase& database = smallEngines().database(dialect);
        // Numbered, for an engine may take no notice of an accent.
        QStringList bare;
        const QString mark = dialect == Dialect::MySQL ? u"`"_qs : u"\""_qs;
        for (char16_t c = 1; c < 0xFFFE; ++c) {
            const String number = platform::decimal(c);
            for (const String& name : {u'z' + number + c, c + (u'z' + number)})
                if (!cannotCarry(name, dialect) && identifier(name, dialect) == name)
                    bare << QString::fromStdU16String(name);
        }
        constexpr int atOnce = 200;
        for (int from = 0; from < bare.size(); from += atOnce) {
            const QStringList columns = bare.mid(from, atOnce);
            run(database, u"CREATE TEMPORARY TABLE zz_names ("_qs + mark +
                              columns.join(mark + u" integer, "_qs + mark) + mark +
                              u" integer)"_qs);
            QSqlQuery query(database);
            EXPECT_TRUE(query.exec(u"SELECT "_qs + columns.join(u", ") + u" FROM zz_names"_qs))
                << query.lastError().text().toStdString();
            run(database, u"DROP TABLE zz_names"_qs);
        }
        EXPECT_GT(bare.size(), 100);
        std::cout << corpus::nameOf(dialect) << ": " << bare.size() << " names bare\n";
    }
}
