#include "people/likely_duplicates.h"

#include "people/sort_key.h"

#include <QHash>
#include <QSet>

#include <algorithm>
#include <tuple>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Column;
using core::Row;
using core::Session;

constexpr std::size_t most_told = 5;
/// Shorter numbers are extensions, or remains of numbers.
constexpr qsizetype fewest_digits = 6;

/// Empty for what is no whole number.
QString folded_phone(const QString& phone)
{
    QString digits;
    for (const QChar c : phone) {
        if (c.isDigit())
            digits += QChar(u'0' + c.digitValue());
    }
    return digits.size() < fewest_digits ? QString() : digits;
}

QString folded_email(const QString& email)
{
    return email.trimmed().toCaseFolded();
}

/// A surname with a given name in the form in which they are compared; `surname` is folded already.
QString folded_name(const QString& surname, const QString& given)
{
    const auto name = sort_key(given);
    return surname.isEmpty() || name.isEmpty() ? QString() : surname + u'\n' + name;
}

/// What is looked for in the register. Phones and e-mails lead from the form in which they are compared to that in
/// which they were typed.
struct Wanted
{
    QSet<QString> surnames, names;
    QHash<QString, QString> phones, emails;

    explicit Wanted(const FamilyFile& file)
    {
        add_phone(file.address.phone);
        add_phone(file.address.family_mobile);
        add_email(file.address.family_email);
        for (const auto& person : file.people) {
            add_names(person, sort_key(file.family.surname));
            add_names(person, sort_key(person.other_surname));
            add_phone(person.mobile_phone);
            add_email(person.Personal_email);
        }
    }

private:
    void add_names(const Person& person, const QString& surname)
    {
        for (const auto& given : {person.Name, person.preferred_name}) {
            const auto name = folded_name(surname, given);
            if (name.isEmpty())
                continue;
            surnames.insert(surname);
            names.insert(name);
        }
    }
    void add_phone(const QString& phone)
    {
        if (const auto folded = folded_phone(phone); !folded.isEmpty())
            phones.insert(folded, phone.trimmed());
    }
    void add_email(const QString& email)
    {
        if (const auto folded = folded_email(email); !folded.isEmpty())
            emails.insert(folded, email.trimmed());
    }
};

/// Why a family came up, the strongest reason first. `text` is the given name, the number or the address.
struct Hit
{
    enum class Kind { name, phone, email };
    Kind kind;
    int surname_id;
    QString text;
};
using Hits = std::vector<Hit>;

/// A statement's condition with the values that it binds.
struct Condition
{
    QStringList any_of;
    std::vector<core::Value> values;

    /// `form` has the place of the values in it.
    template <class Values>
    void add(const QString& form, const Values& wanted)
    {
        if (wanted.empty())
            return;
        any_of += form.arg(QStringList(static_cast<qsizetype>(wanted.size()), u"?"_s).join(u','));
        for (const auto& value : wanted)
            values.push_back(core::to_value(value));
    }
};

/// Leaves out what ends in two other digits: equal numbers end alike, unless something stands between the digits. One
/// cheap look at each number, where reading all of them takes several times as long.
void add_phone_condition(Condition& condition, const QString& field, const Wanted& wanted)
{
    if (wanted.phones.empty())
        return;
    QSet<QString> ends;
    for (const auto& phone : wanted.phones.keys())
        ends.insert(phone.last(2));
    QStringList others;
    for (int number = 0; number < 100; ++number) {
        if (const auto end = u"%1"_s.arg(number, 2, 10, QChar(u'0')); !ends.contains(end))
            others += end;
    }
    condition.add(u"SUBSTR(%1,LENGTH(%1)-1) NOT IN (%2)"_s.arg(field, u"%1"_s), others);
}

/// By their lengths, of which a stray blank makes one more.
void add_email_condition(Condition& condition, const QString& field, const Wanted& wanted)
{
    QSet<qsizetype> lengths;
    for (const auto& email : wanted.emails)
        lengths += {email.size(), email.size() + 1};
    condition.add(u"LENGTH(%1) IN (%2)"_s.arg(field, u"%1"_s), lengths);
}

void find_phone(Hits& hits, const Wanted& wanted, int surname_id, const QString& phone)
{
    if (const auto found = wanted.phones.constFind(folded_phone(phone)); found != wanted.phones.constEnd())
        hits.push_back({Hit::Kind::phone, surname_id, *found});
}

void find_email(Hits& hits, const Wanted& wanted, int surname_id, const QString& email)
{
    if (const auto found = wanted.emails.constFind(folded_email(email)); found != wanted.emails.constEnd())
        hits.push_back({Hit::Kind::email, surname_id, *found});
}

/// People of the families that bear one of the surnames, and those who bear one of their own.
void find_names(Hits& hits, Session& session, const Wanted& wanted)
{
    Condition of_family, own;
    of_family.add(u"s.[sort_key] IN (%1)"_s, wanted.surnames);
    own.add(u"p.[sort_key] IN (%1)"_s, wanted.surnames);
    if (wanted.surnames.empty())
        return;
    const auto both = u"FROM [tbl_surname] s INNER JOIN [tbl_people] p ON p.[Surname_ID]=s.[Surname_ID] WHERE "_s;
    std::ranges::copy(own.values, std::back_inserter(of_family.values));
    auto rows = session.select_with(
        u"SELECT p.[Surname_ID],p.[Name],p.[preferred_name],s.[sort_key] "_s + both + of_family.any_of.first() +
            u" UNION ALL SELECT p.[Surname_ID],p.[Name],p.[preferred_name],p.[sort_key] "_s + both +
            own.any_of.first() + u" AND p.[sort_key]<>s.[sort_key];"_s,
        of_family.values);
    for (const Row& row : rows) {
        const auto given = row.text(Column{1});
        const auto surname = row.text(Column{3});
        if (wanted.names.contains(folded_name(surname, given)) ||
            wanted.names.contains(folded_name(surname, row.text(Column{2}))))
            hits.push_back({Hit::Kind::name, row.integer(Column{0}), given});
    }
}

void find_in_addresses(Hits& hits, Session& session, const Wanted& wanted)
{
    Condition condition;
    add_phone_condition(condition, u"[phone]"_s, wanted);
    add_phone_condition(condition, u"[family_mobile]"_s, wanted);
    add_email_condition(condition, u"[family_email]"_s, wanted);
    if (condition.any_of.isEmpty())
        return;
    auto rows = session.select_with(
        u"SELECT [surname_id],[phone],[family_mobile],[family_email] FROM [tbl_address] WHERE %1;"_s.arg(
            condition.any_of.join(u" OR ")),
        condition.values);
    for (const Row& row : rows) {
        const int key = row.integer(Column{0});
        find_phone(hits, wanted, key, row.text(Column{1}));
        find_phone(hits, wanted, key, row.text(Column{2}));
        find_email(hits, wanted, key, row.text(Column{3}));
    }
}

void find_in_details(Hits& hits, Session& session, const Wanted& wanted)
{
    Condition condition;
    add_phone_condition(condition, u"d.[mobile_phone]"_s, wanted);
    add_email_condition(condition, u"d.[Personal_email]"_s, wanted);
    if (condition.any_of.isEmpty())
        return;
    auto rows = session.select_with(
        u"SELECT p.[Surname_ID],d.[mobile_phone],d.[Personal_email] FROM [tbl_personal_details] d "
        "INNER JOIN [tbl_people] p ON p.[person_id]=d.[person_id] WHERE %1;"_s.arg(condition.any_of.join(u" OR ")),
        condition.values);
    for (const Row& row : rows) {
        const int key = row.integer(Column{0});
        find_phone(hits, wanted, key, row.text(Column{1}));
        find_email(hits, wanted, key, row.text(Column{2}));
    }
}

/// Each family once, with its strongest reason, without the file's own: those with the most in common first.
Hits strongest(Hits hits, int own)
{
    QHash<int, int> in_common;
    for (const auto& hit : hits)
        ++in_common[hit.surname_id];
    std::ranges::stable_sort(
        hits, {}, [&](const Hit& hit) { return std::tuple(-in_common[hit.surname_id], hit.kind, hit.surname_id); });
    QSet<int> found_already{own};
    Hits found;
    for (auto& hit : hits) {
        if (found.size() == most_told)
            break;
        if (found_already.contains(hit.surname_id))
            continue;
        found_already.insert(hit.surname_id);
        found.push_back(std::move(hit));
    }
    return found;
}

QString in_words(const Hit& hit, const QString& surname)
{
    switch (hit.kind) {
    case Hit::Kind::name:
        return u"%1 %2 is in it"_s.arg(hit.text, surname);
    case Hit::Kind::phone:
        return u"the same phone "_s + hit.text;
    case Hit::Kind::email:
        break;
    }
    return u"the same e-mail "_s + hit.text;
}

std::vector<Likeness> told(Session& session, const Hits& hits)
{
    std::vector<int> keys;
    std::ranges::transform(hits, std::back_inserter(keys), &Hit::surname_id);
    Condition condition;
    condition.add(u"[Surname_ID] IN (%1)"_s, keys);
    std::vector<Likeness> found;
    if (keys.empty())
        return found;
    auto rows = session.select_with(
        u"SELECT [Surname_ID],[surname],[Primary_name] FROM [tbl_surname] WHERE %1;"_s.arg(condition.any_of.first()),
        condition.values);
    for (const Row& row : rows) {
        const auto hit = std::ranges::find(hits, row.integer(Column{0}), &Hit::surname_id);
        const QStringList names{row.text(Column{1}), row.text(Column{2})};
        found.push_back({hit->surname_id, names.join(u", "_s), in_words(*hit, names.first())});
    }
    std::ranges::sort(found, {}, [&](const Likeness& one) { return std::ranges::find(keys, one.surname_id); });
    return found;
}

} // namespace

std::vector<Likeness> likely_duplicates(Session& session, const FamilyFile& file)
{
    const Wanted wanted(file);
    Hits hits;
    find_names(hits, session, wanted);
    find_in_addresses(hits, session, wanted);
    find_in_details(hits, session, wanted);
    return told(session, strongest(std::move(hits), file.family.Surname_ID));
}

} // namespace kindrel::people
