#pragma once

#include <Zandor/DatabaseReader.h>
#include <Zandor/sql/Builder.h>

#include <cstdlib>
#include <map>
#include <random>

/// A number that a variable of the environment sets.
inline std::uint32_t fromEnvironment(const char* name, std::uint32_t otherwise) {
    const char* text = std::getenv(name);
    return text ? static_cast<std::uint32_t>(std::strtoul(text, nullptr, 10)) : otherwise;
}

/// Random numbers that are the same on every machine for a seed.
class Dice {
public:
    explicit Dice(std::uint32_t seed) : mEngine(seed) {}

    /// From 0 to `sides` - 1.
    std::size_t roll(std::size_t sides) { return mEngine() % sides; }
    bool oneIn(std::size_t sides) { return roll(sides) == 0; }
    template <class List>
    const auto& pick(const List& list) {
        return list[roll(std::size(list))];
    }

private:
    std::mt19937 mEngine;
};

/// Draws queries over the tables of a database: some tables, some of them twice, joins of columns
/// that can be compared, output columns with criteria of all kinds.
class RandomQueries {
public:
    RandomQueries(std::uint32_t seed, zandor::reader::DatabaseReader& database);

    zandor::platform::Ref<zandor::model::Query> next();

    /// A criterion for a column of a type; often a good one.
    zandor::platform::String criterion(zandor::model::ColumnType type);
    /// A text that tries to leave its place in the statement; often a bad criterion.
    zandor::platform::String hostileText();

private:
    void addJoin(zandor::model::Query& query);
    void addDefinition(zandor::model::Query& query);
    zandor::platform::Ref<zandor::model::Column> anyColumn(zandor::model::Query& query);
    zandor::platform::String predicate(zandor::model::ColumnType type);
    zandor::platform::String value(zandor::model::ColumnType type);
    zandor::platform::String number(std::size_t sides);

    Dice mDice;
    std::vector<zandor::model::TableDescription> mTables;
    std::vector<zandor::platform::String>
        mColumns; ///< of the query being drawn, as criteria name them
};

/// The tokens of a statement as one text with a blank between, every value and placeholder as "?".
/// For the dialects that quote names with quotation marks; it knows nothing of the printer.
std::string shape(const std::string& sql);
