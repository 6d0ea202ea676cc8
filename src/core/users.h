#pragma once

#include "core/office.h"
#include "core/recovery.h"

namespace kindrel::core {

/// A password and what it carries.
struct User
{
    int user_id = 0;            ///< 0 until the first save.
    QString password_hash = {}; ///< Alone identifies the user: unique.
    QStringList people = {};    ///< The names of those whom the password belongs to.
    QString email_name = {};    ///< Sender in place of the church's; empty for none.
    QString email_address = {};
    Rights areas = {}; ///< What is ticked; nothing by default.

    friend bool operator==(const User& one, const User& other);
};

/// In the order of their keys.
[[nodiscard]] std::vector<User> load_users(Session& session);

/// How often a person may try, and what lets in besides the users' passwords.
struct EntryRules
{
    int tries = 0;                                   ///< 0: until the person gives up.
    const RecoveryList* recovery = &recovery_list(); ///< Null: recovery passwords are unknown passwords.
};

/// Asks for the password until one is right, waiting longer after each that is wrong. Then gives the office the user's
/// rights, key and name, and writes the entry into the log. A recovery password lets in with every right and as user 0.
/// False when the person gave up or used up the tries.
[[nodiscard]] bool enter_by_password(Office& office, Progress& progress, const EntryRules& rules = {});

/// An entry into the program.
struct LoggedEntry
{
    int user_id = 0; ///< 0: by a recovery password.
    QDateTime entered;
};

/// Newest first.
[[nodiscard]] std::vector<LoggedEntry> entry_log(Session& session);

/// "Wednesday, 15 May 2024 10:30 AM", in English whatever the machine speaks.
[[nodiscard]] QString entered_in_words(const QDateTime& entered);

} // namespace kindrel::core
