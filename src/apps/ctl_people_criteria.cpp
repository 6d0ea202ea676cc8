#include "apps/ctl_people_criteria.h"

#include "core/entry.h"
#include "people/sort_key.h"

#include <QLocale>
#include <QRegularExpression>

#include <algorithm>
#include <array>

namespace kindrel::apps {

using namespace Qt::StringLiterals;
using people::FilterKind;
using people::SortBy;

namespace {

struct ItemOption
{
    const char* option;
    FilterKind kind;
    bool exclude;
};

constexpr std::array item_options{
    ItemOption{"status", FilterKind::status, false},
    ItemOption{"not-status", FilterKind::status, true},
    ItemOption{"group", FilterKind::groups, false},
    ItemOption{"not-group", FilterKind::groups, true},
    ItemOption{"ministry", FilterKind::ministry, false},
    ItemOption{"family-group", FilterKind::family_groups, false},
    ItemOption{"occupation", FilterKind::occupation, false},
    ItemOption{"suburb", FilterKind::suburb, false},
};

/// In the order of people::person_states().
constexpr std::array state_words{"active", "privacy", "prospect", "archived", "contact", "deceased"};

/// Ends the reading of the command line.
struct Fault
{
    Status status;
    QString words;
};

Fault misread(const QString& option, const QString& value)
{
    return {Status::wrong_usage, u"--%1 %2 cannot be understood."_s.arg(option, value)};
}

people::FamilyList list_called(const QString& name)
{
    QStringList names;
    for (int list = 0; list < people::family_list_count; ++list) {
        names += people::family_list_name(people::FamilyList(list));
        if (names.last().compare(name, Qt::CaseInsensitive) == 0)
            return people::FamilyList(list);
    }
    throw Fault{Status::wrong_usage, u"There is no family list \"%1\", only %2."_s.arg(name, names.join(u", "_s))};
}

people::PersonStates states_of(const QString& words)
{
    people::PersonStates states{.active = false};
    for (const auto& word : words.split(u',')) {
        const auto* found =
            std::ranges::find_if(state_words, [&](auto known) { return word.trimmed() == QLatin1StringView(known); });
        if (found == state_words.end())
            throw misread(u"people"_s, words);
        states.*people::person_states()[std::size_t(found - state_words.begin())].on = true;
    }
    return states;
}

std::optional<people::SetupItem> item_called(core::Session& session, people::SetupKind list, const QString& name)
{
    for (const auto& item : people::read_setup_items(session, list)) {
        if (people::sort_key(item.text) == people::sort_key(name))
            return item;
    }
    return std::nullopt;
}

void add_items(Context& context, people::Filter& filter)
{
    for (const auto& [option, kind, exclude] : item_options) {
        const auto& row = people::filter_kind(kind);
        for (const auto& name : context.arguments.values(QString::fromLatin1(option))) {
            const auto item = item_called(*context.office->session, row.list, name);
            if (!item)
                throw Fault{Status::refused, u"There is no %1 \"%2\"."_s.arg(row.noun, name)};
            filter.items.push_back({.kind = kind, .item = item->key, .text = item->text, .exclude = exclude});
        }
    }
}

people::Ages ages_of(const QString& value)
{
    static const QRegularExpression form(u"^(\\d+)(?:-(\\d+))?$"_s);
    const auto match = form.match(value);
    if (!match.hasMatch())
        throw misread(u"age"_s, value);
    const int from = match.captured(1).toInt();
    const int to = match.captured(2).isEmpty() ? from : match.captured(2).toInt();
    return {.youngest = std::min(from, to), .oldest = std::max(from, to)};
}

int month_called(const QString& name)
{
    for (int month = 1; month <= 12; ++month) {
        if (QLocale::c().monthName(month).compare(name, Qt::CaseInsensitive) == 0)
            return month;
    }
    return 0;
}

/// A day of any year, written in the church's order.
core::Date day_of(const QString& one, const QString& other, core::DayOrder order)
{
    const bool day_first = order == core::DayOrder::day_first;
    return {core::Date::unknown_year, (day_first ? other : one).toInt(), (day_first ? one : other).toInt()};
}

people::DateCriterion born(const QString& value, core::DayOrder order)
{
    people::DateCriterion criterion{.span = people::DateSpan::month, .month = month_called(value)};
    if (criterion.month > 0)
        return criterion;
    static const QRegularExpression form(u"^(\\d+)/(\\d+)-(\\d+)/(\\d+)$"_s);
    const auto match = form.match(value);
    criterion.span = people::DateSpan::anniversaries;
    criterion.from = day_of(match.captured(1), match.captured(2), order);
    criterion.to = day_of(match.captured(3), match.captured(4), order);
    if (!match.hasMatch() || !criterion.from.valid() || !criterion.to.valid())
        throw misread(u"born"_s, value);
    return criterion;
}

people::SurnameRange surnames_of(const QString& value)
{
    const auto parts = value.split(u'-');
    if (parts.size() > 2 || parts.first().isEmpty())
        throw misread(u"surname"_s, value);
    return {.first = parts.first(), .last = parts.last()};
}

people::SortOrder order_called(core::Session& session, const QString& name)
{
    for (int by = 0; by <= int(SortBy::family_events); ++by) {
        if (people::sort_label(SortBy(by)).toLower().replace(u' ', u'-') == name.toLower())
            return {.by = SortBy(by)};
    }
    const std::array kinds{std::pair{SortBy::personal_date, people::SetupKind::personal_dates},
                           std::pair{SortBy::family_date, people::SetupKind::family_dates}};
    for (const auto& [by, kind] : kinds) {
        if (const auto item = item_called(session, kind, name))
            return {.by = by, .item = item->key, .item_text = item->text};
    }
    throw Fault{Status::refused, u"There is no order and no date \"%1\"."_s.arg(name)};
}

Criteria read(Context& context)
{
    const auto& given = context.arguments;
    Criteria criteria;
    auto& filter = criteria.filter;
    filter.families = list_called(given.value(u"list"_s, u"Active Families"_s));
    filter.states = states_of(given.value(u"people"_s, u"active"_s));
    add_items(context, filter);
    if (given.has(u"age"_s))
        filter.ages = ages_of(given.value(u"age"_s));
    if (given.has(u"born"_s))
        filter.dates.push_back(born(given.value(u"born"_s), context.office->day_order()));
    if (given.has(u"surname"_s))
        filter.surnames = surnames_of(given.value(u"surname"_s));
    criteria.sort = order_called(*context.office->session, given.value(u"sort"_s, u"family"_s));
    const auto of_order = people::right_for(criteria.sort.by);
    const auto of_filter = people::asks_for_birth_dates(filter) ? std::optional(core::Area::birth_dates) : std::nullopt;
    for (const auto right : {of_filter, of_order}) {
        if (right && !core::permitted(*context.office, *right))
            throw Fault{Status::refused, {}};
    }
    return criteria;
}

} // namespace

Criteria read_criteria(Context& context, std::optional<Status>& fault)
{
    try {
        return read(context);
    } catch (const Fault& found) {
        fault = found.status;
        if (!found.words.isEmpty())
            context.dialogue.show({found.words});
    }
    return {};
}

} // namespace kindrel::apps
