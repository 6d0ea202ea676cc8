#include "people/family_json.h"

#include "people/fields.h"

#include <QJsonArray>

namespace kindrel::people {

namespace {

// Each record is described once, for the Writer and the Reader alike.

template <class Side, class Record>
void describe_fields(Side& side, Record& record, std::span<const Field<Record>> fields)
{
    for (const auto& field : fields)
        std::visit([&](auto member) { side.member(field.name, record.*member); }, field.member);
}

template <class Side>
void describe(Side& side, Family& family)
{
    side.member("Surname_ID", family.Surname_ID);
    side.member("Condition", family.Condition);
    describe_fields(side, family, family_fields());
    describe_fields(side, family, booking_fields());
}

template <class Side>
void describe(Side& side, Suburb& suburb)
{
    side.member("suburb_id", suburb.suburb_id);
    side.member("Type", suburb.Type);
    side.member("postcode_var", suburb.postcode_var);
    side.member("suburb", suburb.suburb);
    side.member("postcode", suburb.postcode);
}

template <class Side>
void describe(Side& side, LinkRow& row)
{
    side.member("item", row.item);
    side.member("text", row.text);
    side.member("type", row.type);
    side.member("date", row.date);
    side.member("field", row.field);
    side.member("tagged", row.tagged);
}

template <class Side>
void describe(Side& side, Person& person)
{
    side.member("person_id", person.person_id);
    side.member("Surname_ID", person.Surname_ID);
    side.member("personal_pin", person.personal_pin);
    describe_fields(side, person, people_fields());
    describe_fields(side, person, detail_fields());
    side.member("status", person.status);
    side.member("groups", person.groups);
    side.member("ministries", person.ministries);
    side.member("flexi", person.flexi);
    side.member("dates", person.dates);
    side.member("occupations", person.occupations);
}

template <class Side>
void describe(Side& side, Address& address)
{
    describe_fields(side, address, address_fields());
}

template <class Side>
void describe(Side& side, OtherContact& contact)
{
    describe_fields(side, contact, other_contact_fields());
}

template <class Side>
void describe(Side& side, Event& event)
{
    describe_fields(side, event, event_fields());
}

template <class Side>
void describe(Side& side, Visit& visit)
{
    describe_fields(side, visit, visit_fields());
}

template <class Side>
void describe(Side& side, RecordAccess& access)
{
    describe_fields(side, access, access_fields());
}

template <class Side>
void describe(Side& side, FamilyFile& file)
{
    side.member("family", file.family);
    side.member("address", file.address);
    side.member("residential", file.residential);
    side.member("postal", file.postal);
    side.member("other_contacts", file.other_contacts);
    side.member("events", file.events);
    side.member("visits", file.visits);
    side.member("family_groups", file.family_groups);
    side.member("family_dates", file.family_dates);
    side.member("access", file.access);
    side.member("people", file.people);
}

template <class Value>
concept Code = std::is_enum_v<Value>;

/// Collects a record's members. Changes none of them: they are taken as the descriptions hand them out.
class Writer
{
public:
    template <class Value>
    void member(const char* name, Value& value)
    {
        m_object.insert(QString::fromLatin1(name), json(value));
    }
    template <class Record>
    [[nodiscard]] static QJsonObject json(Record& record)
    {
        Writer writer;
        describe(writer, record);
        return writer.m_object;
    }

private:
    static QJsonValue json(int& number) { return number; }
    static QJsonValue json(bool& flag) { return flag; }
    static QJsonValue json(QString& text) { return text; }
    static QJsonValue json(core::Date& date) { return date.valid() ? QJsonValue(date.stored()) : QJsonValue(); }
    static QJsonValue json(Code auto& code) { return static_cast<int>(code); }
    template <class Inner>
    static QJsonValue json(std::optional<Inner>& maybe)
    {
        return maybe ? QJsonValue(json(*maybe)) : QJsonValue();
    }
    template <class Record>
    static QJsonValue json(std::vector<Record>& list)
    {
        QJsonArray array;
        for (auto& record : list)
            array.append(json(record));
        return array;
    }

    QJsonObject m_object;
};

/// Fills a record; false once a member is missing or of another kind.
class Reader
{
public:
    template <class Value>
    void member(const char* name, Value& value)
    {
        m_good = m_good && read(m_object.value(QLatin1StringView(name)), value);
    }
    template <class Record>
    [[nodiscard]] static bool read(const QJsonValue& json, Record& record)
    {
        Reader reader(json.toObject());
        describe(reader, record);
        return reader.m_good;
    }

private:
    explicit Reader(QJsonObject object) : m_object(std::move(object)) {}

    static bool read(const QJsonValue& json, int& number)
    {
        number = json.toInt();
        return json.isDouble();
    }
    static bool read(const QJsonValue& json, bool& flag)
    {
        flag = json.toBool();
        return json.isBool();
    }
    static bool read(const QJsonValue& json, QString& text)
    {
        text = json.toString();
        return json.isString();
    }
    static bool read(const QJsonValue& json, core::Date& date)
    {
        const auto found = core::Date::from_stored(json.toString());
        date = found.value_or(core::Date{});
        return found.has_value();
    }
    static bool read(const QJsonValue& json, Code auto& code)
    {
        code = static_cast<std::remove_reference_t<decltype(code)>>(json.toInt());
        return json.isDouble();
    }
    template <class Inner>
    static bool read(const QJsonValue& json, std::optional<Inner>& maybe)
    {
        return json.isNull() || read(json, maybe.emplace());
    }
    template <class Record>
    static bool read(const QJsonValue& json, std::vector<Record>& list)
    {
        for (const auto& element : json.toArray()) {
            if (!read(element, list.emplace_back()))
                return false;
        }
        return json.isArray();
    }

    QJsonObject m_object;
    bool m_good = true;
};

} // namespace

QJsonObject to_json(const FamilyFile& file)
{
    // The descriptions serve the Reader too and so take what may be changed.
    auto copy = file;
    return Writer::json(copy);
}

std::optional<FamilyFile> family_from_json(const QJsonObject& object)
{
    FamilyFile file;
    return Reader::read(object, file) ? std::optional(std::move(file)) : std::nullopt;
}

} // namespace kindrel::people
