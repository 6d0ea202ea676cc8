#pragma once

#include "core/users.h"

namespace kindrel::core {

/// The most passwords that a church can have.
inline constexpr int most_passwords = 50;

/// The passwords of the church while they are being set up: changes stay in memory until the setup is left. A password
/// is addressed by its place in users(); anything else stands for none selected. Whatever refuses has said why.
class SecuritySetup
{
public:
    /// Nullopt without the right. The area's lock is that of enter().
    [[nodiscard]] static std::optional<SecuritySetup> open(Office& office);

    [[nodiscard]] bool switched_on() const { return m_switched_on; }
    void switch_on(bool on) { m_switched_on = on; }
    [[nodiscard]] const std::vector<User>& users() const { return m_users; }
    /// What the list shows for a password: its people, else "Password 3".
    [[nodiscard]] QString title(int place) const;

    /// The place of the new password. The text is wiped.
    std::optional<int> add(QString password);
    bool change_password(int place, QString password);
    /// Asks first.
    bool remove(int place);
    bool set_people(int place, const QStringList& people);
    bool set_email(int place, const QString& name, const QString& address);
    bool set_area(int place, Area area, bool granted);

    [[nodiscard]] bool altered() const;
    /// True when the screen may close: the rules hold and the changes are saved. A fault names its place.
    [[nodiscard]] bool leave();
    /// The first password that leave() would refuse; nullopt when it is none in particular.
    [[nodiscard]] std::optional<int> faulty() const;

private:
    explicit SecuritySetup(Office& office);
    [[nodiscard]] User& user(int place);
    [[nodiscard]] bool selected(int place, const QString& refusal) const;
    /// Its hash, unless it is empty or used by a password at another place.
    [[nodiscard]] std::optional<QString> accepted(QString password, int place) const;
    [[nodiscard]] std::optional<Message> fault() const;
    [[nodiscard]] bool save();

    Office* m_office;
    QByteArray m_salt;
    bool m_switched_on = false;
    std::vector<User> m_users;
    bool m_stored_switch = false;
    std::vector<User> m_stored;
};

} // namespace kindrel::core
