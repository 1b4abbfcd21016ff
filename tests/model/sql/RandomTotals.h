#pragma once

#include "RandomQueries.h"

/// Draws queries over a few tables that are joined as their keys go: expressions of every kind and
/// depth, totals of them, criteria before and behind, different rows, and such queries as tables up
/// to three deep. What engines differ in by
/// themselves (the order of letters, the digits of fractions) is left out.
class RandomTotals {
public:
    RandomTotals(std::uint32_t seed, zandor::reader::DatabaseReader& database);

    zandor::platform::Ref<zandor::model::Query> next();

private:
    using String = zandor::platform::String;

    zandor::platform::Ref<zandor::model::Query> drawn(int depth);
    void addSaved(zandor::model::Query& query, const zandor::model::Query& saved);
    void join(zandor::model::Query& query, zandor::platform::StringView left,
              zandor::platform::StringView leftColumn, zandor::platform::StringView right,
              zandor::platform::StringView rightColumn);
    void addDefinition(zandor::model::Query& query);
    String number(int depth);
    String text(int depth);
    String date(int depth);
    String condition(int depth);
    String criterion(bool total, char16_t kind);

    Dice mDice;
    std::map<String, zandor::model::TableDescription> mTables;
    std::vector<String> mNumbers; ///< columns of the query being drawn
    std::vector<String> mTexts;
    std::vector<String> mDates;
};
