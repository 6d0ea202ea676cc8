#include "core/date.h"

#include "core/dialogue.h"

#include <QStringList>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

/// Two digits may mean a year as far ahead as this.
constexpr int years_ahead = 10;

int whole_number(QStringView text, qsizetype least_digits, qsizetype most_digits)
{
    if (text.size() < least_digits || text.size() > most_digits)
        return -1;
    int number = 0;
    for (const QChar c : text) {
        if (c < u'0' || c > u'9')
            return -1;
        number = number * 10 + c.unicode() - u'0';
    }
    return number;
}

int year_from(QStringView typed, const QDate& today)
{
    if (typed.compare(u"XXXX", Qt::CaseInsensitive) == 0)
        return Date::unknown_year;
    const int year = whole_number(typed, 2, 4);
    if (typed.size() != 2 || year < 0)
        return typed.size() == 4 ? year : -1;
    const int this_century = today.year() / 100 * 100 + year;
    return this_century > today.year() + years_ahead ? this_century - 100 : this_century;
}

} // namespace

bool Date::valid() const
{
    if (year == unknown_year)
        return QDate::isValid(2000, month, day);
    return year >= 1 && year <= 9999 && QDate::isValid(year, month, day);
}

QString Date::stored() const
{
    if (!valid())
        return {};
    return u"%1-%2-%3"_s.arg(year, 4, 10, QChar(u'0')).arg(month, 2, 10, QChar(u'0')).arg(day, 2, 10, QChar(u'0'));
}

QString Date::shown(DayOrder order) const
{
    if (!valid())
        return {};
    const int first = order == DayOrder::day_first ? day : month;
    const int second = order == DayOrder::day_first ? month : day;
    const QString shown_year = year_known() ? u"%1"_s.arg(year, 4, 10, QChar(u'0')) : u"XXXX"_s;
    return u"%1/%2/%3"_s.arg(first, 2, 10, QChar(u'0')).arg(second, 2, 10, QChar(u'0')).arg(shown_year);
}

QDate Date::qdate() const
{
    return valid() && year_known() ? QDate(year, month, day) : QDate();
}

std::optional<Date> Date::from_stored(QStringView text)
{
    if (text.size() != 10 || text[4] != u'-' || text[7] != u'-')
        return {};
    const Date date{whole_number(text.first(4), 4, 4), whole_number(text.sliced(5, 2), 2, 2),
                    whole_number(text.sliced(8), 2, 2)};
    return date.valid() ? std::optional(date) : std::nullopt;
}

std::optional<Date> parse_date(QStringView typed, DayOrder order, const QDate& today)
{
    const auto parts = typed.trimmed().split(u'/');
    if (parts.size() != 3)
        return {};
    const int first = whole_number(parts[0], 1, 2);
    const int second = whole_number(parts[1], 1, 2);
    const Date date{year_from(parts[2], today), order == DayOrder::day_first ? second : first,
                    order == DayOrder::day_first ? first : second};
    return date.valid() ? std::optional(date) : std::nullopt;
}

Message bad_date_message(DayOrder order)
{
    const auto format = order == DayOrder::day_first ? u"Correct format = DD/MM/YY or DD/MM/YYYY"_s
                                                     : u"Correct format = MM/DD/YY Or MM/DD/YYYY"_s;
    const auto unknown = u"To enter a date when you don't know the year use XXXX for the year. "
                         "For Example DD/MM/XXXX."_s;
    return {.text = u"Incorrect format."_s, .more = format + u'\n' + unknown};
}

} // namespace kindrel::core
