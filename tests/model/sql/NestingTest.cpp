#include "Corpus.h"
#include "Engines.h"

#include <gtest/gtest.h>

#include <functional>
#include <iostream>

using namespace zandor;

using model::sql::Dialect;
using platform::String;

namespace {

using Deeper = std::function<String(const String& inner, int level)>;

/// What wraps an expression or a criterion into another one.
const std::map<std::string, Deeper>& expressions() {
    static const std::map<std::string, Deeper> all = {
        {"parentheses", [](auto& x, int) { return u"(id - " + x + u")"; }},
        {"a product", [](auto& x, int) { return u"(" + x + u") * 1"; }},
        {"a division", [](auto& x, int) { return u"1 / (" + x + u")"; }},
        {"a sign", [](auto& x, int) { return u"-(" + x + u")"; }},
        {"Abs", [](auto& x, int) { return u"Abs(" + x + u")"; }},
        {"Coalesce", [](auto& x, int) { return u"Coalesce(id, 1, " + x + u")"; }},
        {"If", [](auto& x, int) { return u"If(id > 1, 2, " + x + u")"; }},
        {"If, its condition", [](auto& x, int) { return u"If(" + x + u" > 1, 2, 3)"; }},
        {"Length", [](auto& x, int) { return u"Length('a' & " + x + u")"; }},
        {"Left", [](auto& x, int) { return u"Length(Left('abc', " + x + u"))"; }},
        {"Right", [](auto& x, int) { return u"Length(Right('abc', Round(" + x + u")))"; }},
        {"Mid", [](auto& x, int) { return u"Length(Mid('abc', Round(" + x + u"), 2))"; }},
    };
    return all;
}

const std::map<std::string, Deeper>& criteria() {
    static const std::map<std::string, Deeper> all = {
        {"Not", [](auto& x, int) { return u"Not " + x; }},
        {"Not in parentheses", [](auto& x, int) { return u"Not (" + x + u")"; }},
        {"And and Or",
         [](auto& x, int n) { return (n % 2 ? u"> 1 And (" : u"< 5 Or (") + x + u")"; }},
        {"Not of Or", [](auto& x, int) { return u"Not (3 Or " + x + u")"; }},
    };
    return all;
}

/// Runs what is nested ever deeper, and counts how deep an engine takes it.
void nest(const std::map<std::string, Deeper>& kinds, bool criterion) {
    const auto suppliers = smallEngines().reader().table({u"", u"suppliers"});
    ASSERT_TRUE(suppliers);
    for (const auto& [name, deeper] : kinds) {
        std::map<Dialect, int> deepest;
        String text = criterion ? u"1" : u"id";
        for (int level = 1; level < 60; ++level) {
            text = deeper(text, level);
            const auto query = platform::makeRef<model::Query>();
            const auto table = query->addTable(*suppliers);
            const auto definition = platform::makeRef<model::ColumnDefinition>();
            if (criterion) {
                definition->Column(table->columnNamed(u"id"));
                definition->AddCriterium(text, u"4");
            } else {
                definition->expression(text);
            }
            query->AddColumnDefinition(definition);
            for (const Dialect dialect : smallEngines().dialects()) {
                const auto statement =
                    model::sql::statementText(*query, dialect, model::sql::ValueForm::bound);
                if (!statement.runnable()) continue;
                ASSERT_EQ(smallEngines().run(dialect, statement).error.toStdString(), "")
                    << name << ", level " << level << " in " << corpus::nameOf(dialect);
                deepest[dialect] = level;
            }
        }
        std::cout << name << ": SQLite " << deepest[Dialect::SQLite] << ", PostgreSQL "
                  << deepest[Dialect::PostgreSQL] << '\n';
        EXPECT_GE(deepest[Dialect::SQLite], 2) << name;
        EXPECT_GE(deepest[Dialect::PostgreSQL], 12) << name;
    }
}

} // namespace

TEST(WhatIsNested, RunsOrIsRefused) {
    nest(expressions(), false);
    nest(criteria(), true);
}
