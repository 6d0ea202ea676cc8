#include "apps/ctl_family_card.h"

#include "people/field_labels.h"
#include "people/fields.h"
#include "people/link_tables.h"
#include "people/names.h"

#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>

#include <algorithm>
#include <array>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

/// A part of the card: a value, or parts that make up a record or a list. `text` is its line for a person to read;
/// without one, its parts are shown beneath its label.
struct Part
{
    enum class Kind { value, record, list };
    Kind kind = Kind::value;
    QString name, label, text;
    QJsonValue value;
    std::vector<Part> parts;
};

QJsonValue json_of(const Part& part)
{
    if (part.kind == Part::Kind::value)
        return part.value;
    QJsonObject object;
    QJsonArray array;
    for (const auto& inner : part.parts)
        part.kind == Part::Kind::list ? array.append(json_of(inner)) : void(object.insert(inner.name, json_of(inner)));
    return part.kind == Part::Kind::list ? QJsonValue(array) : QJsonValue(object);
}

bool is_blank(const Part& part)
{
    return part.text.isEmpty() && std::ranges::all_of(part.parts, is_blank);
}

void print_text(QTextStream& out, const Part& part, int depth)
{
    if (is_blank(part))
        return;
    const QString indent(2 * depth, u' ');
    out << indent << part.label;
    if (!part.text.isEmpty()) {
        out << (part.label.isEmpty() ? QString() : u": "_s) << QString(part.text).replace(u'\n', u'\n' + indent)
            << '\n';
        return;
    }
    out << '\n';
    for (const auto& inner : part.parts)
        print_text(out, inner, depth + 1);
}

/// Turns the records of one family into parts.
class CardMaker
{
public:
    CardMaker(const people::DisclosedFamily& family, const core::Office& office) : m_family(family), m_office(office) {}

    [[nodiscard]] Part make() const;

private:
    [[nodiscard]] Part value(const char* name, int number) const;
    [[nodiscard]] Part value(const char* name, std::optional<int> number) const;
    [[nodiscard]] Part value(const char* name, bool flag) const;
    [[nodiscard]] Part value(const char* name, const QString& text) const;
    [[nodiscard]] Part value(const char* name, const std::optional<core::Date>& date) const;

    template <class Record>
    void add(Part& to, const Record& record, std::span<const people::Field<Record>> fields) const;
    template <class Record>
    [[nodiscard]] Part record(const char* name, const Record& record,
                              std::span<const people::Field<Record>> fields) const;
    /// One line per row: its first filled value as the label, the others behind it.
    template <class Record>
    [[nodiscard]] Part rows(const char* name, const std::vector<Record>& records,
                            std::span<const people::Field<Record>> fields) const;
    [[nodiscard]] Part links(const char* name, const people::LinkTable& table,
                             const std::vector<people::LinkRow>& links) const;
    [[nodiscard]] Part link(const people::LinkTable& table, const people::LinkRow& row) const;
    [[nodiscard]] Part suburb(const char* name, const people::Suburb* suburb) const;
    [[nodiscard]] Part closed_sections() const;
    [[nodiscard]] Part person(const people::Person& person) const;
    [[nodiscard]] Part people() const;

    const people::DisclosedFamily& m_family;
    const core::Office& m_office;
};

Part named(Part::Kind kind, const char* name)
{
    return {kind, QString::fromLatin1(name), people::label_of(name), {}, {}, {}};
}

Part CardMaker::value(const char* name, int number) const
{
    auto part = named(Part::Kind::value, name);
    part.value = number;
    part.text = number ? QString::number(number) : QString();
    return part;
}

Part CardMaker::value(const char* name, std::optional<int> number) const
{
    if (number)
        return value(name, *number);
    auto part = named(Part::Kind::value, name);
    part.value = QJsonValue(QJsonValue::Null);
    return part;
}

Part CardMaker::value(const char* name, bool flag) const
{
    auto part = named(Part::Kind::value, name);
    part.value = flag;
    part.text = flag ? u"yes"_s : QString();
    return part;
}

Part CardMaker::value(const char* name, const QString& text) const
{
    auto part = named(Part::Kind::value, name);
    part.value = text;
    part.text = text;
    return part;
}

Part CardMaker::value(const char* name, const std::optional<core::Date>& date) const
{
    auto part = named(Part::Kind::value, name);
    part.value = date ? QJsonValue(date->stored()) : QJsonValue(QJsonValue::Null);
    part.text = date ? m_family.shown(*date) : QString();
    return part;
}

template <class Record>
void CardMaker::add(Part& to, const Record& record, std::span<const people::Field<Record>> fields) const
{
    for (const auto& field : fields)
        std::visit([&](auto member) { to.parts.push_back(value(field.name, record.*member)); }, field.member);
}

template <class Record>
Part CardMaker::record(const char* name, const Record& record, std::span<const people::Field<Record>> fields) const
{
    auto part = named(Part::Kind::record, name);
    add(part, record, fields);
    return part;
}

/// The values of a row in one line.
QString in_one_line(const Part& row)
{
    QStringList texts;
    for (const auto& part : row.parts)
        texts += part.text;
    texts.removeAll(QString());
    return texts.join(u", "_s);
}

template <class Record>
Part CardMaker::rows(const char* name, const std::vector<Record>& records,
                     std::span<const people::Field<Record>> fields) const
{
    auto part = named(Part::Kind::list, name);
    for (const auto& row : records) {
        auto line = record("", row, fields);
        line.text = in_one_line(line);
        part.parts.push_back(std::move(line));
    }
    return part;
}

Part CardMaker::link(const people::LinkTable& table, const people::LinkRow& row) const
{
    auto part = named(Part::Kind::record, "");
    part.parts = {value(table.item, row.item), value(table.text, row.text)};
    auto text = row.text;
    if (table.type) {
        const bool potential = row.type == static_cast<int>(people::MinistryState::potential);
        part.parts.push_back(value(table.type, row.type));
        text.prepend(potential ? u"(Potential) "_s : u"(Active) "_s);
    }
    if (table.date) {
        part.parts.push_back(value(table.date, row.date));
        text += u", "_s + part.parts.back().text;
    }
    if (table.field) {
        part.parts.push_back(value(table.field, row.field));
        text += u", "_s + row.field;
    }
    if (table.tagged) {
        part.parts.push_back(value(table.tagged, row.tagged));
        text += row.tagged ? u" (tagged)"_s : QString();
    }
    part.text = text;
    return part;
}

Part CardMaker::links(const char* name, const people::LinkTable& table, const std::vector<people::LinkRow>& links) const
{
    auto part = named(Part::Kind::list, name);
    for (const auto& row : links)
        part.parts.push_back(link(table, row));
    return part;
}

Part CardMaker::suburb(const char* name, const people::Suburb* suburb) const
{
    auto part = named(Part::Kind::record, name);
    if (suburb)
        part.parts = {value("suburb", suburb->suburb), value("postcode", suburb->shown_postcode())};
    part.text = in_one_line(part);
    return part;
}

Part CardMaker::closed_sections() const
{
    auto part = named(Part::Kind::list, "closed_sections");
    const people::RecordAccess& access = m_family.file().access;
    for (const auto& field : people::access_fields()) {
        const auto* flag = std::get_if<bool people::RecordAccess::*>(&field.member);
        if (flag && !(access.**flag))
            part.parts.push_back(value("", QString::fromLatin1(field.name)));
    }
    return part;
}

Part CardMaker::person(const people::Person& person) const
{
    auto part = named(Part::Kind::record, "person");
    part.label = m_family.name(person) + people::markers(person, people::Markers::full);
    part.parts.push_back(value("person_id", person.person_id));
    add(part, person, people::people_fields());
    add(part, person, people::detail_fields());
    part.parts.push_back(value("personal_pin", person.personal_pin));
    for (const auto& [table, list] : people::person_links())
        part.parts.push_back(links(table.table, table, person.*list));
    return part;
}

Part CardMaker::people() const
{
    auto part = named(Part::Kind::list, "people");
    for (const auto& one : m_family.people())
        part.parts.push_back(person(one));
    return part;
}

Part CardMaker::make() const
{
    const auto& file = m_family.file();
    auto card = named(Part::Kind::record, "family");
    card.parts = {value("surname_id", file.family.Surname_ID),
                  value("condition", file_status_word(file.family.Condition))};
    add(card, file.family, people::family_fields());
    add(card, file.family, people::booking_fields());
    card.parts.push_back(record("address", file.address, people::address_fields()));
    card.parts.push_back(suburb("residential_suburb", m_family.residential()));
    card.parts.push_back(suburb("postal_suburb", m_family.postal()));
    card.parts.push_back(rows("other_contacts", file.other_contacts, people::other_contact_fields()));
    card.parts.push_back(rows("events", file.events, people::event_fields()));
    if (m_office.may(core::Area::visitation_tab))
        card.parts.push_back(rows("visits", file.visits, people::visit_fields()));
    for (const auto& [table, list] : people::family_links())
        card.parts.push_back(links(table.table, table, file.*list));
    card.parts.push_back(closed_sections());
    card.parts.push_back(people());
    return card;
}

} // namespace

QString file_status_word(people::FileStatus status)
{
    constexpr std::array words{"active", "privacy", "prospect", "archive"};
    const auto place = static_cast<std::size_t>(status);
    return place < words.size() ? QString::fromLatin1(words[place]) : QString();
}

void print_family(QTextStream& out, const people::DisclosedFamily& family, const core::Office& office, bool json)
{
    const auto card = CardMaker(family, office).make();
    if (json)
        out << QJsonDocument(json_of(card).toObject()).toJson();
    else
        print_text(out, card, 0);
}

} // namespace kindrel::apps
