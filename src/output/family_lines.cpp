#include "output/family_lines.h"

#include "pages/text_metrics.h"

#include <array>

namespace kindrel::output {

using namespace Qt::StringLiterals;

namespace {

/// A caption, exactly, and where its value lies.
template <class Record>
struct Contact
{
    const char16_t* caption;
    QString Record::*value;
};

using FamilyContact = Contact<people::Address>;
using PersonContact = Contact<people::Person>;

constexpr std::array phone_and_fax{FamilyContact{u"Family Ph: ", &people::Address::phone},
                                   FamilyContact{u"  Family Fax: ", &people::Address::family_fax}};
constexpr std::array family_mobile{FamilyContact{u"Family Mobile: ", &people::Address::family_mobile}};
constexpr std::array family_email{FamilyContact{u"Family Email: ", &people::Address::family_email}};
constexpr std::array map_and_reference{FamilyContact{u"Map: ", &people::Address::res_map},
                                       FamilyContact{u" Ref: ", &people::Address::res_ref}};
constexpr std::array<std::span<const FamilyContact>, 4> family_lines{phone_and_fax, family_mobile, family_email,
                                                                     map_and_reference};

constexpr std::array other_names{PersonContact{u"Other Surname: ", &people::Person::other_surname},
                                 PersonContact{u"Middle Name: ", &people::Person::middle_name}};
constexpr std::array phones{PersonContact{u"Mobile: ", &people::Person::mobile_phone},
                            PersonContact{u"Business Phone: ", &people::Person::business_phone},
                            PersonContact{u"Business Fax: ", &people::Person::business_fax}};
constexpr std::array emails{PersonContact{u"Email: ", &people::Person::Personal_email},
                            PersonContact{u"Business Email: ", &people::Person::business_email}};
constexpr std::array<std::span<const PersonContact>, 3> personal_lines{other_names, phones, emails};

template <class Record>
std::vector<pages::CaptionValue> values_of(std::span<const Contact<Record>> contacts, const Record& record)
{
    std::vector<pages::CaptionValue> pairs;
    for (const auto& contact : contacts) {
        if (const auto& value = record.*contact.value; !value.isEmpty())
            pairs.push_back({QStringView(contact.caption).toString(), value});
    }
    return pairs;
}

void add_line(CaptionLines& lines, std::vector<pages::CaptionValue> line)
{
    if (!line.empty())
        lines.push_back(std::move(line));
}

/// Before a caption that follows a value on its line, as "  Family Fax: " has it by itself.
constexpr QStringView gap = u"  ";

/// Where an address of one kind lies.
struct AddressFields
{
    QString people::Address::*street, people::Address::*street2, people::Address::*state, people::Address::*country;
};
constexpr AddressFields residential{&people::Address::res_street, &people::Address::res_street2,
                                    &people::Address::res_state, &people::Address::res_country};
constexpr AddressFields postal{&people::Address::post_street, &people::Address::post_street2,
                               &people::Address::post_state, &people::Address::post_country};

const AddressFields& fields_of(people::SuburbType type)
{
    return type == people::SuburbType::postal ? postal : residential;
}

const people::Suburb* suburb_of(const people::DisclosedFamily& family, people::SuburbType type)
{
    return type == people::SuburbType::postal ? family.postal() : family.residential();
}

QStringList lines_of(const people::DisclosedFamily& family, people::SuburbType type, const QString& suburb)
{
    const auto& address = family.address();
    const auto& fields = fields_of(type);
    QStringList lines{address.*fields.street, address.*fields.street2, suburb, address.*fields.country};
    lines.removeAll(QString());
    return lines;
}

QStringList envelope_lines(const people::DisclosedFamily& family, people::SuburbType type)
{
    return has_address(family, type) ? lines_of(family, type, mailing_suburb_line(family, type)) : QStringList();
}

} // namespace

QString joined(QStringView separator, std::initializer_list<QString> parts)
{
    QString text;
    for (const auto& part : parts) {
        if (!text.isEmpty() && !part.isEmpty())
            text += separator;
        text += part;
    }
    return text;
}

QString names_of(const people::DisclosedFamily& family, std::span<const people::Person* const> people,
                 QStringView separator)
{
    QString text;
    for (const auto* person : people)
        text = joined(separator, {text, family.name(*person)});
    return text;
}

QString addressee_of(const ListedFamily& listed)
{
    const auto& household = listed.household;
    const auto& addressed = household.adults.empty() ? household.children : household.adults;
    return joined(u" ", {names_of(listed.family, addressed, u" & "), listed.family.family().surname});
}

bool has_address(const people::DisclosedFamily& family, people::SuburbType type)
{
    const auto& address = family.address();
    const auto& fields = fields_of(type);
    return suburb_of(family, type) || !(address.*fields.street).isEmpty() || !(address.*fields.street2).isEmpty();
}

QString residential_suburb_line(const people::DisclosedFamily& family)
{
    const auto& address = family.address();
    if (family.residential() || address.res_hidden)
        return mailing_suburb_line(family, people::SuburbType::residential);
    return joined(u" ", {u"Unknown Suburb"_s, address.res_state});
}

QString mailing_suburb_line(const people::DisclosedFamily& family, people::SuburbType type)
{
    const auto& state = family.address().*fields_of(type).state;
    const auto* suburb = suburb_of(family, type);
    return suburb ? joined(u" ", {suburb->suburb, state, suburb->shown_postcode()}) : state;
}

QStringList address_lines(const people::DisclosedFamily& family, people::SuburbType type)
{
    if (type == people::SuburbType::residential)
        return lines_of(family, type, residential_suburb_line(family));
    return envelope_lines(family, type);
}

QStringList mailing_lines(const people::DisclosedFamily& family)
{
    const bool by_post = has_address(family, people::SuburbType::postal);
    return envelope_lines(family, by_post ? people::SuburbType::postal : people::SuburbType::residential);
}

QString shown(const people::DisclosedFamily& family, const std::optional<core::Date>& date)
{
    return date ? family.shown(*date) : QString();
}

CaptionLines family_contacts(const people::DisclosedFamily& family)
{
    CaptionLines lines;
    for (const auto& line : family_lines)
        add_line(lines, values_of(line, family.address()));
    return lines;
}

CaptionLines personal_contacts(const people::DisclosedFamily& family, const people::Person& person)
{
    CaptionLines lines;
    std::vector<pages::CaptionValue> first;
    if (person.birthdate)
        first.push_back({u"Birth Date: "_s, family.shown(*person.birthdate)});
    if (person.school_year)
        first.push_back({u"School Year: "_s, people::school_year_text(person.school_year)});
    add_line(lines, std::move(first));
    for (const auto& line : personal_lines)
        add_line(lines, values_of(line, person));
    for (auto& line : lines) {
        for (auto& pair : std::span(line).subspan(1))
            pair.caption.prepend(gap);
    }
    return lines;
}

CaptionLines personal_contacts(const ListedMember& listed)
{
    auto person = listed.person;
    person.other_surname.clear();
    return personal_contacts(listed.family, person);
}

void write_line(pages::Writer& place, const QString& text, const pages::TextStyle& style)
{
    if (!text.isEmpty())
        place.line(text, style);
}

void write_lines(pages::Writer& place, const QStringList& lines, const pages::TextStyle& style)
{
    for (const auto& line : lines)
        write_line(place, line, style);
}

void write_contacts(pages::Writer& place, const CaptionLines& lines)
{
    for (const auto& line : lines) {
        qreal width = 0;
        for (const auto& pair : line) {
            width += place.metrics().width(pair.caption, place.type().caption);
            width += place.metrics().width(pair.value, place.type().body);
        }
        if (width <= place.width()) {
            place.captions(line);
            continue;
        }
        for (const auto& pair : line)
            place.captions({&pair, 1});
    }
}

} // namespace kindrel::output
