#include "designer/run/RowOrder.h"

#include "designer/run/Spool.h"

#include <gmock/gmock.h>

#include <QElapsedTimer>

using namespace zandor;

using designer::Cell;
using designer::RowOrder;
using designer::sortedRows;
using testing::ElementsAre;
using Kind = designer::Cell::Kind;

namespace {

/// The order of one column's values.
std::vector<quint32> sorted(const std::vector<Cell>& values,
                            Qt::SortOrder direction = Qt::AscendingOrder) {
    designer::Spool spool;
    EXPECT_FALSE(spool.begin({"other", "value"}));
    for (const Cell& value : values) EXPECT_FALSE(spool.add({{Kind::text, "x"}, value}));
    const auto order =
        sortedRows(spool, 1, direction, static_cast<qint64>(values.size()), std::atomic(false));
    EXPECT_TRUE(order);
    return order.value_or(RowOrder());
}

Cell numeral(const char* digits) { return {Kind::number, digits}; }
Cell words(const char* text) { return {Kind::text, QString::fromUtf8(text)}; }

} // namespace

TEST(TheOrderOfRows, OfNumbersIsThatOfNumbers) {
    EXPECT_THAT(
        sorted({numeral("10"), numeral("9"), numeral("-2.5"), numeral("1e3"), numeral("9.5")}),
        ElementsAre(2, 1, 4, 0, 3));
    // Whole numbers in full, and numbers that are too large for any.
    EXPECT_THAT(sorted({numeral("9007199254740993"), numeral("9007199254740992"),
                        numeral("9223372036854775807"), numeral("9223372036854775806")}),
                ElementsAre(1, 0, 3, 2));
    EXPECT_THAT(sorted({numeral("1e9999"), numeral("-1e9999"), numeral("0"), numeral("nan"),
                        numeral("-inf"), numeral("inf")}),
                ElementsAre(1, 4, 2, 0, 5, 3));
}

TEST(TheOrderOfRows, OfTextsIsThatOfWords) {
    EXPECT_THAT(sorted({words("b"), words("A"), words(""), words("a"), words("C")}).front(), 2U);
    const auto order = sorted({words("2024-10-01"), words("2024-09-30"), words("2023-12-31")});
    EXPECT_THAT(order, ElementsAre(2, 1, 0));
}

TEST(TheOrderOfRows, PutsNothingFirstAndNumbersBeforeTexts) {
    EXPECT_THAT(sorted({words("a"),
                        numeral("5"),
                        {},
                        {Kind::blob, {}, "xyz"},
                        {Kind::boolean, "true"},
                        {Kind::boolean, "false"},
                        {Kind::blob, {}, "x"}}),
                ElementsAre(2, 1, 5, 4, 0, 6, 3));
}

TEST(TheOrderOfRows, KeepsRowsThatAreAlikeAsTheyCame) {
    const std::vector<Cell> values{numeral("2"), numeral("1"), numeral("2"), numeral("1.0")};
    EXPECT_THAT(sorted(values), ElementsAre(1, 3, 0, 2));
    EXPECT_THAT(sorted(values, Qt::DescendingOrder), ElementsAre(0, 2, 1, 3));
}

TEST(TheOrderOfRows, EndsWhenItIsStoppedOrRowsAreMissing) {
    designer::Spool spool;
    ASSERT_FALSE(spool.begin({"n"}));
    ASSERT_FALSE(spool.add({numeral("1")}));
    EXPECT_FALSE(sortedRows(spool, 0, Qt::AscendingOrder, 1, std::atomic(true)));
    EXPECT_FALSE(sortedRows(spool, 0, Qt::AscendingOrder, 2, std::atomic(false)));
    EXPECT_EQ(sortedRows(spool, 0, Qt::AscendingOrder, 0, std::atomic(false)), RowOrder());
}

TEST(TheOrderOfRows, OfAMillionIsThereSoon) {
    designer::Spool spool;
    ASSERT_FALSE(spool.begin({"n", "text"}));
    constexpr int count = 1'000'000;
    for (int n = 0; n < count; ++n) {
        const QString shuffled = QString::number(n * 7919LL % 1'000'003);
        ASSERT_FALSE(spool.add({{Kind::number, shuffled}, {Kind::text, "name " + shuffled}}));
    }
    for (const int column : {0, 1}) {
        QElapsedTimer clock;
        clock.start();
        const auto order = sortedRows(spool, column, Qt::AscendingOrder, count, std::atomic(false));
        ASSERT_TRUE(order);
        ASSERT_EQ(order->size(), static_cast<std::size_t>(count));
        EXPECT_EQ(order->front(), 0U);
        std::printf("a million rows by column %d: %lld ms\n", column, clock.elapsed());
        EXPECT_LT(clock.elapsed(), 60'000);
    }
}
