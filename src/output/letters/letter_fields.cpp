#include "output/letters/letter_fields.h"

#include "output/family_lines.h"

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

constexpr QStringView conjunction = u" & ";

bool addressed_by_post(const LetterFamily& to)
{
    if (to.address != LetterAddress::mailing)
        return to.address == LetterAddress::postal;
    return has_address(to.family, people::SuburbType::postal);
}

QString name_of(const people::DisclosedFamily& family, const people::Person* person, Called called = Called::by_name)
{
    const auto name = person ? family.name(*person) : QString();
    if (called == Called::by_name || name.isEmpty())
        return name;
    return name.first(name.front().isHighSurrogate() && name.size() > 1 ? 2 : 1).toUpper();
}

QString title_of(const people::Person* person)
{
    return person ? person->Title : QString();
}

const QString& surname(const LetterFamily& to)
{
    return to.family.family().surname;
}

QString children_names(const LetterFamily& to)
{
    QStringList names;
    for (const auto* child : to.household.children)
        names += to.family.name(*child);
    names.removeAll(QString());
    return listed_with_and(std::move(names));
}

QString street(const LetterFamily& to)
{
    const auto& address = to.family.address();
    return addressed_by_post(to) ? address.post_street : address.res_street;
}

QString second_street_line(const LetterFamily& to)
{
    const auto& address = to.family.address();
    return addressed_by_post(to) ? address.post_street2 : address.res_street2;
}

QString suburb(const LetterFamily& to)
{
    const auto type = addressed_by_post(to) ? people::SuburbType::postal : people::SuburbType::residential;
    return has_address(to.family, type) ? mailing_suburb_line(to.family, type) : QString();
}

constexpr people::Extent nothing_more{};
constexpr people::Extent details{people::Part::details};
constexpr people::Extent address{people::Part::address};

using To = const LetterFamily&;

constexpr LetterField fields[]{
    {u"[Surname]", nullptr, [](To to) { return surname(to); }, nothing_more},
    {u"[Primary_Name]", u"[First_Adult_Name]", [](To to) { return name_of(to.family, to.household.primary); },
     nothing_more},
    {u"[Spouse_Name]", u"[Second_Adult_Name]", [](To to) { return name_of(to.family, to.household.spouse); },
     nothing_more},
    {u"[Primary_&_Spouse_Name]", u"[First_&_Second_Adult_Name]",
     [](To to) { return couple_names(to.family, to.household); }, nothing_more},
    {u"[Primary_&_Spouse_Name_&_Surname]", u"[First_&_Second_Adult_Name_&_Surname]",
     [](To to) {
         return joined(u" ", {couple_names(to.family, to.household), surname(to)});
     },
     nothing_more},
    {u"[Titles_&_Primary_&_Spouse_Name_&_Surname]", u"[Titles_&_First_&_Second_Adult_Name_&_Surname]",
     [](To to) {
         return joined(u" ", {titled_couple(to.family, to.household), surname(to)});
     },
     details},
    {u"[Titles_&_Primary_&_Spouse_initial_&_Surname]", u"[Titles_&_First_&_Second_Adult_initial_&_Surname]",
     [](To to) {
         return joined(u" ", {titled_couple(to.family, to.household, Called::by_initial), surname(to)});
     },
     details},
    {u"[Primary_Title]", u"[First_Adult_Title]", [](To to) { return title_of(to.household.primary); }, details},
    {u"[Spouse_Title]", u"[Second_Adult_Title]", [](To to) { return title_of(to.household.spouse); }, details},
    {u"[Children_Names]", nullptr, children_names, nothing_more},
    {u"[____Street_Address____]", nullptr, street, address},
    {u"[____Street_line_2_____]", nullptr, second_street_line, address},
    {u"[____Suburb_Address____]", nullptr, suburb, address},
    {u"[&_Family]", nullptr, [](To) { return u"& Family"_s; }, nothing_more},
    {u"[Computer_Date]", nullptr, [](To to) { return to.today.toString(u"dd/MM/yy"); }, nothing_more},
};

} // namespace

QString couple_names(const people::DisclosedFamily& family, const people::Household& household, Called called)
{
    return joined(conjunction, {name_of(family, household.primary, called), name_of(family, household.spouse, called)});
}

QString titled_couple(const people::DisclosedFamily& family, const people::Household& household, Called called)
{
    const auto first = title_of(household.primary), second = title_of(household.spouse);
    if (!first.isEmpty() && !second.isEmpty())
        return joined(u" ", {joined(conjunction, {first, second}), couple_names(family, household, called)});
    return joined(conjunction, {joined(u" ", {first, name_of(family, household.primary, called)}),
                                joined(u" ", {second, name_of(family, household.spouse, called)})});
}

QString listed_with_and(QStringList texts)
{
    const auto last = texts.isEmpty() ? QString() : texts.takeLast();
    return joined(conjunction, {texts.join(u", "_s), last});
}

LetterFamily LetterFamily::of(const people::DisclosedFamily& family, LetterAddress address, QDate today)
{
    return {family, people::living_household(family.people()), address, today};
}

std::span<const LetterField> letter_fields()
{
    return fields;
}

std::optional<FoundField> field_at_start(QStringView text)
{
    for (std::size_t place = 0; place < std::size(fields); ++place) {
        for (const auto* spelling : {fields[place].text, fields[place].older}) {
            if (spelling && text.startsWith(QStringView(spelling)))
                return FoundField{place, QStringView(spelling).size()};
        }
    }
    return std::nullopt;
}

} // namespace kindrel::output
