#include "designer/run/Decimal.h"

#include <gtest/gtest.h>

#include <QStringList>

using namespace zandor::designer;

namespace {

std::string read(const QString& text) {
    const auto value = Decimal::from(text);
    return value ? value->text().toStdString() : "none";
}

DecimalSum sum(const QStringList& values) {
    DecimalSum result;
    for (const QString& value : values) result.add(Decimal::from(value).value());
    return result;
}

std::string total(const QStringList& values) { return sum(values).total().text().toStdString(); }

std::string average(const QStringList& values) {
    return sum(values).average(values.size()).text().toStdString();
}

} // namespace

TEST(ADecimal, IsRoundedAwayFromZero) {
    const auto rounded = [](const QString& text, int decimals) {
        return Decimal::from(text).value().rounded(decimals).text().toStdString();
    };
    EXPECT_EQ(rounded("2.5", 0), "3");
    EXPECT_EQ(rounded("-2.5", 0), "-3");
    EXPECT_EQ(rounded("9.995", 2), "10.00");
    EXPECT_EQ(rounded("0.04", 1), "0.0");
    EXPECT_EQ(rounded("-0.04", 1), "0.0");
    EXPECT_EQ(rounded("0.05", 1), "0.1");
    EXPECT_EQ(rounded("0.0005", 1), "0.0");
    EXPECT_EQ(rounded("12e+3", 2), "12000.00");
    EXPECT_EQ(rounded("1.2", 3), "1.200");
}

TEST(ADecimal, IsReadAsEnginesWriteIt) {
    EXPECT_EQ(read("12.50"), "12.50");
    EXPECT_EQ(read("-0.05"), "-0.05");
    EXPECT_EQ(read("007"), "7");
    EXPECT_EQ(read("-0"), "0");
    EXPECT_EQ(read(".5"), "0.5");
    EXPECT_EQ(read("1e+20"), "100000000000000000000");
    EXPECT_EQ(read("1.5e-3"), "0.0015");
    EXPECT_EQ(read("1.25e+300"), "1.25e+300");
    EXPECT_EQ(read("5e-324"), "5e-324");
    for (const char* none : {"", "nan", "inf", "1,5", "1e", "1e99999999999", "-", ".", "1.5x"})
        EXPECT_EQ(read(none), "none") << none;
}

TEST(ADecimal, IsLessOrMoreThanAnotherToItsLastDigit) {
    const auto less = [](const QString& a, const QString& b) {
        return Decimal::from(a).value() < Decimal::from(b).value();
    };
    const QStringList rising{"-1e+30",
                             "-2.5",
                             "-2.49",
                             "0",
                             "1e-9",
                             "0.5",
                             "9",
                             "10",
                             "12345678901234567890.1",
                             "12345678901234567890.2"};
    for (int a = 0; a < rising.size(); ++a)
        for (int b = 0; b < rising.size(); ++b)
            EXPECT_EQ(less(rising[a], rising[b]), a < b)
                << rising[a].toStdString() << " " << rising[b].toStdString();
    EXPECT_EQ(Decimal::from("1.50").value(), Decimal::from("1.5").value());
}

TEST(ASumOfDecimals, LosesNoDigit) {
    EXPECT_EQ(total({"0.1", "0.2"}), "0.3");
    EXPECT_EQ(total({"12.50", "1.50"}), "14.00");
    EXPECT_EQ(total({"0.00", "0.00"}), "0.00");
    EXPECT_EQ(total({}), "0");
    EXPECT_EQ(total({"-1.5", "1"}), "-0.5");
    EXPECT_EQ(total({"1.5", "-1.5"}), "0.0");
    EXPECT_EQ(total({"-999999999", "-1"}), "-1000000000");
    EXPECT_EQ(total({"9223372036854775807", "9223372036854775807"}), "18446744073709551614");
    EXPECT_EQ(total({"1e+20", "1", "-1e+20"}), "1");
    EXPECT_EQ(total({"12345678901234567890123.4567890123", "0.0000000877"}),
              "12345678901234567890123.4567891000");
}

TEST(ASumOfDecimals, IsThatOfManyNumbers) {
    DecimalSum sum;
    const Decimal value = Decimal::from("-999999999.99").value();
    for (int n = 0; n < 1'000'000; ++n) sum.add(value);
    EXPECT_EQ(sum.total().text(), "-999999999990000.00");
    EXPECT_EQ(sum.average(1'000'000).text(), "-999999999.99");
}

TEST(AnAverageOfDecimals, HasAFewDecimalsMoreAndIsRounded) {
    EXPECT_EQ(average({"1", "2"}), "1.5");
    EXPECT_EQ(average({"12.50", "7.50"}), "10.00");
    EXPECT_EQ(average({"1", "0", "0"}), "0.3333");
    EXPECT_EQ(average({"2", "0", "0"}), "0.6667");
    EXPECT_EQ(average({"-2", "0", "0"}), "-0.6667");
    EXPECT_EQ(average({"1", "1", "0.99999"}), "0.999996667");
    EXPECT_EQ(average({"0.00001", "0", "-0.00001"}), "0.00000");
    EXPECT_EQ(average({"9.99996", "9.99999", "9.99999"}), "9.99998");
}
