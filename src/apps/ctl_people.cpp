#include "apps/ctl_command.h"
#include "apps/ctl_listing.h"
#include "apps/ctl_people_criteria.h"
#include "apps/ctl_people_fields.h"

#include "people/filter_search.h"

#include <QHash>

#include <algorithm>
#include <array>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

constexpr std::size_t people_at_once = 1000;
const QString usual_fields = u"surname,name,res_street,suburb,phone"_s;
constexpr std::array format_words{"text", "csv", "json"}; ///< In the order of Listing::Format.

std::optional<Listing::Format> format_from(const QString& word)
{
    const auto* found =
        std::ranges::find_if(format_words, [&](auto known) { return word == QLatin1StringView(known); });
    if (found == format_words.end())
        return std::nullopt;
    return Listing::Format(found - format_words.begin());
}

/// Those that were asked for; a name that is none goes into `unknown`.
std::vector<PeopleField> chosen_fields(const QString& names, const QDate& today, QString& unknown)
{
    const auto all = people_list_fields(today);
    std::vector<PeopleField> chosen;
    for (const auto& typed : names.split(u',')) {
        const auto found = std::ranges::find_if(all, [name = typed.trimmed()](const PeopleField& field) {
            return field.name.compare(name, Qt::CaseInsensitive) == 0;
        });
        if (found == all.end())
            unknown = typed.trimmed();
        else
            chosen.push_back(*found);
    }
    return chosen;
}

QString field_names(const QDate& today)
{
    QStringList names;
    for (const auto& field : people_list_fields(today))
        names += field.name;
    return names.join(u", "_s);
}

/// The families of some members, disclosed, by their keys.
QHash<int, people::DisclosedFamily> families_of(core::Office& office, std::span<const people::Member> members,
                                                people::Extent extent)
{
    const people::WorkingList list{{members.begin(), members.end()}, {}};
    const auto disclosure = people::Disclosure::of(office);
    QHash<int, people::DisclosedFamily> families;
    for (auto& file : people::load_families(*office.session, list.families(), extent)) {
        const int key = file.family.Surname_ID;
        families.insert(key, people::disclose(std::move(file), disclosure));
    }
    return families;
}

void add_rows(Listing& listing, core::Office& office, std::span<const people::Member> members,
              const std::vector<PeopleField>& fields)
{
    people::Extent extent;
    for (const auto& field : fields)
        extent |= field.extent;
    const auto families = families_of(office, members, extent);
    for (const auto& member : members) {
        const auto family = families.constFind(member.surname_id);
        if (family == families.constEnd())
            continue;
        const auto& people = family->people();
        const auto person = std::ranges::find(people, member.person_id, &people::Person::person_id);
        if (person == people.end())
            continue;
        Listing::Row row;
        for (const auto& field : fields)
            row.push_back(field.value(*family, *person));
        listing.add(std::move(row));
    }
}

Listing list_people(core::Office& office, const people::WorkingList& list, const std::vector<PeopleField>& fields)
{
    std::vector<Listing::Column> columns;
    for (const auto& field : fields)
        columns.push_back({field.name, field.heading});
    Listing listing(std::move(columns));
    const std::span members(list.members);
    for (std::size_t first = 0; first < members.size(); first += people_at_once)
        add_rows(listing, office, members.subspan(first, std::min(people_at_once, members.size() - first)), fields);
    return listing;
}

} // namespace

Status run_people(Context& context)
{
    auto& office = *context.office;
    const QDate today = office.clock.today();
    const auto names = context.arguments.value(u"fields"_s, usual_fields);
    if (names == "help"_L1) {
        context.out << field_names(today) << '\n';
        return Status::done;
    }
    QString unknown;
    const auto fields = chosen_fields(names, today, unknown);
    const auto format = format_from(context.arguments.value(u"format"_s, u"text"_s));
    if (fields.empty() || !unknown.isEmpty() || !format) {
        context.dialogue.show(
            {format ? u"There is no field \"%1\", see \"kindrelctl people --fields help\"."_s.arg(unknown)
                    : u"--format is text, csv or json."_s});
        return Status::wrong_usage;
    }
    std::optional<Status> fault;
    const auto criteria = read_criteria(context, fault);
    if (fault)
        return *fault;
    auto list = people::find_people(*office.session, criteria.filter, {today, office.day_order()});
    if (criteria.sort != people::SortOrder{})
        list = people::sorted(*office.session, list, criteria.sort, today);
    list_people(office, list, fields).print(context.out, *format);
    return Status::done;
}

} // namespace kindrel::apps
