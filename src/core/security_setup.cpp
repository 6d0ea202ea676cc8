#include "core/security_setup.h"

#include "core/entry.h"
#include "core/references.h"

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

const QString none_to_remove = u"Please select a password first before attempting to remove it."_s;
const QString none_selected = u"Please select a password in the list box first that you wish to %1"_s;
const QString confirm_removal = u"Please confirm that you wish to remove this password."_s;
const QString maximum_reached = u"The maximum amount of passwords available has been reached."_s;
const QString nothing_entered = u"Please enter a password first before attempting to add it"_s;
const QString used_already = u"This Password has already been used"_s;
const QString used_already_why =
    u"Nobody enters a name when entering the program, so the password alone tells who it is."_s;
const QString no_password = u"Unable to exit the security area as you have set security on without adding a password"_s;
const QString no_access_area =
    u"You have entered a password without entering any access areas to it, unable to exit security setup until you "
    "enter at least one access area to all passwords"_s;
const QString nobody_gets_back =
    u"Unable to exit the security area as you do not have at least one password setup to enter the security area, you "
    "must have a password setup to enter the security area so that you do not get locked out"_s;
const QString operational_next_time = u"Security will become operational the next time a user enters %1"_s;
const QString exit_first =
    u"Before the changes can take effect you need to exit Kindrel and re-enter it using your password"_s;
const QString not_saved = u"The security setup could not be saved, it is as it was before."_s;

bool stored_switch(Session& session)
{
    return read_settings(session).Security;
}

std::vector<Area> areas_of(const User& user)
{
    std::vector<Area> areas;
    for (int area = 0; area < area_count; ++area) {
        if (user.areas.may(static_cast<Area>(area)))
            areas.push_back(static_cast<Area>(area));
    }
    return areas;
}

bool opens_something(const User& user)
{
    return !areas_of(user).empty();
}

std::vector<User>::const_iterator without_area(const std::vector<User>& users)
{
    return std::ranges::find_if_not(users, opens_something);
}

/// The rows of `tbl_security`: one for each password and area.
std::vector<std::vector<Value>> rows_of(const std::vector<User>& users, qint64 first_key)
{
    std::vector<std::vector<Value>> rows;
    for (const User& user : users) {
        for (const Area area : areas_of(user)) {
            rows.push_back({first_key++, to_value(user.user_id), to_value(user.password_hash),
                            to_value(area_name(area).toString()), to_value(user.people.join(u'\n')),
                            to_value(user.email_name), to_value(user.email_address)});
        }
    }
    return rows;
}

/// What belongs to a user goes; what tells of the past stays.
void remove_belongings(Session& session, const std::vector<User>& before, const std::vector<User>& after)
{
    for (const User& user : before) {
        if (std::ranges::find(after, user.user_id, &User::user_id) != after.end())
            continue;
        for (const Reference& reference : references()) {
            if (reference.to == Entity::user && reference.bond == Bond::owned)
                session.execute(u"DELETE FROM [%1] WHERE [%2]=?;"_s.arg(QLatin1StringView(reference.table),
                                                                        QLatin1StringView(reference.field)),
                                user.user_id);
        }
    }
}

void give_keys(Session& session, std::vector<User>& users)
{
    const auto is_new = [](const User& user) {
        return user.user_id == 0;
    };
    const auto count = static_cast<int>(std::ranges::count_if(users, is_new));
    int key = count > 0 ? session.allocate(Entity::user, count) : 0;
    for (User& user : users) {
        if (is_new(user))
            user.user_id = key++;
    }
}

/// All or nothing; gives new users their keys.
void store(Session& session, const std::vector<User>& before, std::vector<User>& users, bool switched_on)
{
    give_keys(session, users);
    auto rows = rows_of(users, 0);
    qint64 key = rows.empty() ? 0 : session.allocate(Entity::security, static_cast<int>(rows.size()));
    for (auto& row : rows)
        row.front() = key++;
    Transaction transaction(session);
    remove_belongings(session, before, users);
    session.execute(u"DELETE FROM [tbl_security];"_s);
    session.insert(
        u"tbl_security"_s,
        {u"security_id"_s, u"user_id"_s, u"password"_s, u"area"_s, u"people"_s, u"email_name"_s, u"email_address"_s},
        rows);
    write_setting(session, u"Security"_s, switched_on);
    transaction.commit();
}

} // namespace

SecuritySetup::SecuritySetup(Office& office)
    : m_office(&office), m_salt(church_salt(*office.session)), m_switched_on(stored_switch(*office.session)),
      m_users(load_users(*office.session)), m_stored_switch(m_switched_on), m_stored(m_users)
{
}

std::optional<SecuritySetup> SecuritySetup::open(Office& office)
{
    return permitted(office, Area::security) ? std::optional(SecuritySetup(office)) : std::nullopt;
}

QString SecuritySetup::title(int place) const
{
    const QStringList& people = m_users[static_cast<std::size_t>(place)].people;
    return people.isEmpty() ? u"Password %1"_s.arg(place + 1) : people.join(u", "_s);
}

std::optional<int> SecuritySetup::add(QString password)
{
    const auto place = static_cast<int>(m_users.size());
    if (place >= most_passwords) {
        m_office->dialogue.show({maximum_reached});
        return std::nullopt;
    }
    const auto hash = accepted(std::move(password), place);
    if (!hash)
        return std::nullopt;
    m_users.push_back({.password_hash = *hash});
    return place;
}

bool SecuritySetup::change_password(int place, QString password)
{
    if (!selected(place, none_selected.arg(u"change"_s)))
        return false;
    const auto hash = accepted(std::move(password), place);
    if (hash)
        user(place).password_hash = *hash;
    return hash.has_value();
}

bool SecuritySetup::remove(int place)
{
    if (!selected(place, none_to_remove) || !m_office->dialogue.confirm({confirm_removal}, Answer::no))
        return false;
    m_users.erase(m_users.begin() + place);
    return true;
}

bool SecuritySetup::set_people(int place, const QStringList& people)
{
    if (!selected(place, none_selected.arg(u"attach people to"_s)))
        return false;
    user(place).people.clear();
    for (const QString& name : people) {
        const QString simple = name.simplified();
        if (!simple.isEmpty())
            user(place).people += simple;
    }
    return true;
}

bool SecuritySetup::set_email(int place, const QString& name, const QString& address)
{
    if (!selected(place, none_selected.arg(u"add an e-mail name and address to"_s)))
        return false;
    user(place).email_name = name.trimmed();
    user(place).email_address = address.trimmed();
    return true;
}

bool SecuritySetup::set_area(int place, Area area, bool granted)
{
    if (!selected(place, none_selected.arg(u"add security access to"_s)))
        return false;
    user(place).areas.set(area, granted);
    return true;
}

bool SecuritySetup::altered() const
{
    return m_switched_on != m_stored_switch || m_users != m_stored;
}

std::optional<int> SecuritySetup::faulty() const
{
    const auto found = without_area(m_users);
    return found == m_users.end() ? std::nullopt : std::optional(static_cast<int>(found - m_users.begin()));
}

bool SecuritySetup::leave()
{
    if (const auto fault = this->fault()) {
        m_office->dialogue.show(*fault);
        return false;
    }
    if (!altered())
        return true;
    if (!save())
        return false;
    if (m_switched_on)
        m_office->dialogue.show(
            information(m_office->settings.Security ? exit_first : operational_next_time.arg(product)));
    return true;
}

std::optional<Message> SecuritySetup::fault() const
{
    if (m_switched_on && m_users.empty())
        return Message{no_password};
    if (without_area(m_users) != m_users.end())
        return Message{no_access_area};
    const auto enters_security = [](const User& user) {
        return user.areas.may(Area::security);
    };
    if (!m_users.empty() && std::ranges::none_of(m_users, enters_security))
        return Message{nobody_gets_back};
    return std::nullopt;
}

User& SecuritySetup::user(int place)
{
    return m_users[static_cast<std::size_t>(place)];
}

bool SecuritySetup::selected(int place, const QString& refusal) const
{
    if (place >= 0 && place < static_cast<int>(m_users.size()))
        return true;
    m_office->dialogue.show({refusal});
    return false;
}

std::optional<QString> SecuritySetup::accepted(QString password, int place) const
{
    const Password typed(std::move(password));
    if (typed.empty()) {
        m_office->dialogue.show({nothing_entered});
        return std::nullopt;
    }
    PasswordCheck check(typed, m_salt);
    for (int other = 0; other < static_cast<int>(m_users.size()); ++other) {
        if (other != place && check.matches(m_users[static_cast<std::size_t>(other)].password_hash)) {
            m_office->dialogue.show({used_already, used_already_why});
            return std::nullopt;
        }
    }
    return hash_password(typed, m_salt);
}

bool SecuritySetup::save()
{
    auto users = m_users;
    try {
        store(*m_office->session, m_stored, users, m_switched_on);
    } catch (const DatabaseError& error) {
        m_office->dialogue.show({not_saved, error.text()});
        return false;
    }
    m_stored = m_users = std::move(users);
    m_stored_switch = m_switched_on;
    return true;
}

} // namespace kindrel::core
