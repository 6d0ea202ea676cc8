#include "output/custom/custom_values.h"

#include "output/family_lines.h"
#include "output/letters/letter_fields.h"
#include "pages/page.h"
#include "people/sort_key.h"

#include <algorithm>

namespace kindrel::output::custom {

using namespace Qt::StringLiterals;
using people::LinkRow;
using people::MinistryState;
using people::Person;
using people::SuburbType;

FieldValues single(const QString& text)
{
    return {{text}};
}

FieldValues single(const FieldSource& source, const std::optional<core::Date>& date)
{
    return {{.text = shown(*source.family, date), .day = date}};
}

FieldValues single(int number)
{
    return {{.text = QString::number(number), .place = number}};
}

FieldValues listed(const QStringList& texts)
{
    FieldValues values;
    for (const auto& text : texts)
        values.push_back({text});
    return values;
}

namespace {

FieldValues names(const FieldSource& source, std::span<const Person* const> people)
{
    FieldValues values;
    for (const auto* person : people)
        values.push_back({source.family->name(*person)});
    return values;
}

QString name_of(const FieldSource& source, const Person* person)
{
    return person ? source.family->name(*person) : QString();
}

FieldValues with_surname(const FieldSource& source, const QString& names)
{
    return single(joined(u" ", {names, source.family->family().surname}));
}

FieldValues ministries_of(const FieldSource& source, std::optional<MinistryState> only)
{
    auto rows = source.person->ministries;
    if (only)
        std::erase_if(rows, [&](const LinkRow& row) { return row.type != static_cast<int>(*only); });
    auto values = values_of_rows(*source.family, rows);
    for (std::size_t i = 0; !only && i < rows.size(); ++i) {
        if (rows[i].type == static_cast<int>(MinistryState::potential))
            values[i].text += u" (potential)"_s;
    }
    return values;
}

QString suburb_name(const people::Suburb* suburb)
{
    return suburb ? suburb->suburb : QString();
}

QString postcode_of(const people::Suburb* suburb)
{
    return suburb ? suburb->shown_postcode() : QString();
}

} // namespace

FieldValues values_of_rows(const people::DisclosedFamily& family, const std::vector<LinkRow>& rows)
{
    FieldValues values;
    for (const auto& row : rows) {
        FieldValue value{row.text, row.text, row.text, row.item, row.date};
        if (row.date) {
            value.bare = family.shown(*row.date);
            value.text = joined(u" ", {row.text, value.bare});
        } else if (!row.field.isEmpty()) {
            value.bare = row.field;
            value.text = joined(u": ", {row.text, row.field});
        }
        values.push_back(std::move(value));
    }
    return values;
}

FieldValues pages(const FieldSource&)
{
    return single(QString(pages::page_total_mark));
}

FieldValues letter(const FieldSource& source)
{
    const auto key = people::sort_key(source.family->family().surname);
    const bool filed = !key.isEmpty() && key.front().isLetter();
    return {{.text = filed ? QString(key.front()) : u"#"_s, .place = filed ? 1 : 0}};
}

FieldValues primary_name(const FieldSource& source)
{
    return single(name_of(source, source.household->primary));
}

FieldValues spouse_name(const FieldSource& source)
{
    return single(name_of(source, source.household->spouse));
}

FieldValues both_names(const FieldSource& source)
{
    return single(couple_names(*source.family, *source.household));
}

FieldValues both_names_and_surname(const FieldSource& source)
{
    return with_surname(source, couple_names(*source.family, *source.household));
}

FieldValues titled_names(const FieldSource& source)
{
    return with_surname(source, titled_couple(*source.family, *source.household));
}

FieldValues titled_initials(const FieldSource& source)
{
    return with_surname(source, titled_couple(*source.family, *source.household, Called::by_initial));
}

FieldValues primary_title(const FieldSource& source)
{
    return single(source.household->primary ? source.household->primary->Title : QString());
}

FieldValues spouse_title(const FieldSource& source)
{
    return single(source.household->spouse ? source.household->spouse->Title : QString());
}

FieldValues children(const FieldSource& source)
{
    return names(source, source.household->children);
}

FieldValues adults(const FieldSource& source)
{
    return names(source, source.household->adults);
}

FieldValues everybody(const FieldSource& source)
{
    auto all = adults(source);
    std::ranges::copy(children(source), std::back_inserter(all));
    return all;
}

FieldValues and_family(const FieldSource& source)
{
    return single(source.household->children.empty() ? QString() : u"& Family"_s);
}

FieldValues people_in_family(const FieldSource& source)
{
    return single(int(source.household->adults.size() + source.household->children.size()));
}

FieldValues condition(const FieldSource& source)
{
    constexpr std::array<QStringView, 4> words{u"Active", u"Privacy", u"Prospect", u"Archive"};
    const auto status = static_cast<std::size_t>(source.family->family().Condition);
    return status < words.size() ? single(words[status].toString()) : FieldValues();
}

FieldValues residential_lines(const FieldSource& source)
{
    return listed(address_lines(*source.family, SuburbType::residential));
}

FieldValues suburb(const FieldSource& source)
{
    return single(suburb_name(source.family->residential()));
}

FieldValues postcode(const FieldSource& source)
{
    return single(postcode_of(source.family->residential()));
}

FieldValues suburb_address(const FieldSource& source)
{
    return single(residential_suburb_line(*source.family));
}

FieldValues postal_lines(const FieldSource& source)
{
    return listed(address_lines(*source.family, SuburbType::postal));
}

FieldValues postal_suburb(const FieldSource& source)
{
    return single(suburb_name(source.family->postal()));
}

FieldValues postal_postcode(const FieldSource& source)
{
    return single(postcode_of(source.family->postal()));
}

FieldValues mailing(const FieldSource& source)
{
    return listed(mailing_lines(*source.family));
}

FieldValues other_contacts(const FieldSource& source)
{
    FieldValues values;
    for (const auto& one : source.family->file().other_contacts)
        values.push_back({joined(u": ", {one.contact, one.phone}), one.contact, one.phone});
    return values;
}

FieldValues events(const FieldSource& source)
{
    FieldValues values;
    for (const auto& one : source.family->file().events) {
        const auto day = shown(*source.family, one.event_date);
        values.push_back({joined(u" ", {day, one.event}), one.event, day, 0, one.event_date});
    }
    return values;
}

FieldValues visits(const FieldSource& source)
{
    FieldValues values;
    for (const auto& one : source.family->file().visits)
        values.push_back({joined(u" ", {shown(*source.family, one.date), joined(u": ", {one.visitor, one.comments})})});
    return values;
}

FieldValues name(const FieldSource& source)
{
    return single(source.family->name(*source.person));
}

FieldValues full_name(const FieldSource& source)
{
    const ListedMember member{*source.family, *source.person};
    return single(joined(u" ", {source.person->Title, member.name(), member.surname()}));
}

FieldValues role(const FieldSource& source)
{
    const auto household = people::household_of(source.family->people());
    const auto* person = source.person;
    return single(person == household.primary  ? u"Primary"_s
                  : person == household.spouse ? u"Spouse"_s
                  : people::is_child(*person)  ? u"Child"_s
                                               : u"Adult"_s);
}

FieldValues age(const FieldSource& source)
{
    const auto& born = source.person->birthdate;
    if (!born || !born->year_known())
        return {};
    const auto today = core::Date::from(source.run.today);
    const bool birthday_ahead = std::pair(today.month, today.day) < std::pair(born->month, born->day);
    const int years = today.year - born->year - (birthday_ahead ? 1 : 0);
    return years < 0 ? FieldValues() : single(years);
}

FieldValues school_year(const FieldSource& source)
{
    const auto& year = source.person->school_year;
    return {{.text = people::school_year_text(year), .place = year.value_or(0)}};
}

FieldValues ministries(const FieldSource& source)
{
    return ministries_of(source, {});
}

FieldValues active_ministries(const FieldSource& source)
{
    return ministries_of(source, MinistryState::active);
}

FieldValues potential_ministries(const FieldSource& source)
{
    return ministries_of(source, MinistryState::potential);
}

} // namespace kindrel::output::custom
