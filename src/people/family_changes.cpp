#include "people/family_changes.h"

#include "people/field_labels.h"
#include "people/fields.h"
#include "people/link_tables.h"

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

void make_comparable(std::vector<LinkRow>& rows, const LinkTable& table)
{
    for (auto& row : rows)
        row.text.clear();
    if (!table.position)
        std::ranges::sort(rows, {}, &LinkRow::item);
}

void make_comparable(std::optional<Suburb>& suburb)
{
    if (!suburb)
        return;
    suburb->suburb.clear();
    suburb->postcode.clear();
    if (suburb->suburb_id == 0 && suburb->postcode_var.isEmpty())
        suburb.reset();
}

/// Without what a save leaves alone or makes anew, and what follows the setup lists.
FamilyFile comparable(FamilyFile file)
{
    Family family;
    family.surname = file.family.surname;
    family.Condition = file.family.Condition;
    file.family = std::move(family);
    file.visits.clear();
    make_comparable(file.residential);
    make_comparable(file.postal);
    for (const auto& [table, rows] : family_links())
        make_comparable(file.*rows, table);
    for (auto& person : file.people) {
        person.position = 0;
        for (const auto& [table, rows] : person_links())
            make_comparable(person.*rows, table);
    }
    return file;
}

QString in_words(const QString& text)
{
    return text.isEmpty() ? u"(empty)"_s : text;
}
QString in_words(bool flag)
{
    return flag ? u"Yes"_s : u"No"_s;
}
QString in_words(int number)
{
    return QString::number(number);
}
QString in_words(const core::Date& date)
{
    return date.shown();
}
template <class Inner>
QString in_words(const std::optional<Inner>& maybe)
{
    return maybe ? in_words(*maybe) : in_words(QString());
}

/// Collects the lines of one record.
class Lines
{
public:
    explicit Lines(QStringList& lines, const QString& whose = {}) : m_lines(lines), m_whose(whose) {}

    template <class Record>
    void compare(const Record& before, const Record& after, std::span<const Field<Record>> fields)
    {
        for (const auto& field : fields) {
            std::visit(
                [&](auto member) {
                    if (before.*member != after.*member)
                        say(field.name, in_words(after.*member));
                },
                field.member);
        }
    }
    template <class Part>
    void compare(const char* name, const Part& before, const Part& after)
    {
        if (before != after)
            m_lines += m_whose + label_of(name);
    }

private:
    void say(const char* name, const QString& value) { m_lines += u"%1%2: %3"_s.arg(m_whose, label_of(name), value); }

    QStringList& m_lines;
    QString m_whose;
};

const Person* find_person(const FamilyFile& file, int person_id)
{
    const auto found = std::ranges::find(file.people, person_id, &Person::person_id);
    return person_id == 0 || found == file.people.end() ? nullptr : &*found;
}

/// Without the place in the family, which the order of the people stands for.
std::vector<Field<Person>> own_fields()
{
    std::vector<Field<Person>> fields;
    for (const auto& table : {people_fields(), detail_fields()})
        std::ranges::copy_if(table, std::back_inserter(fields),
                             [](const auto& field) { return QByteArrayView(field.name) != "position"; });
    fields.push_back({"personal_pin", &Person::personal_pin});
    return fields;
}

void compare_people(QStringList& lines, const FamilyFile& before, const FamilyFile& after)
{
    for (const auto& person : after.people) {
        const Person* was = find_person(before, person.person_id);
        if (!was) {
            lines += u"%1 was added"_s.arg(person.Name);
            continue;
        }
        Lines own(lines, person.Name + u", "_s);
        own.compare<Person>(*was, person, own_fields());
        for (const auto& [table, rows] : person_links())
            own.compare(table.table, was->*rows, person.*rows);
    }
    std::vector<int> stayed;
    for (const auto& person : before.people) {
        if (find_person(after, person.person_id))
            stayed.push_back(person.person_id);
        else
            lines += u"%1 was taken out"_s.arg(person.Name);
    }
    std::vector<int> now;
    for (const auto& person : after.people) {
        if (find_person(before, person.person_id))
            now.push_back(person.person_id);
    }
    if (stayed != now)
        lines += u"The order of the people"_s;
}

template <class Value>
void merge(Value& mine, const Value& base, const Value& theirs)
{
    if (mine == base)
        mine = theirs;
}

template <class Record>
void merge(Record& mine, const Record& base, const Record& theirs, std::span<const Field<Record>> fields)
{
    for (const auto& field : fields)
        std::visit([&](auto member) { merge(mine.*member, base.*member, theirs.*member); }, field.member);
}

void merge_person(Person& mine, const Person& base, const Person& theirs)
{
    merge<Person>(mine, base, theirs, own_fields());
    for (const auto& [table, rows] : person_links())
        merge(mine.*rows, base.*rows, theirs.*rows);
}

/// People whom others took out go unless something of theirs was changed here; then they are new people, for their keys
/// may stand in another family by now.
void merge_people(FamilyFile& mine, const FamilyFile& base, const FamilyFile& theirs)
{
    std::vector<Person> people;
    for (auto person : mine.people) {
        const Person* was = find_person(base, person.person_id);
        const Person* is = find_person(theirs, person.person_id);
        if (was && is)
            merge_person(person, *was, *is);
        else if (was && !is && person == *was)
            continue;
        else if (was && !is)
            person.person_id = 0;
        people.push_back(std::move(person));
    }
    for (const auto& person : theirs.people) {
        if (!find_person(base, person.person_id))
            people.push_back(person);
    }
    mine.people = std::move(people);
}

} // namespace

QStringList changes_between(const FamilyFile& first, const FamilyFile& second)
{
    const auto before = comparable(first);
    const auto after = comparable(second);
    QStringList lines;
    Lines family(lines);
    if (before == after)
        return lines;
    family.compare<Family>(before.family, after.family, family_fields());
    family.compare("condition", before.family.Condition, after.family.Condition);
    family.compare<Address>(before.address, after.address, address_fields());
    family.compare("residential_suburb", before.residential, after.residential);
    family.compare("postal_suburb", before.postal, after.postal);
    family.compare("other_contacts", before.other_contacts, after.other_contacts);
    family.compare("events", before.events, after.events);
    family.compare("closed_sections", before.access, after.access);
    for (const auto& [table, rows] : family_links())
        family.compare(table.table, before.*rows, after.*rows);
    compare_people(lines, before, after);
    return lines;
}

FamilyFile merged(const FamilyFile& base, const FamilyFile& mine, const FamilyFile& theirs)
{
    FamilyFile both = mine;
    both.family = theirs.family;
    both.family.surname = mine.family.surname;
    both.family.Condition = mine.family.Condition;
    merge(both.family.surname, base.family.surname, theirs.family.surname);
    merge(both.family.Condition, base.family.Condition, theirs.family.Condition);
    merge<Address>(both.address, base.address, theirs.address, address_fields());
    merge(both.residential, base.residential, theirs.residential);
    merge(both.postal, base.postal, theirs.postal);
    merge(both.other_contacts, base.other_contacts, theirs.other_contacts);
    merge(both.events, base.events, theirs.events);
    merge(both.access, base.access, theirs.access);
    for (const auto& [table, rows] : family_links())
        merge(both.*rows, base.*rows, theirs.*rows);
    both.visits = theirs.visits;
    merge_people(both, base, theirs);
    return both;
}

} // namespace kindrel::people
