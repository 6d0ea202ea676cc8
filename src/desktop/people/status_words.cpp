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

struct FlagState
{
    bool people::Person::*flag;
    State state;
};

/// The gravest first.
constexpr std::array flag_states{
    FlagState{&people::Person::Decease, State::deceased}, FlagState{&people::Person::archive, State::archive},
    FlagState{&people::Person::Privacy, State::privacy},  FlagState{&people::Person::Prospect, State::prospect},
    FlagState{&people::Person::contact, State::contact},
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

State state_of(const people::Person& person)
{
    const auto* found = std::find_if(flag_states.begin(), flag_states.end(),
                                     [&person](const FlagState& flag) { return person.*flag.flag; });
    return found == flag_states.end() ? State::plain : found->state;
}

} // namespace kindrel::desktop
