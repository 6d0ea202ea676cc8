#include "people/filter_words.h"

#include <QLocale>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// "20 to 30", or "20" alone.
QString range_words(int first, int last)
{
    return first == last ? QString::number(first) : u"%1 to %2"_s.arg(first).arg(last);
}

QString month_words(int month)
{
    return month >= 1 && month <= 12 ? QLocale::c().monthName(month) : QString::number(month);
}

/// A day of any year: "1 March", or "March 1".
QString day_words(const core::Date& date, core::DayOrder order)
{
    const auto month = month_words(date.month);
    return order == core::DayOrder::month_first ? u"%1 %2"_s.arg(month).arg(date.day)
                                                : u"%1 %2"_s.arg(date.day).arg(month);
}

QString source_words(const DateCriterion& criterion)
{
    switch (criterion.source) {
    case DateSource::birth_date:
        return u"born"_s;
    case DateSource::personal_date:
        return criterion.item == 0 ? u"with any date"_s : u"with the date %1"_s.arg(criterion.text);
    case DateSource::family_date:
        return criterion.item == 0 ? u"of a family with any date"_s
                                   : u"of a family with the date %1"_s.arg(criterion.text);
    case DateSource::events:
        return u"of a family with an event"_s;
    case DateSource::visits:
        return u"of a family visited"_s;
    }
    return {};
}

} // namespace

QString alternatives(const QStringList& words)
{
    if (words.size() < 2)
        return words.join(QString());
    return words.first(words.size() - 1).join(u", "_s) + u" or "_s + words.last();
}

QString words_of(const PersonStates& states)
{
    QStringList chosen;
    for (const auto& row : person_states()) {
        if (states.*row.on)
            chosen += row.words.toString();
    }
    if (chosen.isEmpty())
        return u"people of no state"_s;
    return u"people who are %1, or of no state"_s.arg(alternatives(chosen));
}

QString words_of(const SurnameRange& range)
{
    const auto whose = range.own_surname ? u"with their own surname"_s : u"with the family's surname"_s;
    if (range.first.isEmpty() || range.last.isEmpty())
        return range.first.isEmpty() ? u"%1 up to %2"_s.arg(whose, range.last)
                                     : u"%1 from %2"_s.arg(whose, range.first);
    return u"%1 from %2 to %3"_s.arg(whose, range.first, range.last);
}

QString words_of(const SchoolYears& years)
{
    return u"in school year %1"_s.arg(range_words(years.first, years.last));
}

QString words_of(const Ages& ages, const FilterDay& day)
{
    const auto on = ages.on.value_or(core::Date::from(day.today));
    return u"aged %1 on %2"_s.arg(range_words(ages.youngest, ages.oldest), on.shown(day.order));
}

QString words_of(const DateCriterion& criterion, core::DayOrder order)
{
    const auto source = source_words(criterion);
    switch (criterion.span) {
    case DateSpan::days:
        return u"%1 from %2 to %3"_s.arg(source, criterion.from.shown(order), criterion.to.shown(order));
    case DateSpan::anniversaries:
        return u"%1 between %2 and %3 of any year"_s.arg(source, day_words(criterion.from, order),
                                                         day_words(criterion.to, order));
    case DateSpan::month:
        return u"%1 in %2"_s.arg(source, month_words(criterion.month));
    }
    return {};
}

} // namespace kindrel::people
