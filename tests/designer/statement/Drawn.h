#pragma once

#include "designer/document/Document.h"

#include <Zandor/Library.h>

#include <QCoreApplication>
#include <QElapsedTimer>

/// A document with a small query in it, and short ways to go on.
struct Drawn {
    static zandor::model::TableDescription description(const zandor::platform::String& name) {
        return {u"",
                name,
                {{u"id", zandor::model::ColumnType::Integer, u"INTEGER", true},
                 {u"customer_id", zandor::model::ColumnType::Integer, u"INTEGER", false},
                 {u"name", zandor::model::ColumnType::Text, u"TEXT", false}}};
    }

    zandor::platform::Ref<zandor::model::Table> table(const zandor::platform::String& name,
                                                      float left = 150, float top = 150) {
        const auto result = query->addTable(description(name));
        result->Left(left);
        result->Top(top);
        result->Width(2000);
        result->Height(1500);
        return result;
    }

    zandor::platform::Ref<TalvikZandorLib::ZDJoin>
    join(const zandor::platform::Ref<zandor::model::Table>& left,
         const zandor::platform::Ref<zandor::model::Table>& right, std::int16_t type = 0) {
        const auto result = library.NewZDJoin();
        result->LeftColumn(left->columnNamed(u"customer_id"));
        result->RightColumn(right->columnNamed(u"id"));
        result->JoinType(type);
        return query->AddJoin(result);
    }

    zandor::platform::Ref<TalvikZandorLib::ZDColumnDefinition>
    output(const zandor::platform::Ref<zandor::model::Table>& table,
           const zandor::platform::String& column, const zandor::platform::String& criterion = {}) {
        const auto result = library.NewZDColumnDefinition();
        result->Column(table->columnNamed(column));
        if (!criterion.empty()) result->AddCriterium(criterion, u"4");
        return query->AddColumnDefinition(result);
    }

    void finish() { document.setQuery(query); }

    zandor::model::Library library;
    zandor::platform::Ref<zandor::model::Query> query =
        zandor::platform::makeRef<zandor::model::Query>();
    zandor::designer::Document document;
};

/// Lets the event loop run until something is so; false when it does not come about.
inline bool soon(const auto& isSo) {
    QElapsedTimer time;
    time.start();
    while (!isSo() && time.elapsed() < 5000) QCoreApplication::processEvents({}, 20);
    return isSo();
}
