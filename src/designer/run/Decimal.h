#pragma once

#include <QByteArray>
#include <QString>

#include <compare>
#include <map>
#include <optional>

namespace zandor::designer {

/// A decimal number as an engine writes it, to its last digit.
struct Decimal {
    bool negative = false;
    QByteArray digits = {}; ///< without zeros in front; none for zero
    int scale = 0;          ///< so many of the digits are behind the point; may be negative

    /// Reads "12.50", "-3", "1e+20"; nothing for what is none, as "nan", or has an exponent beyond
    /// ten thousand.
    static std::optional<Decimal> from(const QString& text);
    /// With a point, and with an exponent only where it would be very long.
    QString text() const;
    /// With so many decimals, at least 0: rounded, a half away from zero, or filled up with zeros.
    Decimal rounded(int decimals) const;

    friend std::strong_ordering operator<=>(const Decimal& a, const Decimal& b);
    friend bool operator==(const Decimal& a, const Decimal& b) { return std::is_eq(a <=> b); }
};

/// Adds decimals without losing a digit, up to some thousand millions of them.
class DecimalSum {
public:
    void add(const Decimal& value);

    /// With as many decimals as the value with most of them.
    Decimal total() const;
    /// The total divided by `count`, at least 1: with up to four decimals more than the total,
    /// rounded.
    Decimal average(qint64 count) const;

private:
    static constexpr int digitsOfABlock = 9;

    std::map<int, qint64> mBlocks; ///< the one of number n counts 10 to the power of 9 n
    int mScale = 0;
};

} // namespace zandor::designer
