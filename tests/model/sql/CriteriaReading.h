#pragma once

#include "model/criteria/QueryColumns.h"

#include <Zandor/sql/Builder.h>

#include <gtest/gtest.h>

/// A query whose table has a column of each type, for reading criteria over it.
struct AllTypes {
    zandor::platform::Ref<zandor::model::Query> query =
        zandor::platform::makeRef<zandor::model::Query>();
    zandor::platform::Ref<zandor::model::Table> table = query->addTable(described(u"t"));

    static zandor::model::TableDescription described(zandor::platform::String name) {
        using zandor::model::ColumnType;
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

    zandor::model::criteria::Reading read(zandor::platform::StringView column,
                                          zandor::platform::StringView text) const {
        const auto subject = table->columnNamed(column);
        return zandor::model::criteria::read(
            text, zandor::model::criteria::columnRef(*subject, *table),
            zandor::model::criteria::QueryColumns(query->Tables()));
    }

    /// The condition that a text sets to a column, as SQLite would be shown it; "blank" for none,
    /// the error and its place, counted from 1, for a bad one.
    std::string condition(zandor::platform::StringView column,
                          zandor::platform::StringView text) const {
        auto reading = read(column, text);
        if (reading.error)
            return "At character " + std::to_string(reading.error->position + 1) + ": " +
                   zandor::platform::toUtf8(reading.error->message.text()) + ".";
        if (!reading.condition) return "blank";
        zandor::model::sql::Statement statement;
        statement.items.push_back({zandor::model::sql::AllColumns{u"t"}, {}});
        statement.from.push_back(std::make_shared<const zandor::model::sql::Source>(
            zandor::model::sql::Source{zandor::model::sql::TableRef{u"", u"t", u"t"}}));
        statement.where = reading.condition;
        const auto printed = zandor::model::sql::print(
            statement, zandor::model::sql::Dialect::SQLite, zandor::model::sql::ValueForm::literal);
        if (const auto* refusal = std::get_if<zandor::model::sql::Refusal>(&printed))
            return zandor::platform::toUtf8(refusal->message.text());
        std::string sql =
            zandor::platform::toUtf8(std::get<zandor::model::sql::Printed>(printed).text);
        sql.erase(0, sql.find("WHERE ") + 6);
        for (std::size_t at; (at = sql.find("\n    ")) != std::string::npos;)
            sql.replace(at, 5, " ");
        return sql;
    }
};

class Criteria : public testing::Test, protected AllTypes {};
