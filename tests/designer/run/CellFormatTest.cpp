#include "Databases.h"
#include "Queries.h"

#include "designer/run/ColumnFormats.h"

#include <gtest/gtest.h>

#include <QLocale>

using namespace zandor;

using designer::CellFormat;
using model::Format;
using Kind = designer::Cell::Kind;

namespace {

class AFormat : public testing::Test {
protected:
    ~AFormat() override { QLocale::setDefault(before); }

    static void speak(QLocale::Language language, QLocale::Territory country) {
        QLocale::setDefault(QLocale(language, country));
    }
    static std::string number(const QString& text, const CellFormat& format) {
        return designer::shown({Kind::number, text}, format).toStdString();
    }
    static std::string text(const QString& text, Format format) {
        return designer::shown({Kind::text, text}, {format}).toStdString();
    }

    const QLocale before;
};

} // namespace

TEST_F(AFormat, RoundsNumbersAsTextToTheirLastDigit) {
    speak(QLocale::English, QLocale::UnitedStates);
    EXPECT_EQ(number("2.345", {Format::Number, 2}), "2.35");
    EXPECT_EQ(number("-2.345", {Format::Number, 2}), "-2.35");
    EXPECT_EQ(number("1.005", {Format::Number, 2}), "1.01") << "as no binary fraction would";
    EXPECT_EQ(number("2.344999999999999999999999999999999", {Format::Number, 2}), "2.34");
    EXPECT_EQ(number("999.995", {Format::Number, 2}), "1000.00");
    EXPECT_EQ(number("0.5", {Format::Number, 0}), "1");
    EXPECT_EQ(number("0.49", {Format::Number, 0}), "0");
    EXPECT_EQ(number("-0.001", {Format::Number, 2}), "0.00");
    EXPECT_EQ(number("7", {Format::Number, 15}), "7.000000000000000");
    EXPECT_EQ(number("0", {Format::Number, 2}), "0.00");
    EXPECT_EQ(number("1e+20", {Format::Number, 1}), "100000000000000000000.0");
    EXPECT_EQ(number("5e-324", {Format::Number, 2}), "0.00");
    EXPECT_EQ(number("123456789012345678901234567890.125", {Format::Thousands, 2}),
              "123,456,789,012,345,678,901,234,567,890.13");
    EXPECT_EQ(number("1234.50", {Format::Thousands}), "1,234.50");
    EXPECT_EQ(number("-123456", {Format::Thousands, 0}), "-123,456");
    EXPECT_EQ(number("123", {Format::Thousands, 0}), "123");
    EXPECT_EQ(number("0.125", {Format::Percent, 1}), "12.5%");
    EXPECT_EQ(number("0.125", {Format::Percent, 0}), "13%");
    EXPECT_EQ(number("3", {Format::Percent}), "300%");
    EXPECT_EQ(number("0.07", {Format::Percent}), "7%");
}

TEST_F(AFormat, LeavesAloneWhatItIsNotFor) {
    speak(QLocale::English, QLocale::UnitedStates);
    EXPECT_EQ(number("nan", {Format::Thousands, 2}), "nan");
    EXPECT_EQ(number("1.25e+300", {Format::Thousands, 2}), "1.25e+300");
    EXPECT_EQ(number("20260721", {Format::LongDate}), "20260721");
    EXPECT_EQ(number("12.5", {Format::None, 0}), "12.5");
    for (const char* none :
         {"", "soon", "2026-02-30", "infinity", "0044-03-15 BC", "2026-07", "25:00", "2026-07-21x"})
        for (const Format format : {Format::ShortDate, Format::Weekday, Format::Time})
            EXPECT_EQ(text(none, format), none);
    EXPECT_EQ(text("2026-07-21", Format::Time), "2026-07-21");
    EXPECT_EQ(text("14:30:00", Format::ShortDate), "14:30:00");
    EXPECT_EQ(text("12", Format::Thousands), "12");
    EXPECT_EQ(designer::shown({Kind::boolean, "true"}, {Format::Percent}), "true");
}

TEST_F(AFormat, ShowsDaysAndMomentsAsTheUsersLanguageDoes) {
    speak(QLocale::English, QLocale::UnitedStates);
    for (const char* moment : {"2026-07-21", "2026-07-21 14:30:00", "2026-07-21T14:30:59.123456"}) {
        EXPECT_EQ(text(moment, Format::ShortDate), "7/21/26");
        EXPECT_EQ(text(moment, Format::LongDate), "Tuesday, July 21, 2026");
        EXPECT_EQ(text(moment, Format::IsoDate), "2026-07-21");
        EXPECT_EQ(text(moment, Format::YearMonth), "2026-07");
        EXPECT_EQ(text(moment, Format::Weekday), "Tuesday");
    }
    EXPECT_EQ(text("2026-07-21", Format::DateAndTime), "7/21/26");
    EXPECT_EQ(text("2026-07-21 14:30:00", Format::DateAndTime), "7/21/26 2:30 PM");
    EXPECT_EQ(text("2026-07-21 14:30:00.5+02", Format::DateAndTime), "7/21/26 2:30 PM +02");
    EXPECT_EQ(text("2026-07-21 14:30:00", Format::Time), "2:30 PM");
    EXPECT_EQ(text("14:30", Format::Time), "2:30 PM");
    speak(QLocale::German, QLocale::Germany);
    EXPECT_EQ(text("2026-07-21", Format::ShortDate), "21.07.26");
    EXPECT_EQ(text("2026-07-21", Format::LongDate), "Dienstag, 21. Juli 2026");
    EXPECT_EQ(text("2026-07-21 14:30:00", Format::DateAndTime), "21.07.26 14:30");
}

TEST_F(AFormat, GroupsDigitsAsTheUsersLanguageDoes) {
    speak(QLocale::German, QLocale::Germany);
    EXPECT_EQ(number("1234567.8", {Format::Thousands, 2}), "1.234.567,80");
    EXPECT_EQ(number("0.5", {Format::Percent, 1}).substr(0, 4), "50,0");
    speak(QLocale::Spanish, QLocale::Spain); // from five digits on
    EXPECT_EQ(number("1234", {Format::Thousands}), "1234");
    EXPECT_EQ(number("12345", {Format::Thousands}), "12.345");
    speak(QLocale::French, QLocale::France);
    EXPECT_EQ(number("1234567", {Format::Thousands}), "1\u202f234\u202f567");
}

TEST_F(AFormat, IsThatOfTheOutputColumnAmongThoseThatAreShown) {
    DatabaseFolder folder;
    const QString file = folder.database("formats.db", {"CREATE TABLE sales (what, price, at)"});
    const auto query =
        draw(file, {"sales"}, {{"sales.price"}, {"sales.what"}, {"sales.what"}, {"sales.at"}});
    const auto definition = [&](std::int32_t position) -> auto& {
        return dynamic_cast<model::ColumnDefinition&>(*query->ColumnDefinitions().Item(position));
    };
    definition(3).Column(query->tableNamed(u"sales")->Columns().Item(1));
    for (std::int32_t position = 1; position <= 4; ++position)
        definition(position).format(static_cast<Format>(position));
    const auto formats = [&](int columns) {
        std::vector<Format> result;
        for (int column = 0; column < columns; ++column)
            result.push_back(designer::ColumnFormats(*query).at(column, columns).format);
        return result;
    };
    using Formats = std::vector<Format>;
    // The columns of the table are counted by nobody.
    EXPECT_EQ(formats(6), (Formats{Format::Number, Format::Thousands, Format::None, Format::None,
                                   Format::None, Format::ShortDate}));
    EXPECT_EQ(formats(5), (Formats{Format::Number, Format::Thousands, Format::None, Format::None,
                                   Format::ShortDate}));
    definition(1).Visible(false);
    definition(2).total(model::Total::Condition);
    EXPECT_EQ(formats(3), (Formats{Format::None, Format::None, Format::ShortDate}));
    definition(3).total(model::Total::Count);
    EXPECT_EQ(formats(2), (Formats{Format::Percent, Format::ShortDate}));
}
