#include "designer/run/CellFormat.h"

#include <QCoreApplication>
#include <QDateTime>
#include <QLocale>
#include <QRegularExpression>

namespace zandor::designer {

using model::Format;

namespace {

constexpr int decimalsOfPercent = 2; // that move before the point

class Words {
    Q_DECLARE_TR_FUNCTIONS(zandor::designer::CellFormat)
};

QString withDecimalSign(const QString& number) {
    return QString(number).replace(u'.', QLocale().decimalPoint());
}

/// Digits with marks as the user's language groups them: mostly by threes, and in some languages
/// from five digits on.
QString grouped(const QString& digits) {
    QLocale locale;
    locale.setNumberOptions(QLocale::DefaultNumberOptions);
    const QString mark = locale.groupSeparator();
    const QStringList groups = locale.toString(1'000'000'000'000LL).split(mark);
    if (mark.isEmpty() || groups.size() < 3) return digits;
    const qsizetype last = groups.last().size();
    if (digits.size() == last + 1 && !locale.toString(1'000).contains(mark)) return digits;
    QString result = digits;
    for (qsizetype at = digits.size() - last; at > 0; at -= groups[groups.size() - 2].size())
        result.insert(at, mark);
    return result;
}

/// What a text of an engine says of a moment.
struct Moment {
    QDate date = {};
    QTime time = {};
    QString offset = {}; ///< from UTC, as it is written
};

/// "2026-12-31", "23:59:59", or both; nothing in what is no moment of the calendar.
Moment momentIn(const QString& text) {
    static const QRegularExpression form(QStringLiteral("^(?:(\\d{4}-\\d\\d-\\d\\d)(?:[ T]|$))?"
                                                        "(?:(\\d\\d:\\d\\d(?::\\d\\d)?)(?:\\.\\d+)?"
                                                        "( ?(?:Z|[+-]\\d\\d(?::?\\d\\d)*))?)?$"));
    const auto found = form.match(text);
    if (!found.hasMatch()) return {};
    Moment moment;
    moment.date = QDate::fromString(found.captured(1), Qt::ISODate);
    moment.time = QTime::fromString(found.captured(2), Qt::ISODate);
    if (moment.time.isValid()) moment.offset = found.captured(3).trimmed();
    return moment;
}

QString withOffset(const QString& time, const Moment& moment) {
    return moment.offset.isEmpty() ? time : time + u' ' + moment.offset;
}

/// Empty where the format is not for the moment.
QString shownMoment(const Moment& moment, Format format) {
    const QLocale locale;
    const auto& [date, time, offset] = moment;
    QString clock = time.isValid() ? withOffset(locale.toString(time, QLocale::ShortFormat), moment)
                                   : QString();
    if (format == Format::Time) return clock;
    if (!date.isValid()) return {};
    QString day = locale.toString(date, QLocale::ShortFormat);
    switch (format) {
    case Format::ShortDate: return day;
    case Format::LongDate: return locale.toString(date, QLocale::LongFormat);
    case Format::DateAndTime: return clock.isEmpty() ? day : day + u' ' + clock;
    case Format::IsoDate: return date.toString(Qt::ISODate);
    case Format::YearMonth: return date.toString(QStringLiteral("yyyy-MM"));
    case Format::Weekday: return locale.standaloneDayName(date.dayOfWeek());
    default: return {};
    }
}

} // namespace

QString shown(const Decimal& number, const CellFormat& format) {
    if (!model::isOfNumbers(format.format)) return withDecimalSign(number.text());
    Decimal value = number;
    if (format.format == Format::Percent) value.scale -= decimalsOfPercent;
    // Nobody reads hundreds of zeros.
    if (value.scale < 0 && value.text().contains(u'e')) return shown(number);
    if (format.decimals >= 0) value = value.rounded(format.decimals);
    QString text = value.text();
    if (format.format == Format::Thousands && !text.contains(u'e')) {
        const qsizetype sign = text.startsWith(u'-') ? 1 : 0;
        const qsizetype point = text.indexOf(u'.');
        const QString digits = text.mid(sign, (point < 0 ? text.size() : point) - sign);
        const QString behind =
            point < 0 ? QString() : QLocale().decimalPoint() + text.mid(point + 1);
        return text.left(sign) + grouped(digits) + behind;
    }
    text = withDecimalSign(text);
    return format.format == Format::Percent ? Words::tr("%1%", "of hundred").arg(text) : text;
}

QString shown(const Cell& cell, const CellFormat& format) {
    if (cell.kind == Cell::Kind::number) {
        const auto number =
            model::isOfNumbers(format.format) ? Decimal::from(cell.text) : std::nullopt;
        return number ? shown(*number, format) : withDecimalSign(cell.text);
    }
    if (cell.kind != Cell::Kind::text || format.format == Format::None ||
        model::isOfNumbers(format.format))
        return cell.text;
    const QString moment = shownMoment(momentIn(cell.text), format.format);
    return moment.isEmpty() ? cell.text : moment;
}

} // namespace zandor::designer
