#pragma once

#include "designer/document/Document.h"

#include <Zandor/Library.h>

#include <QCoreApplication>
#include <QUndoStack>

#include <gtest/gtest.h>

/// A document over a small query, and short ways to draw in it as the control does.
struct Drawing {
    using TableRef = zandor::platform::Ref<zandor::model::Table>;
    using JoinRef = zandor::platform::Ref<TalvikZandorLib::ZDJoin>;
    using DefinitionRef = zandor::platform::Ref<TalvikZandorLib::ZDColumnDefinition>;

    explicit Drawing(int tables = 2) {
        const auto query = zandor::platform::makeRef<zandor::model::Query>();
        const std::u16string names[] = {u"customers", u"orders"};
        for (int n = 0; n < tables; ++n)
            query->addTable(described(n < 2 ? names[n] : u"table" + zandor::platform::decimal(n)));
        document.setQuery(query);
    }

    static zandor::model::TableDescription described(zandor::platform::String name) {
        return {u"",
                std::move(name),
                {{u"id", zandor::model::ColumnType::Integer, u"INTEGER", true},
                 {u"status", zandor::model::ColumnType::Text, u"TEXT", false}}};
    }

    zandor::model::Query& query() { return *document.query(); }
    TableRef table(const zandor::platform::String& name) { return query().tableNamed(name); }

    JoinRef join(const zandor::platform::String& left, const zandor::platform::String& right) {
        const auto join = library.NewZDJoin();
        join->LeftColumn(table(left)->columnNamed(u"id"));
        join->RightColumn(table(right)->columnNamed(u"id"));
        return query().AddJoin(join);
    }

    DefinitionRef define(const zandor::platform::String& from,
                         const zandor::platform::String& column) {
        const auto definition = library.NewZDColumnDefinition();
        definition->Column(table(from)->columnNamed(column));
        return query().AddColumnDefinition(definition);
    }

    /// Name of the newest step that there is already: asking does not make one.
    QString lastStep() const {
        return steps.index() == 0 ? QString() : steps.command(steps.index() - 1)->text();
    }

    zandor::model::Library library;
    zandor::designer::Document document;
    QUndoStack& steps = document.steps();
};

inline void returnToTheEventLoop() { QCoreApplication::processEvents(); }
