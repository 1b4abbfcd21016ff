#pragma once

#include "designer/document/Document.h"
#include "model/Library.h"

#include <QCoreApplication>
#include <QUndoStack>

#include <gtest/gtest.h>

/// A document over a small query, and short ways to draw in it as the control does.
struct Drawing {
    using TableRef = platform::Ref<model::Table>;
    using JoinRef = platform::Ref<TalvikZandorLib::ZDJoin>;
    using DefinitionRef = platform::Ref<TalvikZandorLib::ZDColumnDefinition>;

    explicit Drawing(int tables = 2) {
        const auto query = platform::makeRef<model::Query>();
        const std::u16string names[] = {u"customers", u"orders"};
        for (int n = 0; n < tables; ++n)
            query->addTable(described(n < 2 ? names[n] : u"table" + platform::decimal(n)));
        document.setQuery(query);
    }

    static model::TableDescription described(platform::String name) {
        return {u"",
                std::move(name),
                {{u"id", model::ColumnType::Integer, u"INTEGER", true},
                 {u"status", model::ColumnType::Text, u"TEXT", false}}};
    }

    model::Query& query() { return *document.query(); }
    TableRef table(const platform::String& name) { return query().tableNamed(name); }

    JoinRef join(const platform::String& left, const platform::String& right) {
        const auto join = library.NewZDJoin();
        join->LeftColumn(table(left)->columnNamed(u"id"));
        join->RightColumn(table(right)->columnNamed(u"id"));
        return query().AddJoin(join);
    }

    DefinitionRef define(const platform::String& from, const platform::String& column) {
        const auto definition = library.NewZDColumnDefinition();
        definition->Column(table(from)->columnNamed(column));
        return query().AddColumnDefinition(definition);
    }

    /// Name of the newest step that there is already: asking does not make one.
    QString lastStep() const {
        return steps.index() == 0 ? QString() : steps.command(steps.index() - 1)->text();
    }

    model::Library library;
    designer::Document document;
    QUndoStack& steps = document.steps();
};

inline void returnToTheEventLoop() { QCoreApplication::processEvents(); }
