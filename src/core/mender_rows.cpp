#include "core/mender_checks.h"

#include "core/backup_manifest.h"
#include "core/locks.h"
#include "core/references.h"
#include "core/removal.h"
#include "core/schema.h"

#include <algorithm>
#include <map>

// Rows that lost what they belong to or what belongs to them, and key counters.
namespace kindrel::core::mender_checks {

using namespace Qt::StringLiterals;

namespace {

/// What is added again under its old key where entries speak of it: they carry what people typed.
struct Revival
{
    Entity entity;
    const char* table; ///< Its entries.
    const char* field;
    const char16_t* name_field;
    const char16_t* called; ///< One of them, in words.
};
constexpr std::array revivals{
    Revival{Entity::surname, "tbl_people", "Surname_ID", u"surname", u"family"},
    Revival{Entity::group, "tbl_group", "group_id", u"group", u"group"},
    Revival{Entity::status, "tbl_status", "status_id", u"status", u"status"},
    Revival{Entity::ministry, "tbl_ministry", "ministry_id", u"ministry", u"ministry"},
    Revival{Entity::individual_date, "tbl_individual_date", "in_date_id", u"date_description", u"individual date"},
    Revival{Entity::flexi, "tbl_flexi", "flexi_id", u"flexi", u"flexi field"},
    Revival{Entity::family_group, "tbl_family_group", "family_group_id", u"family_group", u"family group"},
    Revival{Entity::family_date, "tbl_family_date", "family_date_id", u"date_description", u"family date"},
    Revival{Entity::occupation, "tbl_occupation", "occupation_id", u"occupation", u"occupation"},
    Revival{Entity::suburb, "tbl_suburb", "suburb_id", u"suburb", u"suburb"},
    Revival{Entity::roll_project, "tbl_roll_date", "roll_project_id", u"roll_project", u"roll project"},
    Revival{Entity::finance_project, "tbl_finance_date", "finance_project_id", u"finance_project", u"finance project"},
    Revival{Entity::weekly_project, "tbl_weekly_date", "weekly_project_id", u"weekly_project", u"weekly project"},
    Revival{Entity::roster_project, "tbl_roster_duty", "roster_project_id", u"roster_project", u"roster project"},
    Revival{Entity::wardline_compliance, "tbl_wardline_store_active_people", "compliance_id", u"compliance",
            u"compliance type"},
};

/// Every table whose row each row of another one needs.
struct Companion
{
    const char16_t *owner, *owner_key, *table, *key, *one, *many, *words;
};
constexpr std::array companions{
    Companion{u"tbl_surname", u"Surname_ID", u"tbl_address", u"surname_id", u"family", u"families",
              u"an address record"},
    Companion{u"tbl_people", u"person_id", u"tbl_personal_details", u"person_id", u"person", u"people",
              u"a record of personal details"},
    Companion{u"tbl_roll_project", u"roll_project_id", u"tbl_roll_setup", u"roll_project_id", u"roll project",
              u"roll projects", u"a setup record"},
};

/// The tables that hold exactly one row.
struct Single
{
    const char16_t *table, *key, *words;
};
constexpr std::array singles{
    Single{u"tbl_startup", u"startup_id", u"the church's settings"},
    Single{u"tbl_project_position", u"position_id", u"the projects chosen last"},
    Single{u"tbl_roster_build_setup", u"setup_id", u"the options of building a roster"},
    Single{u"tbl_roster_view_setup", u"setup_id", u"the look of the roster on the screen"},
    Single{u"tbl_roster_output_setup", u"setup_id", u"the look of the roster on paper"},
    Single{u"tbl_Roster_email_store", u"store_id", u"the last e-mail of a roster"},
    Single{u"tbl_Wardline_startup", u"startup_id", u"the choices made last in Wardline"},
};

QString name_of(const char* name)
{
    return QString::fromLatin1(name);
}

const Home& home_of(Entity entity)
{
    return *std::ranges::find(homes(), entity, &Home::entity);
}

bool has(const QStringList& tables, const char* table)
{
    return tables.contains(name_of(table), Qt::CaseInsensitive);
}

/// Keys of the reference that its own entity lacks: "FROM … WHERE …" behind a SELECT. Templates share one entity; one
/// of which no table is there lacks every key.
QString lost(const QStringList& tables, const char* table, const char* field, Entity to)
{
    QString text = u"FROM [%1] o WHERE o.[%2] IS NOT NULL AND o.[%2]<>0"_s.arg(name_of(table), name_of(field));
    for (const auto& home : homes()) {
        if (home.entity == to && has(tables, home.table))
            text += u" AND o.[%1] NOT IN (SELECT [%2] FROM [%3])"_s.arg(name_of(field), name_of(home.field),
                                                                        name_of(home.table));
    }
    return text;
}

const Revival* revival_by(const Reference& reference)
{
    const auto found = std::ranges::find_if(revivals, [&](const Revival& revival) {
        return revival.entity == reference.to && QByteArrayView(revival.table) == reference.table;
    });
    return found == revivals.end() ? nullptr : &*found;
}

std::vector<int> keys_from(Session& session, const QString& statement)
{
    auto rows = session.select(statement);
    std::vector<int> keys;
    for (const Row& row : rows)
        keys.push_back(row.integer(Column{0}));
    return keys;
}

std::vector<int> lost_keys(Session& session, const QStringList& tables, const Revival& revival)
{
    return keys_from(session, u"SELECT DISTINCT o.[%1] %2 ORDER BY o.[%1];"_s.arg(
                                  name_of(revival.field), lost(tables, revival.table, revival.field, revival.entity)));
}

void revive(Session& session, const QStringList& tables, const Revival& revival)
{
    const auto keys = lost_keys(session, tables, revival);
    if (keys.empty())
        return;
    const Home& home = home_of(revival.entity);
    const QString table = name_of(home.table);
    QStringList fields{name_of(home.field), QString::fromUtf16(revival.name_field)};
    int position = 0;
    if (revival.entity != Entity::surname) {
        fields += u"position"_s;
        position = number_from(session, u"SELECT MAX([position]) FROM [%1];"_s.arg(table));
    }
    std::vector<std::vector<Value>> rows;
    for (const int key : keys) {
        auto& row = rows.emplace_back();
        row = {to_value(key), to_value(u"Recovered %1 %2"_s.arg(QStringView(revival.called)).arg(key))};
        if (fields.size() > 2)
            row.push_back(to_value(++position));
    }
    session.insert(table, fields, rows);
}

const Home* own_home(const Reference& reference)
{
    const auto all = homes();
    const auto found = std::ranges::find_if(all, [&](const Home& home) {
        return QByteArrayView(home.table).compare(reference.table, Qt::CaseInsensitive) == 0 &&
               QByteArrayView(home.field).compare(reference.field, Qt::CaseInsensitive) != 0;
    });
    return found == all.end() ? nullptr : &*found;
}

/// Owners that entries name and that are gone for good, beside those that are there.
struct Owners
{
    int missing = 0, present = 0;

    /// Not a few owners are gone but most of their table, and what hangs on them must not follow.
    [[nodiscard]] bool lost() const { return missing > present; }
};

Owners owners_of(Session& session, const QStringList& tables, const Reference& reference)
{
    const QString field = name_of(reference.field);
    QString from = lost(tables, reference.table, reference.field, reference.to);
    Owners owners;
    if (number_from(session, u"SELECT COUNT(*) FROM (SELECT 1 %1 LIMIT 1) t;"_s.arg(from)) == 0)
        return owners;
    for (const auto& revival : revivals) {
        if (revival.entity != reference.to || !has(tables, revival.table))
            continue;
        from += u" AND o.[%1] NOT IN (SELECT r.[%2] FROM [%3] r WHERE r.[%2] IS NOT NULL)"_s.arg(
            field, name_of(revival.field), name_of(revival.table));
        owners.present += static_cast<int>(lost_keys(session, tables, revival).size());
    }
    owners.missing = number_from(session, u"SELECT COUNT(DISTINCT o.[%1]) %2;"_s.arg(field, from));
    for (const auto& home : homes()) {
        if (home.entity == reference.to && has(tables, home.table))
            owners.present += number_from(session, u"SELECT COUNT(*) FROM [%1];"_s.arg(name_of(home.table)));
    }
    return owners;
}

/// The tables most of which is gone by what any of the entries that hang on them tells, with the worst account.
std::map<Entity, Owners> lost_tables(Session& session, const QStringList& tables)
{
    std::map<Entity, Owners> found;
    for (const auto& reference : references()) {
        if (reference.bond == Bond::keep || !has(tables, reference.table) || revival_by(reference))
            continue;
        const Owners owners = owners_of(session, tables, reference);
        if (owners.lost() && found[reference.to].missing < owners.missing)
            found[reference.to] = owners;
    }
    return found;
}

/// Removes the entries of the reference whose owner is gone, with what hangs on them.
void remove_lost(Session& session, const QStringList& tables, const Reference& reference)
{
    const QString from = lost(tables, reference.table, reference.field, reference.to);
    if (const Home* home = own_home(reference)) {
        remove_entities(session, home->entity,
                        keys_from(session, u"SELECT o.[%1] %2;"_s.arg(name_of(home->field), from)));
        return;
    }
    session.execute(u"DELETE FROM [%1] WHERE [%2] IN (SELECT o.[%2] %3);"_s.arg(name_of(reference.table),
                                                                                name_of(reference.field), from));
}

QString owner_in_words(Entity entity)
{
    return in_words(QString::fromLatin1(home_of(entity).table)).remove(u" setup"_s);
}

Finding lost_finding(const Reference& reference, int count)
{
    if (const auto* revival = revival_by(reference))
        return {u"orphans"_s,
                u"%1 in '%2' of a %3 that is missing."_s.arg(counted(count, u"entry"_s, u"entries"_s),
                                                             in_words(name_of(reference.table)),
                                                             QStringView(revival->called)),
                count, Cure::mend,
                u"It is added again under a name that begins with 'Recovered', for you to rename or remove."_s};
    return {u"orphans"_s,
            u"%1 in '%2' without an owner: what stood in '%3' is gone."_s.arg(counted(count, u"entry"_s, u"entries"_s),
                                                                              in_words(name_of(reference.table)),
                                                                              owner_in_words(reference.to)),
            count, Cure::mend, u"They are removed; the copy made before mending keeps them."_s};
}

Finding lost_table_finding(Entity entity, const Owners& owners)
{
    return {u"lost_table"_s,
            u"Most of '%1' is gone: other entries speak of %2 that are missing, and %3 %4 left."_s.arg(
                owner_in_words(entity), QString::number(owners.missing), QString::number(owners.present),
                owners.present == 1 ? u"is"_s : u"are"_s),
            owners.missing, Cure::by_hand,
            u"Put back a backup, which has them. Until then nothing that hangs on them is removed."_s};
}

QString lacking(const Companion& pair)
{
    return u"FROM [%1] o WHERE NOT EXISTS (SELECT 1 FROM [%2] c WHERE c.[%3]=o.[%4])"_s.arg(
        QStringView(pair.owner), QStringView(pair.table), QStringView(pair.key), QStringView(pair.owner_key));
}

/// The highest key that stands anywhere in the church, for each counter table: a key that only the past names must not
/// be handed out again either.
std::map<QString, qint64> highest_keys(Session& session)
{
    std::map<QString, qint64> highest;
    const auto look = [&](Entity entity, const char* table, const char* field) {
        auto rows = session.select(u"SELECT MAX([%1]) FROM [%2];"_s.arg(name_of(field), name_of(table)));
        const Row* row = rows.first();
        auto& most = highest[counter_table(entity).toString()];
        most = std::max(most, row ? row->number(Column{0}) : 0);
    };
    for (const auto& home : homes())
        look(home.entity, home.table, home.field);
    for (const auto& reference : references())
        look(reference.to, reference.table, reference.field);
    return highest;
}

/// The counters that are behind, with the key they should have handed out.
std::map<QString, qint64> counters_behind(Session& session)
{
    auto highest = highest_keys(session);
    std::erase_if(highest, [&](const auto& counter) {
        return number_from(session, u"SELECT MAX([id_found]) FROM [%1];"_s.arg(counter.first)) >= counter.second;
    });
    return highest;
}

} // namespace

Findings examine_orphans(MenderPlace& place)
{
    Session& session = *place.session;
    const QStringList tables = tables_of(session);
    const auto lost_owners = lost_tables(session, tables);
    Findings findings;
    for (const auto& reference : references()) {
        const bool stays = lost_owners.contains(reference.to) && !revival_by(reference);
        if (reference.bond == Bond::keep || stays || !has(tables, reference.table))
            continue;
        const QString from = lost(tables, reference.table, reference.field, reference.to);
        if (const int count = number_from(session, u"SELECT COUNT(*) %1;"_s.arg(from)); count > 0)
            findings.push_back(lost_finding(reference, count));
    }
    for (const auto& [entity, owners] : lost_owners)
        findings.push_back(lost_table_finding(entity, owners));
    return findings;
}

void mend_orphans(MenderPlace& place)
{
    Session& session = *place.session;
    const QStringList tables = tables_of(session);
    const auto lost_owners = lost_tables(session, tables);
    for (int number = 1; number <= entity_count; ++number) {
        const auto entity = static_cast<Entity>(number);
        // Entries of who is gone went before, so that nothing comes back for their sake.
        for (const auto& revival : revivals) {
            if (revival.entity == entity)
                revive(session, tables, revival);
        }
        if (lost_owners.contains(entity))
            continue;
        for (const auto& reference : references()) {
            if (reference.to == entity && reference.bond != Bond::keep && has(tables, reference.table))
                remove_lost(session, tables, reference);
        }
    }
}

Findings examine_companions(MenderPlace& place)
{
    Session& session = *place.session;
    Findings findings;
    for (const auto& pair : companions) {
        const int count = number_from(session, u"SELECT COUNT(*) %1;"_s.arg(lacking(pair)));
        if (count > 0)
            findings.push_back(
                {u"companions"_s,
                 u"%1 without %2."_s.arg(counted(count, QString::fromUtf16(pair.one), QString::fromUtf16(pair.many)),
                                         QStringView(pair.words)),
                 count, Cure::mend, u"An empty one is added for each."_s});
    }
    for (const auto& single : singles) {
        if (number_from(session, u"SELECT COUNT(*) FROM [%1];"_s.arg(QStringView(single.table))) == 0)
            findings.push_back({u"companions"_s, u"The record of %1 is missing."_s.arg(QStringView(single.words)), 1,
                                Cure::mend, u"It is made again as in a new church."_s});
    }
    return findings;
}

void mend_companions(MenderPlace& place)
{
    Session& session = *place.session;
    for (const auto& pair : companions)
        session.execute(u"INSERT INTO [%1] ([%2]) SELECT o.[%3] %4;"_s.arg(
            QStringView(pair.table), QStringView(pair.key), QStringView(pair.owner_key), lacking(pair)));
    for (const auto& single : singles) {
        if (number_from(session, u"SELECT COUNT(*) FROM [%1];"_s.arg(QStringView(single.table))) == 0)
            session.execute(
                u"INSERT INTO [%1] ([%2]) VALUES (1);"_s.arg(QStringView(single.table), QStringView(single.key)));
    }
}

Findings examine_version(MenderPlace& place)
{
    auto rows = place.session->select(u"SELECT [Version] FROM [tbl_startup];"_s);
    const Row* row = rows.first();
    if (!row || row->integer(Column{0}) == schema_version)
        return {};
    return {{u"version"_s,
             u"The database is of version %1, this program's is %2."_s.arg(row->integer(Column{0})).arg(schema_version),
             1, Cure::by_hand, u"Start Kindrel of the same edition: it brings an older database up to date."_s}};
}

Findings examine_counters(MenderPlace& place)
{
    Findings findings;
    for (const auto& [table, key] : counters_behind(*place.session))
        findings.push_back({u"counters"_s,
                            u"The key counter of '%1' is behind: new entries would get keys that are in use."_s.arg(
                                QStringView(table).mid(7).toString().replace(u'_', u' ')),
                            1, Cure::mend, u"It goes on behind %1."_s.arg(key)});
    return findings;
}

void mend_counters(MenderPlace& place)
{
    for (const auto& [table, key] : counters_behind(*place.session))
        place.session->execute(u"INSERT INTO [%1] ([id_found]) VALUES (?);"_s.arg(table), key);
}

Findings examine_locks(MenderPlace& place)
{
    Findings findings;
    const QStringList there = tables_of(*place.session);
    for (const auto& table : lock_tables()) {
        if (there.contains(table, Qt::CaseInsensitive))
            continue;
        findings.push_back({u"locks"_s, u"Without the table '%1' nobody can tell who is in the church."_s.arg(table), 1,
                            Cure::unlock, u"When nobody is inside, unlock the church: the table is made again."_s});
    }
    if (!findings.empty())
        return findings;
    for (const auto& lock : Locks(*place.session, place.workstation, place.clock).all()) {
        if (lock.holder.this_workstation && !lock.stale)
            continue; // A program that is at work here.
        findings.push_back({u"locks"_s, held_line(lock, DayOrder::day_first), 1, Cure::unlock,
                            lock.stale ? u"The program that took it runs no more: unlock the church."_s
                                       : u"When nobody works there, unlock the church."_s});
    }
    return findings;
}

} // namespace kindrel::core::mender_checks
