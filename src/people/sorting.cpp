#include "people/sorting.h"

#include <QLocale>

#include <algorithm>
#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::to_value;
using core::Value;

constexpr auto in_families = u"b.[family_sort_key],b.[Primary_name],b.[Surname_ID],b.[position],b.[Name],b.[person_id]";

/// Where a date order finds its dates: of each owner the first one counts, of visits the last.
struct DateSource
{
    const char16_t* table;
    const char16_t* owner; ///< `person_id` or `surname_id`.
    const char16_t* date;
    const char16_t* item = nullptr;
    bool latest = false;
};

struct Rule
{
    SortBy by;
    const char16_t* label;
    const char16_t* order; ///< In front of the order of families.
    std::optional<DateSource> source = {};
    std::optional<core::Area> right = {};
};

constexpr std::array rules{
    Rule{SortBy::family, u"Family", u""},
    Rule{SortBy::individual, u"Individual", u"b.[sort_key],b.[Name],"},
    Rule{SortBy::suburb, u"Suburb", u"CASE WHEN b.[suburb] IS NULL THEN 1 ELSE 0 END,b.[suburb],"},
    Rule{SortBy::postcode, u"Postcode", u"CASE WHEN b.[postcode] IS NULL THEN 1 ELSE 0 END,b.[postcode],"},
    Rule{SortBy::birth_date, u"Birth Date", u"", DateSource{u"tbl_personal_details", u"person_id", u"birthdate"},
         core::Area::birth_dates},
    Rule{SortBy::visitation, u"Visitation", u"", DateSource{u"tbl_visitation", u"surname_id", u"date", nullptr, true},
         core::Area::visitation_tab},
    Rule{SortBy::family_events, u"Family Events", u"", DateSource{u"tbl_events", u"surname_id", u"event_date"}},
    Rule{SortBy::personal_date, u"Personal Date", u"",
         DateSource{u"tbl_individual_date", u"person_id", u"in_date", u"in_date_id"}},
    Rule{SortBy::family_date, u"Family Date", u"",
         DateSource{u"tbl_family_date", u"surname_id", u"family_date", u"family_date_id"}},
};
static_assert(std::ranges::is_sorted(rules, {}, &Rule::by));

const Rule& rule_of(SortBy by)
{
    return rules[static_cast<std::size_t>(by)];
}

/// One statement in the making.
struct Statement
{
    QString text;
    std::vector<Value> values;

    template <class... V>
    void add(const QString& more, const V&... bound)
    {
        text += more;
        (values.push_back(to_value(bound)), ...);
    }
};

void add_search(Statement& statement, const SortOrder& order, const QDate& today)
{
    switch (order.search) {
    case DateSearch::none:
        break;
    case DateSearch::month:
        statement.add(u" AND CAST(substr(d.[day],6,2) AS BIGINT)=?"_s, order.month.value_or(0));
        break;
    case DateSearch::ages: // Of this year's dates and those without a year nobody knows an age.
        statement.add(u" AND CAST(substr(d.[day],1,4) AS BIGINT)>=? AND CAST(substr(d.[day],1,4) AS BIGINT)<=? AND "
                      "CAST(substr(d.[day],1,4) AS BIGINT)<? AND CAST(substr(d.[day],1,4) AS BIGINT)<>?"_s,
                      today.year() - order.ages->second, today.year() - order.ages->first, today.year(),
                      core::Date::unknown_year);
        break;
    case DateSearch::dates:
        statement.add(u" AND d.[day]>=? AND d.[day]<=?"_s, order.dates->first, order.dates->second);
        break;
    }
}

/// Whether the years count: otherwise dates stand in the order of the calendar year.
bool by_whole_date(const SortOrder& order)
{
    return order.by == SortBy::visitation || order.search == DateSearch::ages || order.search == DateSearch::dates;
}

/// Joins one date for each owner as `s.[day]`.
void join_dates(Statement& statement, const SortOrder& order, const DateSource& source, const QDate& today)
{
    const auto sought = by_whole_date(order) ? u"d.[day]"_s : u"substr(d.[day],6,5) || substr(d.[day],1,4)"_s;
    statement.add((order.search == DateSearch::none ? u" LEFT JOIN "_s : u" INNER JOIN "_s) +
                  u"(SELECT d.[owner], %1(%2) AS [day] FROM (SELECT [%3] AS [owner],[%4] AS [day] FROM [%5]"_s.arg(
                      source.latest ? u"MAX"_s : u"MIN"_s, sought, QString::fromUtf16(source.owner),
                      QString::fromUtf16(source.date), QString::fromUtf16(source.table)));
    if (source.item)
        statement.add(u" WHERE [%1]=?"_s.arg(QString::fromUtf16(source.item)), order.item);
    statement.add(u") d WHERE d.[day] IS NOT NULL"_s);
    add_search(statement, order, today);
    statement.add(u" GROUP BY d.[owner]) s ON s.[owner]=b.[%1]"_s.arg(QString::fromUtf16(source.owner)));
}

void add_type(Statement& statement, FamilyType type)
{
    const auto codes = family_type(type).codes;
    if (codes.empty())
        return;
    statement.add(u" WHERE b.[Marital] IN (?"_s + u",?"_s.repeated(static_cast<qsizetype>(codes.size()) - 1) + u')');
    for (const int code : codes)
        statement.values.push_back(to_value(code));
}

Statement statement_of(const SortOrder& order, const QDate& today)
{
    const Rule& rule = rule_of(order.by);
    Statement statement;
    statement.add(u"SELECT b.[person_id],b.[Surname_ID] FROM [work_people] w "
                  "INNER JOIN [qry_filter1_all] b ON b.[person_id]=w.[person_id]"_s);
    if (rule.source)
        join_dates(statement, order, *rule.source, today);
    add_type(statement, order.type);
    statement.add(u" ORDER BY "_s + QString::fromUtf16(rule.order));
    if (rule.source)
        statement.add(u"CASE WHEN s.[day] IS NULL THEN 1 ELSE 0 END,s.[day],"_s);
    statement.add(QString::fromUtf16(in_families) + u';');
    return statement;
}

QString search_in_words(const SortOrder& order, core::DayOrder day_order)
{
    switch (order.search) {
    case DateSearch::month:
        return u" in %1"_s.arg(QLocale::c().monthName(order.month.value_or(1)));
    case DateSearch::ages:
        return u" at ages %1 to %2"_s.arg(order.ages->first).arg(order.ages->second);
    case DateSearch::dates:
        return u" from %1 to %2"_s.arg(order.dates->first.shown(day_order), order.dates->second.shown(day_order));
    case DateSearch::none:
        break;
    }
    return {};
}

} // namespace

QString sort_label(SortBy by)
{
    return QString::fromUtf16(rule_of(by).label);
}

std::optional<core::Area> right_for(SortBy by)
{
    return rule_of(by).right;
}

bool is_by_date(SortBy by)
{
    return rule_of(by).source.has_value();
}

std::optional<core::Message> sort_refusal(const SortOrder& order)
{
    if (!is_by_date(order.by))
        return std::nullopt;
    if (order.search == DateSearch::month && !order.month)
        return core::Message{u"Please select a month for the date search"_s};
    if (order.search == DateSearch::ages && !order.ages)
        return core::Message{u"Please enter the ages you wish to conduct the date search for"_s};
    if (order.search == DateSearch::dates && !order.dates)
        return core::Message{u"Please enter the dates you wish to conduct the date search for"_s};
    return std::nullopt;
}

WorkingList sorted(core::Session& session, const WorkingList& list, const SortOrder& order, const QDate& today)
{
    lend(session, list);
    const Statement statement = statement_of(order, today);
    WorkingList found{{}, list.criteria};
    found.members.reserve(list.members.size());
    auto rows = session.select_with(statement.text, statement.values);
    for (const core::Row& row : rows)
        found.members.push_back({row.integer(core::Column{0}), row.integer(core::Column{1})});
    return found;
}

QString sort_sentence(const SortOrder& order, core::DayOrder day_order)
{
    const QString what = order.item_text.isEmpty() ? sort_label(order.by) : order.item_text;
    const QString by = order.by == SortBy::family ? QString() : u"by "_s + what;
    const QString search = is_by_date(order.by) ? search_in_words(order, day_order) : QString();
    const QString type =
        order.type == FamilyType::all_people ? QString() : family_type(order.type).label.toString() + u" only"_s;
    return by + search + (by.isEmpty() || type.isEmpty() ? QString() : u", "_s) + type;
}

} // namespace kindrel::people
