#include "people/filter_json.h"

#include "people/record_json.h"

#include <QJsonDocument>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

constexpr int version = 1;
// How many values the enumerations have.
constexpr int ministry_choices = 5, mark_choices = 3, date_sources = 5, date_spans = 3;

} // namespace

template <class Side>
void describe(Side& side, PersonStates& states)
{
    side.member("active", states.active);
    side.member("privacy", states.privacy);
    side.member("prospect", states.prospect);
    side.member("archived", states.archived);
    side.member("contact", states.contact);
    side.member("deceased", states.deceased);
}

template <class Side>
void describe(Side& side, FilterItem& item)
{
    side.code("kind", item.kind, filter_kind_count);
    side.member("item", item.item);
    side.member("text", item.text);
    side.member("exclude", item.exclude);
    side.code("ministry", item.ministry, ministry_choices);
    side.code("marks", item.marks, mark_choices);
    side.member("value", item.value);
}

template <class Side>
void describe(Side& side, SurnameRange& range)
{
    side.member("first", range.first);
    side.member("last", range.last);
    side.member("own_surname", range.own_surname);
}

template <class Side>
void describe(Side& side, SchoolYears& years)
{
    side.member("first", years.first);
    side.member("last", years.last);
}

template <class Side>
void describe(Side& side, Ages& ages)
{
    side.member("youngest", ages.youngest);
    side.member("oldest", ages.oldest);
    side.member("on", ages.on);
}

template <class Side>
void describe(Side& side, DateCriterion& criterion)
{
    side.code("source", criterion.source, date_sources);
    side.member("item", criterion.item);
    side.member("text", criterion.text);
    side.code("span", criterion.span, date_spans);
    side.member("from", criterion.from);
    side.member("to", criterion.to);
    side.member("month", criterion.month);
}

template <class Side>
void describe(Side& side, Filter& filter)
{
    side.code("families", filter.families, family_list_count);
    side.member("states", filter.states);
    side.member("items", filter.items);
    side.member("surnames", filter.surnames);
    side.member("school_years", filter.school_years);
    side.member("ages", filter.ages);
    side.member("dates", filter.dates);
    side.member("suburb_known", filter.suburb_known);
    side.member("own_postcode", filter.own_postcode);
    side.code("family_type", filter.family_type, static_cast<int>(family_types().size()));
    side.member("fusions", filter.fusions);
}

QByteArray to_json(const Filter& filter)
{
    // The descriptions serve the reader too and so take what may be changed.
    auto copy = filter;
    return QJsonDocument(QJsonObject{{u"version"_s, version}, {u"filter"_s, JsonWriter::json(copy)}})
        .toJson(QJsonDocument::Compact);
}

ReadFilter filter_from_json(const QByteArray& json)
{
    const auto object = QJsonDocument::fromJson(json).object();
    const int found = object.value(u"version"_s).toInt();
    if (found > version)
        return {{}, FilterFault::newer};
    ReadFilter read;
    if (found != version || !JsonReader::read(object.value(u"filter"_s), read.filter))
        return {{}, FilterFault::unreadable};
    return read;
}

} // namespace kindrel::people
