#include "designer/properties/formats.h"

#include "designer/properties/fields.h"

#include <QCoreApplication>

namespace zandor::designer {

using model::ColumnType;
using model::Format;

namespace {

constexpr int usualDecimals = 2;

class FormatWords {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::Format)
};

} // namespace

std::span<const CellFormat> offeredFormats() {
    static constexpr CellFormat all[] = {
        {Format::None},       {Format::Number, 0}, {Format::Number, 2}, {Format::Thousands, 2},
        {Format::Percent, 2}, {Format::ShortDate}, {Format::LongDate},  {Format::DateAndTime},
        {Format::IsoDate},    {Format::YearMonth}, {Format::Weekday},   {Format::Time},
    };
    return all;
}

QString nameOf(const CellFormat& offered) {
    switch (offered.format) {
    case Format::None: return FormatWords::tr("As it is");
    case Format::Number:
        return offered.decimals == 0 ? FormatWords::tr("Whole number") : FormatWords::tr("Decimals");
    case Format::Thousands: return FormatWords::tr("Thousands");
    case Format::Percent: return FormatWords::tr("Percent");
    case Format::ShortDate: return FormatWords::tr("Short date");
    case Format::LongDate: return FormatWords::tr("Long date");
    case Format::DateAndTime: return FormatWords::tr("Date and time");
    case Format::IsoDate: return FormatWords::tr("ISO date");
    case Format::YearMonth: return FormatWords::tr("Year and month");
    case Format::Weekday: return FormatWords::tr("Weekday");
    case Format::Time: return FormatWords::tr("Time");
    }
    return {};
}

QString exampleOf(const CellFormat& offered) {
    if (offered.format == Format::None) return nameOf(offered);
    const QString number =
        offered.format == Format::Percent ? QStringLiteral("0.125") : QStringLiteral("1234.5");
    const Cell example = model::isOfNumbers(offered.format)
                             ? Cell{Cell::Kind::number, number}
                             : Cell{Cell::Kind::text, QStringLiteral("2026-07-21 14:30:00")};
    return QStringLiteral("%1: %2").arg(nameOf(offered), shown(example, offered));
}

int placeOf(const model::ColumnDefinition& definition) {
    const auto all = offeredFormats();
    for (std::size_t n = 0; n < all.size(); ++n)
        if (all[n].format == definition.format() &&
            (all[n].format != Format::Number ||
             (all[n].decimals == 0) == (definition.decimals() == 0)))
            return static_cast<int>(n);
    return 0;
}

void setFormat(model::ColumnDefinition& definition, const CellFormat& offered) {
    const bool isWhole = offered.format == Format::Number && offered.decimals == 0;
    int decimals = model::asManyAsThereAre;
    if (isWhole)
        decimals = 0;
    else if (offered.format == Format::Number)
        decimals = definition.decimals() > 0 ? definition.decimals() : usualDecimals;
    else if (model::isOfNumbers(offered.format) && model::isOfNumbers(definition.format()))
        decimals = definition.decimals();
    else if (model::isOfNumbers(offered.format) && outputTypeOf(definition) != ColumnType::Integer)
        decimals = usualDecimals;
    definition.format(offered.format);
    definition.decimals(static_cast<std::int16_t>(decimals));
}

bool suits(Format format, ColumnType type) {
    if (format == Format::None || type == ColumnType::Unknown) return true;
    if (model::isOfNumbers(format))
        return type == ColumnType::Integer || type == ColumnType::Decimal;
    const bool hasDay = type == ColumnType::Date || type == ColumnType::Timestamp;
    const bool hasTime = type == ColumnType::Time || type == ColumnType::Timestamp;
    return type == ColumnType::Text || (format == Format::Time ? hasTime : hasDay);
}

} // namespace zandor::designer
