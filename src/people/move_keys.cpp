#include "people/move_keys.h"

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Entity;
using core::Session;
using core::to_value;

/// A note's name is this, the church and the family; the sign behind the last colon in the order of bytes ends a range.
const QString note_of_church = u"arriving_family:%1:"_s;
const QString end_of_church = u"arriving_family:%1;"_s;

const QString note_of_destination = u"departing_family:%1"_s;

QString name_of(const Passage& passage)
{
    return note_of_church.arg(passage.from_church) + QString::number(passage.from);
}

/// "57 101=2001 102=2002".
QString content_of(const Passage& passage)
{
    QStringList parts{QString::number(passage.to)};
    for (auto person = passage.people.begin(); person != passage.people.end(); ++person)
        parts += u"%1=%2"_s.arg(person.key()).arg(person.value());
    return parts.join(u' ');
}

Passage passage_in(int from_church, const QString& name, const QString& content)
{
    Passage passage{.from_church = from_church, .from = name.section(u':', 2).toInt()};
    auto parts = content.split(u' ');
    passage.to = parts.takeFirst().toInt();
    for (const auto& part : parts)
        passage.people.insert(part.section(u'=', 0, 0).toInt(), part.section(u'=', 1).toInt());
    return passage;
}

void forget(Session& session, const QString& name)
{
    session.execute(u"DELETE FROM [tbl_setting] WHERE [setting]=?;"_s, name);
}

/// In place of what stood there.
void note(Session& session, const QString& name, const QString& content)
{
    core::Transaction transaction(session);
    forget(session, name);
    session.execute(u"INSERT INTO [tbl_setting] ([setting],[value]) VALUES (?,?);"_s, name, content);
    transaction.commit();
}

std::vector<int> people_without_keys(const Passage& passage, const FamilyFile& file)
{
    std::vector<int> found;
    for (const auto& person : file.people) {
        if (!passage.people.contains(person.person_id))
            found.push_back(person.person_id);
    }
    return found;
}

QSet<int> present(Session& session, const QString& table, const QString& field, const QList<int>& keys)
{
    QSet<int> found;
    if (keys.isEmpty())
        return found;
    std::vector<core::Value> values;
    for (const int key : keys)
        values.push_back(to_value(key));
    auto rows = session.select_with(
        u"SELECT [%1] FROM [%2] WHERE [%1] IN (%3);"_s.arg(field, table, places_for(keys.size())), values);
    for (const core::Row& row : rows)
        found.insert(row.integer(core::Column{0}));
    return found;
}

} // namespace

std::vector<Passage> read_passages(Session& there, int from_church)
{
    auto rows = there.select(u"SELECT [setting],[value] FROM [tbl_setting] WHERE [setting]>? AND [setting]<?;"_s,
                             note_of_church.arg(from_church), end_of_church.arg(from_church));
    std::vector<Passage> found;
    for (const core::Row& row : rows)
        found.push_back(passage_in(from_church, row.text(core::Column{0}), row.text(core::Column{1})));
    return found;
}

void keep_passage(Session& there, Passage& passage, const FamilyFile& file)
{
    const auto people = people_without_keys(passage, file);
    if (passage.to > 0 && people.empty())
        return;
    core::Transaction transaction(there);
    if (passage.to <= 0)
        passage.to = there.allocate(Entity::surname);
    int key = there.allocate(Entity::person, static_cast<int>(people.size()));
    for (const int person : people)
        passage.people.insert(person, key++);
    note(there, name_of(passage), content_of(passage));
    transaction.commit();
}

void forget_passage(Session& there, const Passage& passage)
{
    forget(there, name_of(passage));
}

std::optional<int> earlier_destination(Session& here, int surname_id)
{
    auto rows =
        here.select(u"SELECT [value] FROM [tbl_setting] WHERE [setting]=?;"_s, note_of_destination.arg(surname_id));
    const auto* row = rows.first();
    return row ? std::optional(row->text(core::Column{0}).toInt()) : std::nullopt;
}

void keep_destination(Session& here, int surname_id, int church)
{
    note(here, note_of_destination.arg(surname_id), QString::number(church));
}

void forget_destination(Session& here, int surname_id)
{
    forget(here, note_of_destination.arg(surname_id));
}

QSet<int> present_families(Session& session, const QList<int>& surname_ids)
{
    return present(session, u"tbl_surname"_s, u"Surname_ID"_s, surname_ids);
}

QSet<int> present_people(Session& session, const QList<int>& person_ids)
{
    return present(session, u"tbl_people"_s, u"person_id"_s, person_ids);
}

QString places_for(qsizetype values)
{
    return QStringList(values, u"?"_s).join(u',');
}

} // namespace kindrel::people
