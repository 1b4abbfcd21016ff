#include "CriteriaReading.h"

using namespace zandor;

// What people type for a value, by the type of the column.

namespace {
class AValue : public Criteria {};
} // namespace

TEST_F(AValue, OfATextColumnIsTheBareWordsWithTheirBlanks) {
    EXPECT_EQ(condition(u"text", u"Berlin"), "t.text = 'Berlin'");
    EXPECT_EQ(condition(u"text", u"  New   York  "), "t.text = 'New   York'");
    EXPECT_EQ(condition(u"text", u"O'Brien"), "t.text = 'O''Brien'");
    EXPECT_EQ(condition(u"text", u"1.5"), "t.text = '1.5'");
    EXPECT_EQ(condition(u"text", u"C# / a.b@c:d;-- x"), "t.text = 'C# / a.b@c:d;-- x'");
    EXPECT_EQ(condition(u"text", u"Made In China Like Not"), "t.text = 'Made In China Like Not'");
}

TEST_F(AValue, InQuotesIsWhatStandsBetweenThem) {
    EXPECT_EQ(condition(u"text", u"'a And b'"), "t.text = 'a And b'");
    EXPECT_EQ(condition(u"text", u"\"it's\""), "t.text = 'it''s'");
    EXPECT_EQ(condition(u"text", u"'it''s'"), "t.text = 'it''s'");
    EXPECT_EQ(condition(u"text", u"\"a \"\"b\"\"\""), "t.text = 'a \"b\"'");
    EXPECT_EQ(condition(u"text", u"''"), "t.text = ''");
    EXPECT_EQ(condition(u"text", u"''''"), "t.text = ''''");
    EXPECT_EQ(condition(u"text", u"' '"), "t.text = ' '");
}

TEST_F(AValue, OfANumberColumnIsCanonical) {
    EXPECT_EQ(condition(u"whole", u"42"), "t.whole = 42");
    EXPECT_EQ(condition(u"whole", u"+007"), "t.whole = 7");
    EXPECT_EQ(condition(u"whole", u"-0"), "t.whole = -0");
    EXPECT_EQ(condition(u"whole", u"1.5"), "t.whole = 1.5");
    EXPECT_EQ(condition(u"number", u".5"), "t.number = 0.5");
    EXPECT_EQ(condition(u"number", u"-.5"), "t.number = -0.5");
    EXPECT_EQ(condition(u"number", u"5."), "t.number = 5");
    EXPECT_EQ(condition(u"number", u"1E+09"), "t.number = 1e+09");
    EXPECT_EQ(condition(u"number", u"'12'"), "t.number = 12");
    EXPECT_EQ(condition(u"whole", u"123456789012345678901"), "t.whole = 123456789012345678901");
}

TEST_F(AValue, KeepsEveryDigitOfADecimalAndKnowsAWholeNumber) {
    const auto value = [this](platform::StringView text) {
        const auto reading = read(u"number", text);
        const auto& compare = std::get<model::sql::Compare>(reading.condition->node);
        return std::get<model::sql::Value>(compare.right->node);
    };
    EXPECT_EQ(value(u"0.10").text, u"0.10");
    EXPECT_EQ(value(u"0.10").type, model::ColumnType::Decimal);
    EXPECT_EQ(value(u"999999999999999999").type, model::ColumnType::Integer);
    EXPECT_EQ(value(u"1000000000000000000").type, model::ColumnType::Decimal);
    // Engines read a number with an exponent as no whole one.
    EXPECT_EQ(value(u"0e5").type, model::ColumnType::Decimal);
}

TEST_F(AValue, ThatIsNoNumberIsRefusedForANumberColumn) {
    for (const auto* text : {u"abc", u"1,5", u"--1", u"1e", u"e5", u".", u"+", u"1.2.3", u"0x10",
                             u"1 2", u"'x'", u"''", u"1e100", u"NaN", u"Infinity", u"٣", u"#1#"})
        EXPECT_EQ(condition(u"whole", text).rfind("At character ", 0), 0u)
            << platform::toUtf8(text) << " became " << condition(u"whole", text);
    EXPECT_EQ(condition(u"whole", platform::String(101, u'1')),
              "At character 1: this is no number, write it like 12 or 1.5.");
    EXPECT_EQ(condition(u"whole", platform::String(100, u'1')),
              "t.whole = " + std::string(100, '1'));
}

TEST_F(AValue, OfADateColumnIsADayOfTheCalendar) {
    EXPECT_EQ(condition(u"on_day", u"2024-02-29"), "t.on_day = '2024-02-29'");
    EXPECT_EQ(condition(u"on_day", u"2000-2-29"), "t.on_day = '2000-02-29'");
    EXPECT_EQ(condition(u"on_day", u"#2024-12-31#"), "t.on_day = '2024-12-31'");
    EXPECT_EQ(condition(u"on_day", u"'0001-01-01'"), "t.on_day = '0001-01-01'");
    for (const auto* text :
         {u"2023-02-29", u"1900-02-29", u"2024-13-01", u"2024-00-10", u"2024-04-31", u"2024-01-00",
          u"0000-01-01", u"24-01-01", u"2024/1/1", u"2024-01-01 10:00", u"tomorrow", u"##"})
        EXPECT_EQ(condition(u"on_day", text),
                  "At character 1: this is no date, write it like 2024-12-31.")
            << platform::toUtf8(text);
}

TEST_F(AValue, OfATimeColumnIsATimeOfTheDay) {
    EXPECT_EQ(condition(u"clock", u"9:05"), "t.clock = '09:05:00'");
    EXPECT_EQ(condition(u"clock", u"23:59:59"), "t.clock = '23:59:59'");
    EXPECT_EQ(condition(u"clock", u"#00:00#"), "t.clock = '00:00:00'");
    EXPECT_EQ(condition(u"clock", u"1:02:03.500"), "t.clock = '01:02:03.500'");
    EXPECT_EQ(condition(u"clock", u"#1:02:03.123456789#"), "t.clock = '01:02:03.123456789'");
    for (const auto* text : {u"24:00", u"12:60", u"12:00:60", u"12", u"12:5", u"noon", u"12:00.5",
                             u"12:00:00.", u"12:00:00.1234567890", u"12:00:00.5x"})
        EXPECT_EQ(condition(u"clock", text),
                  "At character 1: this is no time, write it like 23:59.")
            << platform::toUtf8(text);
}

TEST_F(AValue, OfATimestampColumnIsADayWithOrWithoutATime) {
    EXPECT_EQ(condition(u"moment", u"2024-05-01 10:30"), "t.moment = '2024-05-01 10:30:00'");
    EXPECT_EQ(condition(u"moment", u"2024-05-01T10:30:15"), "t.moment = '2024-05-01 10:30:15'");
    EXPECT_EQ(condition(u"moment", u"> 2024-05-01 10:30:15.000001"),
              "t.moment > '2024-05-01 10:30:15.000001'");
    EXPECT_EQ(condition(u"moment", u"Between 2024-05-01T10:30:15.5 And '2024-05-01 10:30:15.75'"),
              "t.moment BETWEEN '2024-05-01 10:30:15.5' AND '2024-05-01 10:30:15.75'");
    EXPECT_EQ(condition(u"moment", u"2024-05-01"), "t.moment = '2024-05-01 00:00:00'");
    EXPECT_EQ(condition(u"moment", u"#2024-5-1 1:30#"), "t.moment = '2024-05-01 01:30:00'");
    EXPECT_EQ(condition(u"moment", u"2024-05-01 25:00"),
              "At character 1: this is no date and time, write it like 2024-12-31 or "
              "2024-12-31 23:59.");
}

TEST_F(AValue, ThatLooksLikeAPatternIsWarnedOf) {
    for (const auto* text : {u"berlin*", u"*", u"%berlin%", u"<> 50%off", u"5 Or In (a, b*)"})
        EXPECT_TRUE(read(u"text", text).warning) << platform::toUtf8(text);
    EXPECT_TRUE(read(u"anything", u"berlin*").warning);
    EXPECT_EQ(read(u"text", u"a Or b*").warning->position, 5U);
    for (const auto* text : {u"100%", u"100 %", u"'berlin*'", u"Like berlin*", u"What?", u"a_b"})
        EXPECT_FALSE(read(u"text", text).warning) << platform::toUtf8(text);
}

TEST_F(AValue, ThatCannotBeReadIsNotWarnedOfBesides) {
    EXPECT_FALSE(read(u"text", u"berlin* )").warning);
    EXPECT_FALSE(read(u"whole", u"5*").warning);
}

TEST_F(AValue, OfABooleanColumnIsOneOfSixWords) {
    for (const auto* text : {u"true", u"TRUE", u"Yes", u"1", u"'true'"})
        EXPECT_EQ(condition(u"truth", text), "t.truth = TRUE") << platform::toUtf8(text);
    for (const auto* text : {u"false", u"No", u"0"})
        EXPECT_EQ(condition(u"truth", text), "t.truth = FALSE") << platform::toUtf8(text);
    EXPECT_EQ(condition(u"truth", u"2"), "At character 1: write true or false here.");
}

TEST_F(AValue, OfABlobColumnIsInHexadecimalDigits) {
    for (const auto* text : {u"x'0AFF'", u"X'0aff'", u"0x0AFF", u"0X0aFf", u"\\x0aff", u"\\X0AFF",
                             u"\"x'0AFF'\"", u"'0x0AFF'", u"= x'0AFF'"})
        EXPECT_EQ(condition(u"bytes", text), "t.bytes = X'0AFF'") << platform::toUtf8(text);
    EXPECT_EQ(condition(u"bytes", u"x''"), "t.bytes = X''");
    EXPECT_EQ(condition(u"bytes", u"In (x'0A', 0xFF) Or Between \\x01 And \\x02"),
              "t.bytes IN (X'0A', X'FF') OR t.bytes BETWEEN X'01' AND X'02'");
    for (const auto* text : {u"abc", u"0AFF", u"x'0AF'", u"x'0AGF'", u"x'0AFF", u"0x0AF", u"42"})
        EXPECT_EQ(condition(u"bytes", text), "At character 1: this is written x'0AFF'.")
            << platform::toUtf8(text);
    EXPECT_EQ(condition(u"bytes", u"="), "At character 2: a value is missing.");
    EXPECT_EQ(condition(u"bytes", u"> [t].[text]"),
              "At character 3: compare it with a column that holds x'0AFF'.");
    EXPECT_EQ(condition(u"bytes", u"Is Null"), "t.bytes IS NULL");
    EXPECT_EQ(condition(u"bytes", u"[t].[bytes]"), "t.bytes = t.bytes");
    EXPECT_EQ(condition(u"bytes", u":b"), "t.bytes = :b");
}

TEST_F(AValue, OfABlobColumnIsWrittenAlikeInACalculation) {
    EXPECT_EQ(condition(u"bytes", u"Coalesce([t].[bytes], x'00') = 0x0AFF"),
              "COALESCE(t.bytes, X'00') = X'0AFF'");
    EXPECT_EQ(condition(u"bytes", u"Coalesce([t].[bytes], '\\x00') = x'0AFF'"),
              "COALESCE(t.bytes, X'00') = X'0AFF'");
}

TEST_F(AValue, OfAColumnOfUnknownTypeIsANumberOrADateOrAText) {
    EXPECT_EQ(condition(u"anything", u"42"), "t.anything = 42");
    EXPECT_EQ(condition(u"anything", u"'42'"), "t.anything = '42'");
    EXPECT_EQ(condition(u"anything", u"some words"), "t.anything = 'some words'");
    EXPECT_EQ(condition(u"anything", u"#2024-1-2#"), "t.anything = '2024-01-02'");
    EXPECT_EQ(condition(u"anything", u"#2024-1-2 3:04#"), "t.anything = '2024-01-02 03:04:00'");
    EXPECT_EQ(condition(u"anything", u"#words#"),
              "At character 1: only dates and times stand between two #.");
}

TEST_F(AValue, BetweenNumberSignsIsNoText) {
    EXPECT_EQ(condition(u"text", u"#2024-05-01#"),
              "At character 1: only dates and times stand between two #.");
    EXPECT_EQ(condition(u"text", u"'#2024-05-01#'"), "t.text = '#2024-05-01#'");
}

TEST_F(AValue, WithADecimalCommaIsToldOfThePoint) {
    const std::string point = ": decimals are written with a point, as in 1.5.";
    EXPECT_EQ(condition(u"number", u"1,5"), "At character 2" + point);
    EXPECT_EQ(condition(u"number", u"> -12,75"), "At character 6" + point);
    EXPECT_EQ(condition(u"whole", u"1,5"), "At character 2" + point);
    EXPECT_EQ(condition(u"number", u"= '1,5'"), "At character 3" + point);
    EXPECT_EQ(condition(u"anything", u"1,5"), "At character 2" + point);
    EXPECT_EQ(condition(u"number", u"Between 1,5 And 2"), "At character 10" + point);
    EXPECT_EQ(condition(u"number", u"In (1,5)"), "t.number IN (1, 5)") << "a list of two";
    const std::string other = ": put And or Or between two conditions, or quotes around a text.";
    EXPECT_EQ(condition(u"number", u"1, 5"), "At character 2" + other);
    EXPECT_EQ(condition(u"text", u"1,5"), "At character 2" + other) << "it may be a text";
}
