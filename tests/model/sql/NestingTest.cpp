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

/// A query that reads all of another one; where a table comes before it, it is a join's.
platform::Ref<model::Query> around(const platform::Ref<model::Query>& inner,
                                   const model::TableDescription* before) {
    auto query = platform::makeRef<model::Query>();
    if (before) query->addTable(*before);
    const auto all = query->addQuery(u"inner", {.file = {}, .record = inner->record()});
    const auto definition = platform::makeRef<model::ColumnDefinition>();
    definition->Column(all->Columns().Item(1));
    query->AddColumnDefinition(definition);
    if (!before) return query;
    const auto join = platform::makeRef<model::Join>();
    join->LeftColumn(query->Tables().Item(1)->Columns().Item(2));
    join->RightColumn(all->Columns().Item(2));
    join->JoinType(1);
    query->AddJoin(join);
    return query;
}

/// Runs what is nested ever deeper, within so many saved queries, and counts how deep an engine
/// takes it.
void nest(const std::map<std::string, Deeper>& kinds, bool criterion, int queries = 0,
          bool joined = false) {
    const auto suppliers = smallEngines().reader().table({u"", u"suppliers"});
    ASSERT_TRUE(suppliers);
    for (const auto& [name, deeper] : kinds) {
        std::map<Dialect, int> deepest;
        String text = criterion ? u"1" : u"id";
        bool refused = false;
        for (int level = 1; level < (queries > 0 ? 60 : 110); ++level) {
            text = deeper(text, level);
            if (queries > 0 && level % 4 != 3) continue; // each takes a while
            auto query = platform::makeRef<model::Query>();
            const auto table = query->addTable(*suppliers);
            const auto definition = platform::makeRef<model::ColumnDefinition>();
            if (criterion) {
                definition->Column(table->columnNamed(u"id"));
                definition->AddCriterium(text, u"4");
            } else {
                definition->expression(text);
            }
            query->AddColumnDefinition(definition);
            for (int n = 0; n < queries; ++n) query = around(query, joined ? &*suppliers : nullptr);
            for (const Dialect dialect : smallEngines().dialects()) {
                // It goes through every combination of rows of eight joins without an index.
                if (joined && dialect == Dialect::MySQL) continue;
                const auto statement =
                    model::sql::statementText(*query, dialect, model::sql::ValueForm::bound);
                if (!statement.runnable()) {
                    EXPECT_FALSE(statement.findings.empty()) << name << ", level " << level;
                    refused = true;
                    continue;
                }
                ASSERT_EQ(smallEngines().run(dialect, statement).error.toStdString(), "")
                    << name << ", level " << level << " in " << corpus::nameOf(dialect);
                deepest[dialect] = level;
            }
        }
        std::cout << name;
        for (const auto& [dialect, level] : deepest)
            std::cout << ", " << corpus::nameOf(dialect) << ' ' << level;
        std::cout << '\n';
        for (const auto& [dialect, level] : deepest)
            EXPECT_GE(level, dialect != Dialect::SQLite ? 11 : queries > 0 ? 0 : 2) << name;
        if (queries == 0) {
            EXPECT_TRUE(refused) << name << " has no end";
        }
    }
}

} // namespace

TEST(WhatIsNested, RunsOrIsRefused) {
    nest(expressions(), false);
    nest(criteria(), true);
}

TEST(WhatIsNested, RunsOrIsRefusedInSavedQueriesToo) {
    for (const bool joined : {false, true}) {
        nest(expressions(), false, model::deepestSavedQuery, joined);
        nest(criteria(), true, model::deepestSavedQuery, joined);
    }
}
