#include <Zandor/sql/Printer.h>

#include <gtest/gtest.h>

#include <regex>

using namespace zandor;

// Statements built by hand, for what no drawing makes or what is best seen alone.

using namespace model::sql;
using model::ColumnType;
using platform::String;
using platform::toUtf8;

namespace {

SourceNode table(String name, String alias = {}, String schema = {}) {
    if (alias.empty()) alias = name;
    return std::make_shared<const Source>(
        Source{TableRef{std::move(schema), std::move(name), std::move(alias)}});
}

Node column(String name, ColumnType type = ColumnType::Integer) {
    return make(ColumnRef{u"t", std::move(name), type});
}

Node value(String text, ColumnType type = ColumnType::Integer) {
    return make(Value{type, std::move(text)});
}

Node equals(String text) {
    return make(Compare{Comparison::equal, column(u"a"), value(std::move(text))});
}

Node on(Comparison comparison) {
    return make(Compare{comparison, make(ColumnRef{u"t", u"a", ColumnType::Integer}),
                        make(ColumnRef{u"u", u"b", ColumnType::Integer})});
}

SourceNode joined(JoinKind kind, Node condition) {
    return std::make_shared<const Source>(
        Source{JoinSource{kind, table(u"t"), table(u"u"), std::move(condition), u"j7"}});
}

Statement all(SourceNode from = table(u"t")) {
    Statement statement;
    statement.items.push_back({AllColumns{u"t"}, {}});
    statement.from.push_back(std::move(from));
    return statement;
}

Statement where(Node condition) {
    Statement statement = all();
    statement.where = std::move(condition);
    return statement;
}

/// The standard's quotes around names of small letters are left out here.
std::string text(const Statement& statement, Dialect dialect, ValueForm form = ValueForm::bound) {
    const auto printed = print(statement, dialect, form);
    if (const auto* refusal = std::get_if<Refusal>(&printed))
        return toUtf8(refusal->message.text());
    const std::string written = toUtf8(std::get<Printed>(printed).text);
    if (dialect != Dialect::Standard) return written;
    return std::regex_replace(written, std::regex("\"([a-z]+)\"(?=[^\"]|$)"), "$1");
}

/// What stands behind the table.
std::string behind(const Statement& statement, Dialect dialect, ValueForm form = ValueForm::bound) {
    const std::string begin = "SELECT\n    t.*\nFROM t\n";
    const std::string whole = text(statement, dialect, form);
    return whole.rfind(begin, 0) == 0 ? whole.substr(begin.size()) : whole;
}

} // namespace

TEST(ThePrinter, WritesSchemaNameAndAlias) {
    EXPECT_EQ(text(all(table(u"Items", u"t", u"my schema")), Dialect::PostgreSQL),
              "SELECT\n    t.*\nFROM \"my schema\".\"Items\" AS t");
    EXPECT_EQ(text(all(table(u"t", u"t", u"dbo")), Dialect::SqlServer),
              "SELECT\n    t.*\nFROM dbo.t");
}

TEST(ThePrinter, HandsOverValuesInTheOrderOfTheirPlaceholders) {
    Statement statement = where(allOf(
        {make(Between{false, column(u"a"), value(u"1"),
                      make(Parameter{u"top", ColumnType::Integer})}),
         make(Like{false, column(u"b", ColumnType::Text), value(u"x%", ColumnType::Text)}),
         make(
             In{true, column(u"c", ColumnType::Date), {value(u"2024-01-02", ColumnType::Date)}})}));
    const auto printed = print(statement, Dialect::PostgreSQL, ValueForm::bound);
    const auto& result = std::get<Printed>(printed);
    EXPECT_EQ(toUtf8(result.text), "SELECT\n    t.*\nFROM t\n"
                                   "WHERE t.a BETWEEN CAST(? AS bigint) AND CAST(? AS numeric)\n"
                                   "    AND t.b ILIKE ?\n"
                                   "    AND t.c NOT IN (CAST(? AS date))");
    ASSERT_EQ(result.bindings.size(), 4u);
    EXPECT_EQ(std::get<Value>(result.bindings[0]), (Value{ColumnType::Integer, u"1"}));
    EXPECT_EQ(std::get<Parameter>(result.bindings[1]).name, u"top");
    EXPECT_EQ(std::get<Value>(result.bindings[2]), (Value{ColumnType::Text, u"x%"}));
    EXPECT_EQ(std::get<Value>(result.bindings[3]), (Value{ColumnType::Date, u"2024-01-02"}));
}

TEST(ThePrinter, ShowsParametersByTheirNames) {
    const auto asked = [](String name) {
        return where(make(Compare{Comparison::equal, column(u"a"),
                                  make(Parameter{std::move(name), ColumnType::Integer})}));
    };
    for (const Dialect dialect : allDialects) {
        EXPECT_EQ(behind(asked(u"from"), dialect, ValueForm::literal), "WHERE t.a = :from");
        EXPECT_EQ(behind(asked(u"How \"many\"?"), dialect, ValueForm::literal),
                  "WHERE t.a = :\"How \"\"many\"\"?\"");
    }
}

TEST(ThePrinter, GivesAShellItsOwnParametersAndAnEnd) {
    const auto asked = [](std::vector<Parameter> parameters) {
        std::vector<Node> terms;
        for (Parameter& parameter : parameters)
            terms.push_back(
                make(Compare{Comparison::equal, column(u"a"), make(std::move(parameter))}));
        return where(allOf(std::move(terms)));
    };
    const auto from = asked({{u"from", ColumnType::Date}});
    EXPECT_EQ(behind(from, Dialect::SQLite, ValueForm::script), "WHERE t.a = :from;");
    EXPECT_EQ(behind(from, Dialect::PostgreSQL, ValueForm::script),
              "WHERE t.a = CAST(:'from' AS date);");
    EXPECT_EQ(behind(from, Dialect::MySQL, ValueForm::script), "WHERE t.a = @from;");
    EXPECT_EQ(behind(from, Dialect::SqlServer, ValueForm::script), "WHERE t.a = @from;");
    EXPECT_EQ(behind(from, Dialect::Standard, ValueForm::script), "WHERE t.a = :from;");
    EXPECT_EQ(behind(asked({{u"n", ColumnType::Integer}}), Dialect::PostgreSQL, ValueForm::script),
              "WHERE t.a = CAST(:'n' AS numeric);");
    EXPECT_EQ(behind(asked({{u"n", ColumnType::Text}}), Dialect::PostgreSQL, ValueForm::script),
              "WHERE t.a = :'n';");
    EXPECT_EQ(behind(where(equals(u"5")), Dialect::SQLite, ValueForm::script), "WHERE t.a = 5;");
}

TEST(ThePrinter, MakesNamesForAShellOfWhatIsNone) {
    const auto names = [](const std::vector<String>& asked) {
        std::vector<Node> terms;
        for (const String& name : asked)
            terms.push_back(make(Compare{Comparison::equal, column(u"a"), make(Parameter{name})}));
        std::string text =
            behind(where(allOf(std::move(terms))), Dialect::MySQL, ValueForm::script);
        for (const std::string& left : {std::string("WHERE t.a = @"), std::string("\n"),
                                        std::string("    AND t.a = @"), std::string(";")})
            for (std::size_t at; (at = text.find(left)) != std::string::npos;)
                text.replace(at, left.size(), left == "\n" ? " " : "");
        return text;
    };
    EXPECT_EQ(names({u"How \"many\"?"}), "How_many");
    EXPECT_EQ(names({u"  von größe:  "}), "von_größe");
    EXPECT_EQ(names({u"1st"}), "parameter_1st");
    EXPECT_EQ(names({u"?", u"!"}), "parameter parameter_2");
    EXPECT_EQ(names({u"a b", u"a-b", u"a b", u"A+B"}), "a_b a_b_2 a_b A_B_3");
    // What is a name already keeps it, wherever it comes.
    EXPECT_EQ(names({u"a b", u"a_b_2", u"a_b"}), "a_b_3 a_b_2 a_b");
    EXPECT_EQ(names({u"x", u"X"}), "x X_2") << "a shell may take them for one";
    EXPECT_EQ(names({u"_x$"}), "x");
}

TEST(ThePrinter, PutsParenthesesWhereTheTreeNeedsThemOnly) {
    const auto either = [](Node left, Node right) { return make(Or{{left, right}}); };
    const auto both = [](Node left, Node right) { return make(And{{left, right}}); };
    const auto shown = [](Node condition) {
        return behind(where(std::move(condition)), Dialect::Standard, ValueForm::literal);
    };
    EXPECT_EQ(shown(both(either(equals(u"1"), equals(u"2")), equals(u"3"))),
              "WHERE (t.a = 1 OR t.a = 2)\n    AND t.a = 3");
    EXPECT_EQ(shown(either(both(equals(u"1"), equals(u"2")), equals(u"3"))),
              "WHERE (t.a = 1 AND t.a = 2)\n    OR t.a = 3");
    EXPECT_EQ(shown(make(Not{both(equals(u"1"), equals(u"2"))})),
              "WHERE NOT (t.a = 1 AND t.a = 2)");
    EXPECT_EQ(shown(both(make(Not{equals(u"1")}),
                         either(equals(u"2"), both(equals(u"3"), equals(u"4"))))),
              "WHERE NOT (t.a = 1)\n    AND (t.a = 2 OR (t.a = 3 AND t.a = 4))");
}

TEST(ThePrinter, PagesEachDialectsWay) {
    Statement page = all();
    page.limit = 10;
    page.offset = 20;
    EXPECT_EQ(behind(page, Dialect::SQLite), "LIMIT 10 OFFSET 20");
    EXPECT_EQ(behind(page, Dialect::PostgreSQL), "LIMIT 10 OFFSET 20");
    EXPECT_EQ(behind(page, Dialect::MySQL), "LIMIT 10 OFFSET 20");
    EXPECT_EQ(behind(page, Dialect::SqlServer),
              "ORDER BY (SELECT NULL)\nOFFSET 20 ROWS\nFETCH NEXT 10 ROWS ONLY");
    EXPECT_EQ(behind(page, Dialect::Standard), "OFFSET 20 ROWS\nFETCH NEXT 10 ROWS ONLY");
    page.order.push_back({make(ColumnRef{u"t", u"a", ColumnType::Integer}), true});
    EXPECT_EQ(behind(page, Dialect::SqlServer),
              "ORDER BY t.a DESC\nOFFSET 20 ROWS\nFETCH NEXT 10 ROWS ONLY");
}

TEST(ThePrinter, PagesWithALimitOrAnOffsetAlone) {
    Statement limited = all();
    limited.limit = 5;
    EXPECT_EQ(behind(limited, Dialect::SQLite), "LIMIT 5");
    EXPECT_EQ(behind(limited, Dialect::PostgreSQL), "LIMIT 5");
    EXPECT_EQ(behind(limited, Dialect::Standard), "OFFSET 0 ROWS\nFETCH NEXT 5 ROWS ONLY");
    Statement skipping = all();
    skipping.offset = 5;
    EXPECT_EQ(behind(skipping, Dialect::SQLite), "LIMIT -1 OFFSET 5");
    EXPECT_EQ(behind(skipping, Dialect::PostgreSQL), "OFFSET 5");
    EXPECT_EQ(behind(skipping, Dialect::MySQL), "LIMIT 18446744073709551615 OFFSET 5");
    EXPECT_EQ(behind(skipping, Dialect::SqlServer), "ORDER BY (SELECT NULL)\nOFFSET 5 ROWS");
}

TEST(ThePrinter, RefusesAFullJoinWhereTheEngineHasNone) {
    const Statement equal = all(joined(JoinKind::fullOuter, on(Comparison::equal)));
    const Statement less = all(joined(JoinKind::fullOuter, on(Comparison::less)));
    const Statement mixed =
        all(joined(JoinKind::fullOuter, make(And{{on(Comparison::less), on(Comparison::equal)}})));
    EXPECT_EQ(text(equal, Dialect::MySQL), "MySQL/MariaDB has no join that keeps all rows of both "
                                           "tables: let this one keep those of one table.");
    EXPECT_EQ(text(less, Dialect::PostgreSQL),
              "PostgreSQL keeps all rows of both tables only where a join asks for equal values: "
              "choose the operator =, or let the join keep the rows of one table.");
    for (const Statement& fine : {equal, mixed})
        EXPECT_NE(text(fine, Dialect::PostgreSQL).find("FULL JOIN"), std::string::npos);
    for (const Dialect dialect : {Dialect::SQLite, Dialect::SqlServer, Dialect::Standard})
        EXPECT_NE(text(less, dialect).find("FULL JOIN u ON t.a < u.b"), std::string::npos);
    const auto printed = print(equal, Dialect::MySQL, ValueForm::bound);
    EXPECT_EQ(std::get<Refusal>(printed).reason, Refusal::Reason::join);
    EXPECT_EQ(std::get<Refusal>(printed).join, u"j7");
}

TEST(ThePrinter, RefusesANameThatTheDialectCannotCarry) {
    const auto printed =
        print(all(table(String(64, u'n'), u"t")), Dialect::PostgreSQL, ValueForm::bound);
    ASSERT_TRUE(std::holds_alternative<Refusal>(printed));
    EXPECT_EQ(std::get<Refusal>(printed).reason, Refusal::Reason::name);
}

TEST(ThePrinter, RefusesMoreConditionsInARowThanSqliteTakes) {
    const auto row = [](std::size_t length) {
        return where(make(Or{std::vector<Node>(length, equals(u"1"))}));
    };
    EXPECT_EQ(
        text(row(949), Dialect::SQLite),
        "These are more conditions than SQLite takes, which is about 900: write a long list of "
        "values as In (1, 2, 3).");
    EXPECT_NE(text(row(948), Dialect::SQLite).find("WHERE"), std::string::npos);
    EXPECT_NE(text(row(949), Dialect::PostgreSQL).find("WHERE"), std::string::npos);
}

TEST(ThePrinter, MatchesAColumnOfUnknownTypeAsTextOnPostgres) {
    const Statement statement = where(
        make(Like{true, column(u"x", ColumnType::Unknown), value(u"4\\%%", ColumnType::Text)}));
    EXPECT_EQ(behind(statement, Dialect::PostgreSQL, ValueForm::literal),
              "WHERE CAST(t.x AS text) NOT ILIKE '4\\%%'");
    EXPECT_EQ(behind(statement, Dialect::SQLite, ValueForm::literal),
              "WHERE t.x NOT LIKE '4\\%%' ESCAPE '\\'");
    EXPECT_EQ(behind(statement, Dialect::MySQL, ValueForm::literal),
              "WHERE t.x NOT LIKE '4\\\\%%'");
}

TEST(ThePrinter, CountsTruthWhereSqliteWouldTakeItForAColumn) {
    Statement statement = where(make(Compare{Comparison::equal, column(u"a", ColumnType::Boolean),
                                             value(u"true", ColumnType::Boolean)}));
    EXPECT_NE(text(statement, Dialect::SQLite, ValueForm::literal).find("a = TRUE"),
              std::string::npos);
    statement.items = {{column(u"b"), u"True"}};
    EXPECT_NE(text(statement, Dialect::SQLite, ValueForm::literal).find("a = 1"),
              std::string::npos);
    EXPECT_NE(text(statement, Dialect::PostgreSQL, ValueForm::literal).find("a = TRUE"),
              std::string::npos);
}

TEST(ThePrinter, IsStable) {
    const Statement statement = where(make(Or{{equals(u"1"), equals(u"2")}}));
    for (const Dialect dialect : allDialects)
        EXPECT_EQ(text(statement, dialect), text(statement, dialect));
}
