#include "desktop/people/status_words.h"

#include <algorithm>
#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::AddressBookEntry;
using people::FileStatus;

namespace {

struct StatusLook
{
    FileStatus status;
    const char* word;
    State state;
};

constexpr std::array status_looks{
    StatusLook{FileStatus::active, "Active", State::plain},
    StatusLook{FileStatus::privacy, "Privacy", State::privacy},
    StatusLook{FileStatus::prospect, "Prospect", State::prospect},
    StatusLook{FileStatus::archive, "Archive", State::archive},
};

struct PersonLook
{
    bool people::PersonStates::*is_so;
    State state;
};

/// The gravest first.
constexpr std::array person_looks{
    PersonLook{&people::PersonStates::deceased, State::deceased},
    PersonLook{&people::PersonStates::archived, State::archive},
    PersonLook{&people::PersonStates::privacy, State::privacy},
    PersonLook{&people::PersonStates::prospect, State::prospect},
    PersonLook{&people::PersonStates::contact, State::contact},
};

const StatusLook& look_of(FileStatus status)
{
    const auto* found = std::find_if(status_looks.begin(), status_looks.end(),
                                     [status](const StatusLook& look) { return look.status == status; });
    return found == status_looks.end() ? status_looks.front() : *found;
}

} // namespace

QString status_words(const AddressBookEntry& entry)
{
    if (!entry.booked_out)
        return status_word(entry.Condition);
    const QString before = entry.Condition == FileStatus::active ? QString() : status_word(entry.Condition) + u' ';
    return before + u"\u2192 Booked out"_s;
}

QString status_word(FileStatus status)
{
    return QString::fromLatin1(look_of(status).word);
}

State state_of(FileStatus status)
{
    return look_of(status).state;
}

State state_of(const AddressBookEntry& entry)
{
    return entry.booked_out ? State::booked_out : state_of(entry.Condition);
}

State state_of(const people::PersonStates& states)
{
    const auto* found = std::find_if(person_looks.begin(), person_looks.end(),
                                     [&states](const PersonLook& look) { return states.*look.is_so; });
    return found == person_looks.end() ? State::plain : found->state;
}

} // namespace kindrel::desktop
