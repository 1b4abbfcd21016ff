#include "designer/run/Decimal.h"

#include <algorithm>
#include <cstdlib>
#include <utility>
#include <vector>

namespace zandor::designer {

namespace {

constexpr int largestExponent = 10'000;
constexpr int longestPlain = 40; // digits and zeros
constexpr int furtherDecimals = 4;
constexpr qint64 blockSize = 1'000'000'000;

bool isDigit(char sign) { return sign >= '0' && sign <= '9'; }

void dropZerosInFront(QByteArray& digits) {
    const auto first =
        std::find_if(digits.cbegin(), digits.cend(), [](char d) { return d != '0'; });
    digits.remove(0, first - digits.cbegin());
}

/// Adds one to the last digit.
void roundUp(QByteArray& digits) {
    qsizetype n = digits.size();
    while (n > 0 && digits[n - 1] == '9') digits[--n] = '0';
    if (n > 0)
        ++digits[n - 1];
    else
        digits.prepend('1');
}

/// How many digits stand before the point.
qsizetype magnitude(const Decimal& value) { return value.digits.size() - value.scale; }

std::strong_ordering compareSizes(const Decimal& a, const Decimal& b) {
    if (a.digits.isEmpty() || b.digits.isEmpty())
        return a.digits.isEmpty()
                   ? (b.digits.isEmpty() ? std::strong_ordering::equal : std::strong_ordering::less)
                   : std::strong_ordering::greater;
    if (magnitude(a) != magnitude(b)) return magnitude(a) <=> magnitude(b);
    const qsizetype length = std::max(a.digits.size(), b.digits.size());
    return a.digits.leftJustified(length, '0').compare(b.digits.leftJustified(length, '0')) <=> 0;
}

} // namespace

std::optional<Decimal> Decimal::from(const QString& text) {
    const QByteArray signs = text.toLatin1();
    Decimal result;
    auto at = signs.cbegin();
    const auto end = signs.cend();
    if (at != end && (*at == '-' || *at == '+')) result.negative = *at++ == '-';
    for (; at != end && isDigit(*at); ++at) result.digits += *at;
    if (at != end && *at == '.')
        for (++at; at != end && isDigit(*at); ++at, ++result.scale) result.digits += *at;
    if (result.digits.isEmpty()) return {};
    if (at != end && (*at == 'e' || *at == 'E')) {
        bool good = false;
        const int exponent = signs.mid(at + 1 - signs.cbegin()).toInt(&good);
        if (!good || std::abs(exponent) > largestExponent) return {};
        result.scale -= exponent;
        at = end;
    }
    if (at != end) return {};
    dropZerosInFront(result.digits);
    if (result.digits.isEmpty()) result.negative = false;
    return result;
}

QString Decimal::text() const {
    const QString sign = negative ? QStringLiteral("-") : QString();
    if (digits.isEmpty())
        return scale > 0 && scale <= longestPlain
                   ? QStringLiteral("0.") + QString(scale, QLatin1Char('0'))
                   : QStringLiteral("0");
    if (scale < 0 ? digits.size() - scale > longestPlain : scale - digits.size() > longestPlain) {
        QByteArray short_ = digits;
        while (short_.endsWith('0')) short_.chop(1);
        if (short_.size() > 1) short_.insert(1, '.');
        const qsizetype exponent = magnitude(*this) - 1;
        return sign + QString::fromLatin1(short_) + QLatin1String(exponent < 0 ? "e" : "e+") +
               QString::number(exponent);
    }
    QByteArray plain = digits;
    if (scale <= 0) return sign + QString::fromLatin1(plain + QByteArray(-scale, '0'));
    plain = plain.rightJustified(scale + 1, '0');
    return sign + QString::fromLatin1(plain.insert(plain.size() - scale, '.'));
}

Decimal Decimal::rounded(int decimals) const {
    Decimal result = *this;
    result.scale = decimals;
    if (scale <= decimals) {
        if (!digits.isEmpty()) result.digits += QByteArray(decimals - scale, '0');
        return result;
    }
    const qsizetype kept = digits.size() - (scale - decimals);
    result.digits.truncate(std::max<qsizetype>(kept, 0));
    if (kept >= 0 && kept < digits.size() && digits[kept] >= '5') roundUp(result.digits);
    if (result.digits.isEmpty()) result.negative = false;
    return result;
}

std::strong_ordering operator<=>(const Decimal& a, const Decimal& b) {
    if (a.negative != b.negative)
        return a.negative ? std::strong_ordering::less : std::strong_ordering::greater;
    return a.negative ? compareSizes(b, a) : compareSizes(a, b);
}

void DecimalSum::add(const Decimal& value) {
    mScale = std::max(mScale, value.scale);
    const int sign = value.negative ? -1 : 1;
    // From the last digit on, block by block.
    int place = -value.scale; // the power of ten of the digit
    for (qsizetype n = value.digits.size(); n > 0;) {
        const int block =
            place >= 0 ? place / digitsOfABlock : -((-place + digitsOfABlock - 1) / digitsOfABlock);
        qint64 weight = 1;
        for (int left = place - block * digitsOfABlock; left > 0; --left) weight *= 10;
        qint64 part = 0;
        for (; n > 0 && weight < blockSize; --n, ++place, weight *= 10)
            part += (value.digits[n - 1] - '0') * weight;
        mBlocks[block] += sign * part;
    }
}

Decimal DecimalSum::total() const {
    Decimal result;
    result.scale = mScale;
    if (mBlocks.empty()) return result;
    const int behindPoint = (mScale + digitsOfABlock - 1) / digitsOfABlock;
    const int lowest = std::min(mBlocks.begin()->first, -behindPoint);
    // Carries upwards; what is left over the highest block tells the sign.
    const auto carried = [&](int sign) {
        std::vector<qint64> blocks;
        qint64 carry = 0;
        const int highest = std::max(mBlocks.rbegin()->first, 0);
        for (int n = lowest; n <= highest + 2; ++n) {
            const auto found = mBlocks.find(n);
            qint64 value = carry + (found == mBlocks.end() ? 0 : sign * found->second);
            carry = value / blockSize;
            value %= blockSize;
            if (value < 0) value += blockSize, --carry;
            blocks.push_back(value);
        }
        return std::pair(blocks, carry);
    };
    auto [blocks, over] = carried(1);
    if (over < 0) {
        result.negative = true;
        blocks = carried(-1).first;
    }
    std::ranges::reverse(blocks);
    for (const qint64 block : blocks)
        result.digits += QByteArray::number(block).rightJustified(digitsOfABlock, '0');
    // The blocks may go further behind the point than any value does.
    result.digits.chop(-lowest * digitsOfABlock - mScale);
    dropZerosInFront(result.digits);
    return result;
}

Decimal DecimalSum::average(qint64 count) const {
    Decimal result = total();
    const QByteArray dividend = result.digits + QByteArray(furtherDecimals, '0');
    result.scale += furtherDecimals;
    QByteArray quotient;
    qint64 left = 0;
    for (const char digit : dividend) {
        left = left * 10 + (digit - '0');
        quotient += static_cast<char>('0' + left / count);
        left %= count;
    }
    if (2 * left >= count) roundUp(quotient);
    for (int n = 0; n < furtherDecimals && quotient.endsWith('0'); ++n) {
        quotient.chop(1);
        --result.scale;
    }
    dropZerosInFront(quotient);
    result.digits = quotient;
    if (quotient.isEmpty()) result.negative = false;
    return result;
}

} // namespace zandor::designer
