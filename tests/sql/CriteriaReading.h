#pragma once

#include "model/criteria/QueryColumns.h"
#include "model/sql/Builder.h"

#include <gtest/gtest.h>

/// A query whose table has a column of each type, for reading criteria over it.
struct AllTypes {
    platform::Ref<model::Query> query = platform::makeRef<model::Query>();
    platform::Ref<model::Table> table = query->addTable(described(u"t"));

    static model::TableDescription described(platform::String name) {
        using model::ColumnType;
        return {u"",
                std::move(name),
                {{u"text", ColumnType::Text},
                 {u"whole", ColumnType::Integer},
                 {u"number", ColumnType::Decimal},
                 {u"on_day", ColumnType::Date},
                 {u"clock", ColumnType::Time},
                 {u"moment", ColumnType::Timestamp},
                 {u"truth", ColumnType::Boolean},
                 {u"bytes", ColumnType::Blob},
                 {u"anything", ColumnType::Unknown}}};
    }

    model::criteria::Reading read(platform::StringView column, platform::StringView text) const {
        const auto subject = table->columnNamed(column);
        return model::criteria::read(text, model::criteria::columnRef(*subject, *table),
                                     model::criteria::QueryColumns(query->Tables()));
    }

    /// The condition that a text sets to a column, as SQLite would be shown it; "blank" for none,
    /// the error's text for a bad one.
    std::string condition(platform::StringView column, platform::StringView text) const {
        auto reading = read(column, text);
        if (reading.error) return platform::toUtf8(reading.error->message);
        if (!reading.condition) return "blank";
        model::sql::Statement statement;
        statement.items.push_back({model::sql::AllColumns{u"t"}, {}});
        statement.from.push_back(std::make_shared<const model::sql::Source>(
            model::sql::Source{model::sql::TableRef{u"", u"t", u"t"}}));
        statement.where = reading.condition;
        const auto printed = model::sql::print(statement, model::sql::Dialect::SQLite,
                                               model::sql::ValueForm::literal);
        if (const auto* refusal = std::get_if<model::sql::Refusal>(&printed))
            return platform::toUtf8(refusal->message);
        std::string sql = platform::toUtf8(std::get<model::sql::Printed>(printed).text);
        sql.erase(0, sql.find("WHERE ") + 6);
        for (std::size_t at; (at = sql.find("\n    ")) != std::string::npos;)
            sql.replace(at, 5, " ");
        return sql;
    }
};

class Criteria : public testing::Test, protected AllTypes {};
