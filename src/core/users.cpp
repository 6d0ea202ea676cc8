#include "core/users.h"

#include <QLocale>

#include <algorithm>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr std::chrono::seconds longest_wait{32};

const QString incorrect = u"Incorrect password"_s;
const QString security_caption = u"Security Information"_s;
const QString special_password =
    u"Access has been aloud via this special password. You MUST reset your security setup as this password can only "
    "be used ONCE."_s;
const QString special_password_used =
    u"Access denied. This password has been used once before and can only be used once for access"_s;

std::optional<Area> area_called(const QString& name)
{
    for (int area = 0; area < area_count; ++area) {
        if (area_name(static_cast<Area>(area)) == name)
            return static_cast<Area>(area);
    }
    return std::nullopt;
}

/// Each user in turn is compared, whether or not one matched already.
std::optional<User> user_with(Session& session, const Password& password)
{
    PasswordCheck check(password, church_salt(session));
    std::optional<User> found;
    for (User& user : load_users(session)) {
        if (check.matches(user.password_hash))
            found = std::move(user);
    }
    return found;
}

void let_in(Office& office, int user_id, const QString& name, const Rights& rights)
{
    office.session->execute(u"INSERT INTO [tbl_security_archive] ([user_id],[entered]) VALUES (?,?);"_s, user_id,
                            office.clock.now().toString(Qt::ISODate));
    office.rights = rights;
    office.user_id = user_id;
    office.user_name = name;
}

/// True when the password lets in; otherwise `refusal` is what to say.
bool try_password(Office& office, const Password& password, const RecoveryList* recovery, Message& refusal)
{
    refusal = {incorrect};
    if (password.empty())
        return false;
    if (const auto user = user_with(*office.session, password)) {
        let_in(office, user->user_id, user->people.join(u", "_s), user->areas);
        return true;
    }
    const auto special =
        recovery ? use_recovery_password(*office.session, office.clock, password, *recovery) : Recovery::unknown;
    if (special == Recovery::used_before)
        refusal = {.text = special_password_used, .caption = security_caption};
    if (special != Recovery::admitted)
        return false;
    let_in(office, 0, {}, Rights::all());
    office.dialogue.show({.text = special_password, .caption = security_caption, .icon = Icon::information});
    return true;
}

/// 1, 2, 4 … seconds. False when the person gives up.
bool wait_after(int wrong_ones, Clock& clock, Progress& progress)
{
    const std::chrono::seconds doubled{1LL << std::min(wrong_ones - 1, 16)};
    return clock.wait(std::min(doubled, longest_wait), progress);
}

} // namespace

bool operator==(const User& one, const User& other)
{
    const auto same_areas = [&] {
        for (int area = 0; area < area_count; ++area) {
            if (one.areas.may(static_cast<Area>(area)) != other.areas.may(static_cast<Area>(area)))
                return false;
        }
        return true;
    };
    return one.user_id == other.user_id && one.password_hash == other.password_hash && one.people == other.people &&
           one.email_name == other.email_name && one.email_address == other.email_address && same_areas();
}

std::vector<User> load_users(Session& session)
{
    auto rows = session.select(u"SELECT [user_id],[password],[area],[people],[email_name],[email_address] "
                               "FROM [tbl_security] ORDER BY [user_id],[security_id];"_s);
    std::vector<User> users;
    for (const Row& row : rows) {
        const int user_id = row.integer(Column{0});
        if (users.empty() || users.back().user_id != user_id)
            users.push_back({user_id,
                             row.text(Column{1}),
                             row.text(Column{3}).split(u'\n', Qt::SkipEmptyParts),
                             row.text(Column{4}),
                             row.text(Column{5}),
                             {}});
        if (const auto area = area_called(row.text(Column{2})))
            users.back().areas.set(*area, true);
    }
    return users;
}

bool enter_by_password(Office& office, Progress& progress, const EntryRules& rules)
{
    const Message question{.text = u"Please enter your password to gain access to %1."_s.arg(product),
                           .more = office.church_name,
                           .caption = product.toString(),
                           .icon = Icon::question};
    for (int wrong_ones = 0; rules.tries == 0 || wrong_ones < rules.tries;) {
        std::optional<QString> typed = office.dialogue.ask_text(question, true);
        if (!typed)
            return false;
        const Password password(std::move(*typed));
        Message refusal;
        if (try_password(office, password, rules.recovery, refusal))
            return true;
        if (!wait_after(++wrong_ones, office.clock, progress))
            return false;
        office.dialogue.show(refusal);
    }
    return false;
}

std::vector<LoggedEntry> entry_log(Session& session)
{
    auto rows =
        session.select(u"SELECT [user_id],[entered] FROM [tbl_security_archive] ORDER BY [entered] DESC,[user_id];"_s);
    std::vector<LoggedEntry> entries;
    for (const Row& row : rows)
        entries.push_back({row.integer(Column{0}), QDateTime::fromString(row.text(Column{1}), Qt::ISODate)});
    return entries;
}

QString entered_in_words(const QDateTime& entered)
{
    return QLocale::c().toString(entered, u"dddd, d MMMM yyyy hh:mm AP");
}

} // namespace kindrel::core
