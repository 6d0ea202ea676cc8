#include "people/pins.h"

#include "core/open_church.h"
#include "people/disclosed.h"

#include <algorithm>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

using core::Column;
using core::Session;

/// A PIN of the register with its owner's family, 0 for a row whose person is gone.
struct Holder
{
    QString pin;
    int person_id = 0;
    int surname_id = 0;
};

QString marks(std::size_t count)
{
    return QStringList(static_cast<qsizetype>(count), u"?"_s).join(u',');
}

std::vector<Holder> holders_of(Session& session, const std::vector<core::Value>& pins)
{
    std::vector<Holder> found;
    if (pins.empty())
        return found;
    auto rows = session.select_with(
        u"SELECT n.[personal_pin],n.[person_id],p.[Surname_ID] FROM [tbl_pin] n "
        "LEFT JOIN [tbl_people] p ON p.[person_id]=n.[person_id] WHERE n.[personal_pin] IN (%1);"_s.arg(
            marks(pins.size())),
        pins);
    for (const core::Row& row : rows)
        found.push_back({row.text(Column{0}), row.integer(Column{1}), row.integer(Column{2})});
    return found;
}

/// A stored PIN of the file's own family holds nothing: what the file says about it is written in its place.
bool held_elsewhere(const Holder& holder, const FamilyFile& file)
{
    return holder.surname_id == 0 || holder.surname_id != file.family.Surname_ID;
}

bool held_in_file(const FamilyFile& file, const QString& pin, const Person* except)
{
    return std::ranges::any_of(file.people,
                               [&](const Person& person) { return &person != except && person.personal_pin == pin; });
}

/// Of two people of the file with the same PIN the one who has it in the register keeps it, else the first. To be asked
/// of the people in their order.
bool clashes(const FamilyFile& file, const Person& person, const std::vector<Holder>& holders)
{
    if (person.personal_pin.isEmpty())
        return false;
    const auto holder = std::ranges::find(holders, person.personal_pin, &Holder::pin);
    if (holder != holders.end() && held_elsewhere(*holder, file))
        return true;
    const int owner = holder != holders.end() ? holder->person_id : -1;
    return std::ranges::any_of(file.people, [&](const Person& other) {
        return &other != &person && other.personal_pin == person.personal_pin &&
               (other.person_id == owner || &other < &person);
    });
}

/// The register's PINs from `first` upwards, in the order of numbers: without leading zeros the longer one is larger.
core::Rows pins_from(Session& session, const QString& first)
{
    return session.select(u"SELECT [personal_pin] FROM [tbl_pin] "
                          "WHERE LENGTH([personal_pin])>? OR (LENGTH([personal_pin])=? AND [personal_pin]>=?) "
                          "ORDER BY LENGTH([personal_pin]),[personal_pin];"_s,
                          first.size(), first.size(), first);
}

qint64 free_number(Session& session, const FamilyFile& file, const Person& asking, qint64 start)
{
    qint64 candidate = start;
    const auto pass_family = [&] {
        while (held_in_file(file, QString::number(candidate), &asking))
            ++candidate;
    };
    pass_family();
    auto taken = pins_from(session, QString::number(candidate));
    for (const core::Row& row : taken) {
        const auto pin = row.text(Column{0});
        const auto wanted = QString::number(candidate);
        if (pin.size() > wanted.size() || (pin.size() == wanted.size() && pin > wanted))
            break;
        if (pin == wanted) {
            ++candidate;
            pass_family();
        }
    }
    return candidate;
}

/// Finds the number and moves the church's counter behind it, so that no two workstations are offered the same one.
qint64 take_number(Session& session, const FamilyFile& file, const Person& asking)
{
    const auto counter = u"pin_auto_number_start"_s;
    core::Transaction transaction(session);
    const qint64 start = core::read_settings(session).pin_auto_number_start;
    const qint64 number = free_number(session, file, asking, std::max<qint64>(1, start));
    core::write_setting(session, counter, number + 1);
    transaction.commit();
    return number;
}

} // namespace

QString tidy_pin(const QString& typed)
{
    const auto digits = typed.trimmed();
    if (digits.isEmpty() || !std::ranges::all_of(digits, [](QChar c) { return c >= u'0' && c <= u'9'; }))
        return {};
    const auto* start = std::ranges::find_if(digits, [](QChar c) { return c != u'0'; });
    return start == digits.end() ? u"0"_s : digits.sliced(start - digits.begin());
}

bool pins_permitted(const core::Office& office)
{
    if (Disclosure::of(office).pins)
        return true;
    office.dialogue.show({u"Your security setup does not allow you access to any of the P.I.N. functions"_s});
    return false;
}

std::optional<QString> allocate_pin(core::Office& office, const FamilyFile& file, int index)
{
    if (!pins_permitted(office))
        return std::nullopt;
    const auto& person = file.people.at(static_cast<std::size_t>(index));
    const core::Message search_on{u"A P.I.N. Number already exists for this person, do you wish to continue in "
                                  "searching for a new one?"_s};
    if (!person.personal_pin.isEmpty() && !office.dialogue.confirm(search_on, core::Answer::no))
        return std::nullopt;
    if (!core::network_guard(office))
        return std::nullopt;
    const qint64 number = take_number(*office.session, file, person);
    office.settings.pin_auto_number_start = static_cast<int>(number + 1);
    return QString::number(number);
}

void check_pin(core::Office& office, const FamilyFile& file, int index)
{
    if (!pins_permitted(office))
        return;
    const auto& person = file.people.at(static_cast<std::size_t>(index));
    const auto& pin = person.personal_pin;
    if (pin.isEmpty()) {
        office.dialogue.show({u"Before using this option, enter a persons P.I.N. number to see if anyone else has the "
                              "same P.I.N. number."_s});
        return;
    }
    const auto holders = holders_of(*office.session, {core::to_value(pin)});
    const bool taken = held_in_file(file, pin, &person) ||
                       std::ranges::any_of(holders, [&](const Holder& one) { return held_elsewhere(one, file); });
    office.dialogue.show(
        taken ? core::Message{u"Caution: This P.I.N. is in use by another person and cannot be used."_s}
              : core::information(
                    u"This P.I.N. is NOT in use by any other person and is safe to be used on this person."_s));
}

std::optional<core::Message> pin_clash(Session& session, const FamilyFile& file)
{
    std::vector<core::Value> pins;
    for (const auto& person : file.people) {
        if (!person.personal_pin.isEmpty())
            pins.push_back(core::to_value(person.personal_pin));
    }
    const auto holders = holders_of(session, pins);
    const auto guilty =
        std::ranges::find_if(file.people, [&](const Person& person) { return clashes(file, person, holders); });
    if (guilty == file.people.end())
        return std::nullopt;
    return core::Message{u"You have attempted to add a P.I.N. number to %1 that is already in use by another person, "
                         "please assign a new P.I.N. number to %1"_s.arg(guilty->Name)};
}

} // namespace kindrel::people
