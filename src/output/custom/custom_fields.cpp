#include "output/custom/custom_fields.h"

#include "output/custom/custom_values.h"
#include "output/letters/letter_fields.h"

#include <QHash>

#include <algorithm>

namespace kindrel::output {

using namespace Qt::StringLiterals;
using people::Address;
using people::Family;
using people::FamilyFile;
using people::Part;
using people::Person;
using people::SetupKind;

namespace {

constexpr CustomField of_run(const char* name, const char* words, CustomField::Reader read,
                             FieldScope scope = FieldScope::run)
{
    return {name, words, scope, {}, read};
}

constexpr CustomField of_family(const char* name, const char* words, CustomField::Reader read,
                                people::Extent extent = {})
{
    return {name, words, FieldScope::family, extent, read};
}

constexpr CustomField of_address(const char* name, const char* words, CustomField::Reader read)
{
    return of_family(name, words, read, Part::address);
}

constexpr CustomField of_person(const char* name, const char* words, CustomField::Reader read,
                                people::Extent extent = {})
{
    return {name, words, FieldScope::person, extent, read};
}

constexpr CustomField of_details(const char* name, const char* words, CustomField::Reader read)
{
    return of_person(name, words, read, Part::details);
}

constexpr CustomField listed(CustomField field, std::optional<SetupKind> list = {})
{
    field.items = true;
    field.list = list;
    return field;
}

constexpr CustomField with_and(CustomField field)
{
    field.with_and = true;
    return field;
}

constexpr CustomField of_receipt(const char* name, const char* words, CustomField::Reader read)
{
    return {name, words, FieldScope::receipt, {}, read};
}

const std::array fields{
    of_run("today", "Today's date", &RunFacts::shown_today),
    of_run("church_name", "The name of the church", &RunFacts::church_name),
    of_run("report_title", "The title of the report", &RunFacts::title),
    of_run("filters", "The filters in use", &RunFacts::filters),
    of_run("group", "The heading of the group", &RunFacts::group, FieldScope::group),
    of_run("number", "Counts the families or people of a group, or of the report", &RunFacts::number,
           FieldScope::family),
    of_run("family_count", "How many families the group or the report has", &RunFacts::family_count,
           FieldScope::totals),
    of_run("person_count", "How many people the group or the report has", &RunFacts::person_count, FieldScope::totals),
    of_run("page", "The number of the page", &RunFacts::page, FieldScope::page),
    of_run("pages", "The number of pages", custom::pages, FieldScope::page),

    of_family("surname", "Surname", &Family::surname),
    of_family("letter", "The letter under which the surname is filed", custom::letter),
    of_family("Primary_Name", "First name of the primary person", custom::primary_name),
    of_family("Spouse_Name", "First name of the spouse", custom::spouse_name),
    of_family("Primary_&_Spouse_Name", "Both first names: \"Ann & Ben\"", custom::both_names),
    of_family("Primary_&_Spouse_Name_&_Surname", "\"Ann & Ben Naismith\"", custom::both_names_and_surname),
    of_family("Titles_&_Primary_&_Spouse_Name_&_Surname", "\"Mrs & Mr Ann & Ben Naismith\"", custom::titled_names,
              Part::details),
    of_family("Titles_&_Primary_&_Spouse_initial_&_Surname", "\"Mrs & Mr A & B Naismith\"", custom::titled_initials,
              Part::details),
    of_family("Primary_Title", "Title of the primary person", custom::primary_title, Part::details),
    of_family("Spouse_Title", "Title of the spouse", custom::spouse_title, Part::details),
    with_and(of_family("Children_Names", "First names of the children", custom::children)),
    of_family("adults", "First names of all adults", custom::adults),
    of_family("names", "First names of everybody", custom::everybody),
    of_family("&_Family", "\"& Family\" where there are children", custom::and_family),
    of_family("people_in_family", "How many people the family has", custom::people_in_family),
    of_family("condition", "File status: Active, Privacy, Prospect or Archive", custom::condition),
    of_family("created", "Day on which the file was created", &Family::created),
    of_family("last_edit", "Day of the last edit", &Family::last_edit),
    of_family("booked_out_person", "To whom the file is booked out", &Family::booked_out_person),
    of_family("booked_out_date", "Day on which the file was booked out", &Family::booked_out_date),

    of_address("address", "Residential address, a value for each line", custom::residential_lines),
    of_address("res_street", "Residential street", &Address::res_street),
    of_address("res_street2", "Residential street, second line", &Address::res_street2),
    of_address("suburb", "Residential suburb", custom::suburb),
    of_address("postcode", "Residential postcode", custom::postcode),
    of_address("res_state", "Residential state", &Address::res_state),
    of_address("res_country", "Residential country", &Address::res_country),
    of_address("Suburb_Address", "Residential suburb, state and postcode", custom::suburb_address),
    of_address("res_map", "Map", &Address::res_map),
    of_address("res_ref", "Map reference", &Address::res_ref),
    of_address("postal_address", "Postal address, a value for each line", custom::postal_lines),
    of_address("post_street", "Postal street", &Address::post_street),
    of_address("post_street2", "Postal street, second line", &Address::post_street2),
    of_address("postal_suburb", "Postal suburb", custom::postal_suburb),
    of_address("postal_postcode", "Postal postcode", custom::postal_postcode),
    of_address("post_state", "Postal state", &Address::post_state),
    of_address("post_country", "Postal country", &Address::post_country),
    of_address("mailing_address", "The address that post goes to, a value for each line", custom::mailing),
    of_address("phone", "Family phone", &Address::phone),
    of_address("family_fax", "Family fax", &Address::family_fax),
    of_address("family_mobile", "Family mobile phone", &Address::family_mobile),
    of_address("family_email", "Family e-mail", &Address::family_email),
    of_address("family_email_description", "Whom the family e-mail belongs to", &Address::family_email_description),
    of_address("audio_note", "Name of the family's sound file", &Address::audio_note),
    listed(of_family("other_contacts", "Other contacts", custom::other_contacts, Part::other_contacts)),
    listed(of_family("events", "Events with their days", custom::events, Part::events)),
    of_family("visits", "Visits; only for users who may see the visitation tab", custom::visits, Part::visits),
    listed(of_family("family_groups", "Family groups", &FamilyFile::family_groups, Part::family_groups),
           SetupKind::family_groups),
    listed(of_family("family_dates", "Family dates", &FamilyFile::family_dates, Part::family_dates),
           SetupKind::family_dates),

    of_person("Name", "The name under which the person is listed", custom::name),
    of_person("full_name", "Title, name and surname", custom::full_name, Part::details),
    of_person("person_id", "The person's number in the register", &Person::person_id),
    of_person("role", "Primary, Spouse, Adult or Child", custom::role),
    of_person("position", "Place in the family", &Person::position),
    of_person("preferred_name", "Preferred name", &Person::preferred_name),
    of_person("Active", "\"Yes\" for an active person", &Person::Active),
    of_person("Decease", "\"Yes\" for a deceased person", &Person::Decease),
    of_person("Privacy", "\"Yes\" for a privacy request", &Person::Privacy),
    of_person("Prospect", "\"Yes\" for a prospect", &Person::Prospect),
    of_person("archive", "\"Yes\" for an archived person", &Person::archive),
    of_person("contact", "\"Yes\" for a contact", &Person::contact),
    of_details("Title", "Title", &Person::Title),
    of_details("birthdate", "Birth date", &Person::birthdate),
    of_details("age", "Age in years", custom::age),
    of_details("school_year", "School year", custom::school_year),
    of_details("middle_name", "Middle name", &Person::middle_name),
    of_details("other_surname", "Other surname", &Person::other_surname),
    of_details("mobile_phone", "Mobile phone", &Person::mobile_phone),
    of_details("Personal_email", "E-mail", &Person::Personal_email),
    of_details("business_phone", "Business phone", &Person::business_phone),
    of_details("business_fax", "Business fax", &Person::business_fax),
    of_details("business_email", "Business e-mail", &Person::business_email),
    of_person("personal_pin", "P.I.N.; only for users with a financial right", &Person::personal_pin, Part::pins),
    listed(of_person("status", "Statuses", &Person::status, Part::status), SetupKind::status),
    listed(of_person("groups", "Groups", &Person::groups, Part::groups), SetupKind::groups),
    listed(of_person("ministries", "Ministries, active and potential", custom::ministries, Part::ministries),
           SetupKind::ministries),
    listed(of_person("active_ministries", "Active ministries", custom::active_ministries, Part::ministries),
           SetupKind::ministries),
    listed(of_person("potential_ministries", "Potential ministries", custom::potential_ministries, Part::ministries),
           SetupKind::ministries),
    listed(of_person("flexi", "Flexi fields", &Person::flexi, Part::flexi), SetupKind::flexi_fields),
    listed(of_person("dates", "Personal dates", &Person::dates, Part::dates), SetupKind::personal_dates),
    listed(of_person("occupations", "Occupations", &Person::occupations, Part::occupations), SetupKind::occupations),

    of_receipt("project", "The project given to", &ReceiptFacts::project),
    of_receipt("from", "First day of the period", &ReceiptFacts::from),
    of_receipt("to", "Last day of the period", &ReceiptFacts::to),
    of_receipt("total", "The total given", &ReceiptFacts::total),
    of_receipt("gifts", "How many gifts", &ReceiptFacts::gifts),
    of_receipt("gift_list", "Each gift with its day", &ReceiptFacts::gift_list),
};

/// Further names of a field: those of the letters' merge fields, old and new.
struct OtherName
{
    QStringView name;
    QStringView field;
};

constexpr std::array other_names{
    OtherName{u"First_Adult_Name", u"Primary_Name"},
    OtherName{u"Second_Adult_Name", u"Spouse_Name"},
    OtherName{u"First_&_Second_Adult_Name", u"Primary_&_Spouse_Name"},
    OtherName{u"First_&_Second_Adult_Name_&_Surname", u"Primary_&_Spouse_Name_&_Surname"},
    OtherName{u"Titles_&_First_&_Second_Adult_Name_&_Surname", u"Titles_&_Primary_&_Spouse_Name_&_Surname"},
    OtherName{u"Titles_&_First_&_Second_Adult_initial_&_Surname", u"Titles_&_Primary_&_Spouse_initial_&_Surname"},
    OtherName{u"First_Adult_Title", u"Primary_Title"},
    OtherName{u"Second_Adult_Title", u"Spouse_Title"},
    OtherName{u"Street_Address", u"res_street"},
    OtherName{u"Street_line_2", u"res_street2"},
    OtherName{u"Computer_Date", u"today"},
};

/// Letters pad the names of address fields with underscores.
QStringView without_padding(QStringView name)
{
    while (name.startsWith(u'_'))
        name = name.sliced(1);
    while (name.endsWith(u'_'))
        name.chop(1);
    return name;
}

QHash<QString, const CustomField*> fields_by_name()
{
    QHash<QString, const CustomField*> known;
    for (const auto& field : fields)
        known.insert(without_padding(QString::fromLatin1(field.name)).toString().toLower(), &field);
    for (const auto& other : other_names)
        known.insert(other.name.toString().toLower(), known.value(other.field.toString().toLower()));
    return known;
}

template <class Home>
const Home& home_of(const FieldSource& source)
{
    if constexpr (std::is_same_v<Home, RunFacts>)
        return source.run;
    else if constexpr (std::is_same_v<Home, ReceiptFacts>)
        return *source.receipt;
    else if constexpr (std::is_same_v<Home, Family>)
        return source.family->family();
    else if constexpr (std::is_same_v<Home, Address>)
        return source.family->address();
    else if constexpr (std::is_same_v<Home, FamilyFile>)
        return source.family->file();
    else
        return *source.person;
}

/// Reads what is stored where the field lies.
struct FieldReading
{
    const FieldSource& source;

    template <class Home, class Value>
    FieldValues operator()(Value Home::*field) const
    {
        return shown_as(home_of<Home>(source).*field);
    }
    FieldValues operator()(FieldValues (*function)(const FieldSource&)) const { return function(source); }

private:
    static FieldValues shown_as(const QString& text) { return custom::single(text); }
    static FieldValues shown_as(const QStringList& texts) { return custom::listed(texts); }
    static FieldValues shown_as(bool flag) { return custom::single(flag ? u"Yes"_s : QString()); }
    static FieldValues shown_as(int number) { return custom::single(number); }
    FieldValues shown_as(const std::optional<core::Date>& date) const { return custom::single(source, date); }
    FieldValues shown_as(const std::vector<people::LinkRow>& rows) const
    {
        return custom::values_of_rows(*source.family, rows);
    }
};

/// Whether all that the field is read from is there.
bool has_source(const CustomField& field, const FieldSource& source)
{
    switch (field.scope) {
    case FieldScope::person:
        return source.person && source.family;
    case FieldScope::family:
        return source.family && source.household;
    case FieldScope::receipt:
        return source.receipt;
    case FieldScope::run:
    case FieldScope::group:
    case FieldScope::totals:
    case FieldScope::page:
        break;
    }
    return true;
}

} // namespace

std::span<const CustomField> custom_fields()
{
    return fields;
}

const CustomField* find_custom_field(const QString& name)
{
    static const auto known = fields_by_name();
    return known.value(without_padding(name).toString().toLower());
}

QStringList custom_field_names()
{
    QStringList names;
    for (const auto& field : fields)
        names += QString::fromLatin1(field.name);
    return names;
}

FieldValues values_of(const CustomField& field, const QString& item, const FieldSource& source)
{
    if (!has_source(field, source))
        return {};
    auto values = std::visit(FieldReading{source}, field.read);
    if (!item.isEmpty()) {
        const auto wanted = people::sameness(item);
        std::erase_if(values, [&](const auto& value) { return people::sameness(value.item) != wanted; });
        for (auto& value : values)
            value.text = value.bare;
    }
    std::erase_if(values, [](const auto& value) { return value.text.isEmpty(); });
    return values;
}

QString text_of(const LayoutField& field, const FieldSource& source)
{
    const auto* known = find_custom_field(field.name);
    if (!known)
        return {};
    QStringList texts;
    for (const auto& value : values_of(*known, field.item, source))
        texts += value.text;
    if (field.joint)
        return texts.join(*field.joint);
    return known->with_and ? listed_with_and(texts) : texts.join(u", "_s);
}

} // namespace kindrel::output
