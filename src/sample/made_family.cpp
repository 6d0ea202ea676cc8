#include "sample/made_family.h"

#include "sample/word_list.h"

namespace kindrel::sample {

using namespace Qt::StringLiterals;

namespace {

constexpr int days_of_year = 365;

} // namespace

Stock::Stock(const SetupLists& setup_lists, const QDate& day)
    : lists(setup_lists), today(day), streets(read_words(u"streets"_s)), events(read_words(u"events"_s)),
      contacts(read_words(u"other_contacts"_s)), visitors(read_words(u"visitors"_s)),
      comments(read_words(u"visit_comments"_s))
{
}

core::Date day_at_age(const Stock& stock, int age, int at, Chance& chance)
{
    const auto day = stock.today.addYears(at - age).addDays(-chance.below(days_of_year));
    return core::Date::from(std::min(day, stock.today));
}

core::Date recent_day(const Stock& stock, int years, Chance& chance)
{
    return core::Date::from(stock.today.addDays(-chance.below(years * days_of_year)));
}

people::LinkRow link_to(const SetupItem& item)
{
    people::LinkRow row;
    row.item = item.key;
    return row;
}

people::LinkRow dated_link(const SetupItem& item, const core::Date& date, bool tagged)
{
    auto row = link_to(item);
    row.date = date;
    row.tagged = tagged;
    return row;
}

QString phone_number(Chance& chance)
{
    // Numbers that are kept for fiction.
    const auto exchange = chance.percent(50) ? u"5550"_s : u"7010"_s;
    return u"(03) %1 %2"_s.arg(exchange).arg(chance.below(10000), 4, 10, '0'_L1);
}

QString mobile_number(Chance& chance)
{
    // No network of the country uses this beginning.
    return u"0555 %1 %2"_s.arg(chance.below(1000), 3, 10, '0'_L1).arg(chance.below(1000), 3, 10, '0'_L1);
}

} // namespace kindrel::sample
