#include "model/criteria/Literals.h"

#include <Zandor/model/Names.h>

#include <array>

namespace zandor::model::criteria {

namespace {

constexpr StringView exampleOfBytes = u"x'0AFF'";
constexpr std::size_t mostDigitsOfSecond = 9; // behind the point

bool isDigit(char16_t c) { return c >= u'0' && c <= u'9'; }

/// Reads a text from the front.
class Reader {
public:
    explicit Reader(StringView text) : mText(text) {}

    bool done() const { return mAt == mText.size(); }
    bool take(char16_t c) {
        if (done() || mText[mAt] != c) return false;
        ++mAt;
        return true;
    }
    bool takeAny(StringView characters) {
        if (done() || characters.find(mText[mAt]) == StringView::npos) return false;
        ++mAt;
        return true;
    }
    std::size_t digits() {
        const std::size_t begin = mAt;
        while (!done() && isDigit(mText[mAt])) ++mAt;
        return mAt - begin;
    }
    StringView behind(std::size_t count) const { return mText.substr(mAt - count, count); }
    /// A number of so many digits, or nothing.
    std::optional<int> number(std::size_t fewest, std::size_t most) {
        const std::size_t begin = mAt;
        const std::size_t count = digits();
        if (count < fewest || count > most) return {};
        int value = 0;
        for (const char16_t c : mText.substr(begin, count)) value = value * 10 + (c - u'0');
        return value;
    }

private:
    StringView mText;
    std::size_t mAt = 0;
};

void appendPadded(String& out, int value, std::size_t width) {
    const String digits = platform::decimal(value);
    out.append(width > digits.size() ? width - digits.size() : 0, u'0');
    out += digits;
}

int daysIn(int year, int month) {
    constexpr std::array<int, 12> days = {31, 28, 31, 30, 31, 30, 31, 31, 30, 31, 30, 31};
    const bool leap = (year % 4 == 0 && year % 100 != 0) || year % 400 == 0;
    return month == 2 && leap ? 29 : days[static_cast<std::size_t>(month) - 1];
}

std::optional<String> date(Reader& reader) {
    const auto year = reader.number(4, 4);
    if (!year || *year == 0 || !reader.take(u'-')) return {};
    const auto month = reader.number(1, 2);
    if (!month || *month < 1 || *month > 12 || !reader.take(u'-')) return {};
    const auto day = reader.number(1, 2);
    if (!day || *day < 1 || *day > daysIn(*year, *month)) return {};
    String out;
    appendPadded(out, *year, 4);
    out += u'-';
    appendPadded(out, *month, 2);
    out += u'-';
    appendPadded(out, *day, 2);
    return out;
}

std::optional<String> time(Reader& reader) {
    const auto hour = reader.number(1, 2);
    if (!hour || *hour > 23 || !reader.take(u':')) return {};
    const auto minute = reader.number(2, 2);
    if (!minute || *minute > 59) return {};
    int second = 0;
    StringView fraction;
    if (reader.take(u':')) {
        const auto seconds = reader.number(2, 2);
        if (!seconds || *seconds > 59) return {};
        second = *seconds;
        if (reader.take(u'.')) {
            const std::size_t digits = reader.digits();
            if (digits == 0 || digits > mostDigitsOfSecond) return {};
            fraction = reader.behind(digits);
        }
    }
    String out;
    appendPadded(out, *hour, 2);
    out += u':';
    appendPadded(out, *minute, 2);
    out += u':';
    appendPadded(out, second, 2);
    // As many digits as there are: an engine that keeps moments as texts compares them too.
    if (!fraction.empty()) out += u'.' + String(fraction);
    return out;
}

std::optional<sql::Value> dateValue(StringView text) {
    Reader reader(text);
    const auto day = date(reader);
    if (!day || !reader.done()) return {};
    return sql::Value{ColumnType::Date, *day};
}

std::optional<sql::Value> timeValue(StringView text) {
    Reader reader(text);
    const auto clock = time(reader);
    if (!clock || !reader.done()) return {};
    return sql::Value{ColumnType::Time, *clock};
}

std::optional<sql::Value> timestampValue(StringView text) {
    Reader reader(text);
    const auto day = date(reader);
    if (!day) return {};
    if (reader.done()) return sql::Value{ColumnType::Timestamp, *day + u" 00:00:00"};
    if (!reader.takeAny(u" Tt")) return {};
    while (reader.take(u' ')) {
    }
    const auto clock = time(reader);
    if (!clock || !reader.done()) return {};
    return sql::Value{ColumnType::Timestamp, *day + u" " + *clock};
}

/// The canonical form drops a plus sign and leading zeros, and gives a bare point its zero.
std::optional<sql::Value> numberValue(StringView text) {
    constexpr std::size_t mostDigits = 100;
    constexpr std::size_t mostExponentDigits = 2;
    Reader reader(text);
    reader.takeAny(u"+-");
    const std::size_t whole = reader.digits();
    const bool point = reader.take(u'.');
    const std::size_t fraction = point ? reader.digits() : 0;
    if (whole + fraction == 0 || whole + fraction > mostDigits) return {};
    bool exponent = false;
    if (reader.takeAny(u"eE")) {
        exponent = true;
        reader.takeAny(u"+-");
        const std::size_t digits = reader.digits();
        if (digits == 0 || digits > mostExponentDigits) return {};
    }
    if (!reader.done()) return {};

    const bool negative = text.front() == u'-';
    if (text.front() == u'-' || text.front() == u'+') text.remove_prefix(1);
    while (text.size() > 1 && text.front() == u'0' && isDigit(text[1])) text.remove_prefix(1);
    String canonical = negative ? u"-" : u"";
    if (text.front() == u'.') canonical += u'0';
    canonical += text;
    const std::size_t bare = canonical.find(u'.');
    if (point && fraction == 0) canonical.erase(bare, 1);
    for (char16_t& c : canonical)
        if (c == u'E') c = u'e';
    const bool integer = !exponent && fraction == 0 && whole <= 18;
    return sql::Value{integer ? ColumnType::Integer : ColumnType::Decimal, canonical};
}

std::optional<sql::Value> bytesValue(StringView text) {
    const bool quoted = text.size() > 2 && (text[0] == u'x' || text[0] == u'X') &&
                        text[1] == u'\'' && text.back() == u'\'';
    const bool prefixed = text.starts_with(u"0x") || text.starts_with(u"0X") ||
                          text.starts_with(u"\\x") || text.starts_with(u"\\X");
    if (!quoted && !prefixed) return {};
    text.remove_prefix(2);
    if (quoted) text.remove_suffix(1);
    if (text.size() % 2 != 0) return {};
    String digits;
    for (const char16_t c : text) {
        const bool small = c >= u'a' && c <= u'f';
        if (!isDigit(c) && !small && !(c >= u'A' && c <= u'F')) return {};
        digits += small ? static_cast<char16_t>(c - u'a' + u'A') : c;
    }
    return sql::Value{ColumnType::Blob, digits};
}

std::optional<sql::Value> booleanValue(StringView text) {
    for (const StringView yes : {u"true", u"yes", u"1"})
        if (sameName(text, yes)) return sql::Value{ColumnType::Boolean, u"true"};
    for (const StringView no : {u"false", u"no", u"0"})
        if (sameName(text, no)) return sql::Value{ColumnType::Boolean, u"false"};
    return {};
}

} // namespace

bool isNumber(ColumnType type) {
    return type == ColumnType::Integer || type == ColumnType::Decimal;
}

Message nameOf(ColumnType type) {
    switch (type) {
    case ColumnType::Text: return say<MessageCode::aText>();
    case ColumnType::Integer:
    case ColumnType::Decimal: return say<MessageCode::aNumber>();
    case ColumnType::Date: return say<MessageCode::aDate>();
    case ColumnType::Time: return say<MessageCode::aTime>();
    case ColumnType::Timestamp: return say<MessageCode::aTimestamp>();
    case ColumnType::Boolean: return say<MessageCode::aBoolean>();
    case ColumnType::Blob: return say<MessageCode::asItStands>(exampleOfBytes);
    case ColumnType::Unknown: break;
    }
    return say<MessageCode::aValue>();
}

Message missingOf(ColumnType type) {
    switch (type) {
    case ColumnType::Text: return say<MessageCode::textMissing>();
    case ColumnType::Integer:
    case ColumnType::Decimal: return say<MessageCode::numberMissing>();
    case ColumnType::Date: return say<MessageCode::dateMissing>();
    case ColumnType::Time: return say<MessageCode::timeMissing>();
    case ColumnType::Timestamp: return say<MessageCode::timestampMissing>();
    case ColumnType::Boolean: return say<MessageCode::booleanMissing>();
    case ColumnType::Blob:
    case ColumnType::Unknown: break;
    }
    return say<MessageCode::valueMissing>();
}

Message refusalOf(ColumnType type) {
    switch (type) {
    case ColumnType::Integer:
    case ColumnType::Decimal: return say<MessageCode::notANumber>();
    case ColumnType::Date: return say<MessageCode::notADate>();
    case ColumnType::Time: return say<MessageCode::notATime>();
    case ColumnType::Timestamp: return say<MessageCode::notATimestamp>();
    case ColumnType::Boolean: return say<MessageCode::notABoolean>();
    case ColumnType::Blob: return say<MessageCode::writtenSo>(exampleOfBytes);
    case ColumnType::Text:
    case ColumnType::Unknown: break;
    }
    return say<MessageCode::notAMoment>();
}

std::optional<sql::Value> literal(StringView text, ColumnType type) {
    switch (type) {
    case ColumnType::Text: return sql::Value{ColumnType::Text, String(text)};
    case ColumnType::Integer:
    case ColumnType::Decimal: return numberValue(text);
    case ColumnType::Date: return dateValue(text);
    case ColumnType::Time: return timeValue(text);
    case ColumnType::Timestamp: return timestampValue(text);
    case ColumnType::Boolean: return booleanValue(text);
    case ColumnType::Blob: return bytesValue(text);
    case ColumnType::Unknown: break;
    }
    if (auto number = numberValue(text)) return number;
    return sql::Value{ColumnType::Text, String(text)};
}

std::optional<sql::Value> momentLiteral(StringView text, ColumnType type) {
    switch (type) {
    case ColumnType::Date:
    case ColumnType::Time:
    case ColumnType::Timestamp: return literal(text, type);
    case ColumnType::Unknown: break;
    default: return {};
    }
    for (const auto kind : {ColumnType::Date, ColumnType::Time, ColumnType::Timestamp})
        if (auto value = literal(text, kind)) return value;
    return {};
}

bool comparable(ColumnType left, ColumnType right) {
    return left == right || left == ColumnType::Unknown || right == ColumnType::Unknown ||
           (isNumber(left) && isNumber(right));
}

String likePattern(StringView typed) {
    constexpr StringView wild = u"*?%_[";
    String out;
    for (std::size_t i = 0; i < typed.size(); ++i) {
        const char16_t c = typed[i];
        const bool bracketed = c == u'[' && i + 2 < typed.size() && typed[i + 2] == u']' &&
                               wild.find(typed[i + 1]) != StringView::npos;
        if (bracketed) {
            const char16_t itself = typed[i + 1];
            if (itself == u'%' || itself == u'_') out += u'\\';
            out += itself;
            i += 2;
        } else if (c == u'*') {
            out += u'%';
        } else if (c == u'?') {
            out += u'_';
        } else {
            if (c == u'\\') out += u'\\';
            out += c;
        }
    }
    return out;
}

} // namespace zandor::model::criteria
