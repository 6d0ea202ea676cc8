#include "people/speed_find.h"

#include "core/entry.h"
#include "people/names.h"
#include "people/search_words.h"

#include <algorithm>
#include <array>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

constexpr auto families_text =
    u"SELECT f.[Surname_ID],f.[surname],f.[Condition],f.[booked_out],i.[suburb],a.[res_hidden],a.[phone],"
    "a.[phone_hidden],a.[family_mobile],a.[family_mobile_hidden] FROM [tbl_surname] f "
    "LEFT JOIN [tbl_address] a ON a.[surname_id]=f.[Surname_ID] "
    "LEFT JOIN [tbl_suburb] s ON s.[surname_id]=f.[Surname_ID] AND s.[Type]=1 "
    "LEFT JOIN [tbl_suburb_setup] i ON i.[suburb_id]=s.[suburb_id] "
    "ORDER BY f.[sort_key],f.[Primary_name],f.[Surname_ID];";

constexpr auto people_text =
    u"SELECT p.[Surname_ID],p.[Name],p.[preferred_name],p.[Preferred_Name_hidden],p.[Decease],p.[Privacy],"
    "p.[Prospect],p.[archive],p.[contact],d.[other_surname],d.[surname_hidden],d.[middle_name],d.[mobile_phone],"
    "d.[mobile_hidden] FROM [tbl_people] p LEFT JOIN [tbl_personal_details] d ON d.[person_id]=p.[person_id] "
    "ORDER BY p.[Surname_ID],p.[position],p.[person_id];";

/// A result's columns in the order of their names in the statement.
class Cells
{
public:
    explicit Cells(const core::Row& row) : m_row(row) {}
    [[nodiscard]] int number() { return m_row.integer(core::Column{m_next++}); }
    [[nodiscard]] bool flag() { return m_row.flag(core::Column{m_next++}); }
    [[nodiscard]] QString text() { return m_row.text(core::Column{m_next++}); }

private:
    const core::Row& m_row;
    int m_next = 0;
};

Person person_of(Cells& cells)
{
    Person person;
    person.Name = cells.text();
    person.preferred_name = cells.text();
    person.Preferred_Name_hidden = cells.flag();
    for (bool Person::*const flag :
         {&Person::Decease, &Person::Privacy, &Person::Prospect, &Person::archive, &Person::contact})
        person.*flag = cells.flag();
    person.other_surname = cells.text();
    person.surname_hidden = cells.flag();
    person.middle_name = cells.text();
    person.mobile_phone = cells.text();
    person.mobile_hidden = cells.flag();
    return person;
}

QString listed(const Person& person)
{
    QString text = person.Name;
    if (!person.preferred_name.isEmpty() && !person.Preferred_Name_hidden && person.preferred_name != person.Name)
        text += u" (%1)"_s.arg(person.preferred_name);
    if (!person.other_surname.isEmpty() && !person.surname_hidden)
        text += u' ' + person.other_surname;
    const QString flags = markers(person, Markers::shortened);
    return flags.isEmpty() ? text : text + u' ' + flags;
}

void take(std::vector<const SpeedFindLine*>& hits, const std::vector<SpeedFindLine>& from, const QBitArray& wanted,
          int most)
{
    for (qsizetype place = 0; place < wanted.size() && int(hits.size()) < most; ++place)
        if (wanted.testBit(place))
            hits.push_back(&from[std::size_t(place)]);
}

} // namespace

std::vector<int> SpeedFindHits::surname_ids() const
{
    std::vector<int> keys;
    std::ranges::transform(lines, std::back_inserter(keys), &SpeedFindLine::surname_id);
    return keys;
}

bool SpeedFind::renew()
{
    if (!core::permitted(m_office, core::Area::fast_find))
        return false;
    const qint64 mark = m_office.session->change_mark();
    if (m_change_mark != mark) {
        read();
        m_change_mark = mark;
    }
    return true;
}

void SpeedFind::read()
{
    m_lines.clear();
    m_searched.clear();
    m_numbers = {};
    read_families();
    read_people();
    index();
}

void SpeedFind::read_families()
{
    auto rows = m_office.session->select(QString::fromUtf16(families_text));
    for (const core::Row& row : rows) {
        Cells cells(row);
        auto& line = m_lines.emplace_back();
        auto& searched = m_searched.emplace_back();
        line.surname_id = cells.number();
        line.surname = cells.text();
        line.Condition = FileStatus(cells.number());
        line.booked_out = cells.flag();
        const QString suburb = cells.text();
        if (!cells.flag())
            line.suburb = suburb;
        const QString phone = cells.text();
        if (!cells.flag())
            line.phone = phone;
        const QString mobile = cells.text();
        searched.surname = search_words(line.surname);
        searched.others = line.suburb;
        m_numbers.add(int(m_lines.size()) - 1, line.phone);
        if (!cells.flag())
            m_numbers.add(int(m_lines.size()) - 1, mobile);
    }
}

void SpeedFind::read_people()
{
    QHash<int, std::size_t> place_of;
    place_of.reserve(qsizetype(m_lines.size()));
    for (std::size_t place = 0; place < m_lines.size(); ++place)
        place_of.insert(m_lines[place].surname_id, place);
    auto rows = m_office.session->select(QString::fromUtf16(people_text));
    for (const core::Row& row : rows) {
        Cells cells(row);
        const auto place = place_of.constFind(cells.number());
        if (place == place_of.constEnd())
            continue; // Stored between the two statements: the next renewal has it.
        const Person person = person_of(cells);
        QString& names = m_lines[*place].people;
        names += (names.isEmpty() ? u""_s : u", "_s) + listed(person);
        auto& searched = m_searched[*place];
        for (const QString& word : {person.Name, person.preferred_name, person.other_surname, person.middle_name})
            if (!word.isEmpty())
                searched.others += u' ' + word;
        if (!person.mobile_hidden)
            m_numbers.add(int(*place), person.mobile_phone);
    }
}

void SpeedFind::index()
{
    m_words = {};
    for (int place = 0; auto& searched : m_searched) {
        m_words.add(place++, searched.surname + search_words(searched.others));
        searched.others.clear();
    }
    m_words.finish(int(m_lines.size()));
    m_numbers.finish();
}

QBitArray SpeedFind::with(const QString& wanted) const
{
    QBitArray found = m_words.with(wanted);
    QStringView word = QStringView(wanted).trimmed();
    if (word.startsWith(u'+'))
        word = word.sliced(1);
    if (!word.isEmpty() && std::ranges::all_of(word, [](QChar c) { return c.isDigit(); }))
        m_numbers.mark(word, found);
    return found;
}

SpeedFindHits SpeedFind::find(const QString& typed, int most) const
{
    const QStringList wanted = wanted_words(typed);
    if (wanted.isEmpty())
        return {};
    QBitArray all(qsizetype(m_lines.size()), true);
    for (const QString& word : wanted)
        all &= with(word);
    QBitArray by_surname(all.size());
    for (qsizetype place = 0; place < all.size(); ++place)
        by_surname.setBit(place, all.testBit(place) && std::ranges::any_of(wanted, [&](const QString& word) {
                                     return m_searched[std::size_t(place)].surname.contains(word);
                                 }));
    SpeedFindHits hits{{}, int(all.count(true))};
    take(hits.lines, m_lines, by_surname, most);
    take(hits.lines, m_lines, all & ~by_surname, most);
    return hits;
}

} // namespace kindrel::people
