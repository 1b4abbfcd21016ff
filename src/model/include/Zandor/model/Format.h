#pragma once

#include <cstdint>

namespace zandor::model {

/// How the values of an output column are shown to people. Sorting, criteria and what is written
/// into files go by the values themselves. A value that is not of the kind is shown as it is.
enum class Format : std::uint8_t {
    None,        ///< as the engine gives them
    Number,      ///< numbers: without marks between thousands
    Thousands,   ///< numbers: with them
    Percent,     ///< numbers: hundred times as much, with a percent sign
    ShortDate,   ///< days and moments: the day as the user's language writes it in short
    LongDate,    ///< the same, in full and with the day of the week
    DateAndTime, ///< day and time as the user's language writes them in short
    IsoDate,     ///< the day as 2026-12-31
    YearMonth,   ///< 2026-12
    Weekday,     ///< the name of the day of the week
    Time,        ///< times and moments: the time as the user's language writes it in short
};

/// The last of them.
inline constexpr Format lastFormat = Format::Time;

/// Stands for no certain number of decimals.
inline constexpr std::int16_t asManyAsThereAre = -1;

/// Whether it is for numbers, and has decimals.
constexpr bool isOfNumbers(Format format) {
    return format >= Format::Number && format <= Format::Percent;
}

} // namespace zandor::model
