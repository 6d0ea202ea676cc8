#include "apps/ctl_command.h"
#include "apps/ctl_family_card.h"
#include "apps/ctl_listing.h"

#include "people/address_book.h"
#include "people/family_store.h"

#include <algorithm>
#include <array>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

/// What is typed for a family list, in the order of people::FamilyList.
constexpr std::array<const char*, people::family_list_count> list_words{
    "all", "active", "privacy", "active-privacy", "prospect", "archive", "booked-in", "booked-out"};

std::optional<people::FamilyList> list_from(const QString& word)
{
    const auto found = std::ranges::find_if(list_words, [&](auto known) { return word == QLatin1StringView(known); });
    if (found == list_words.end())
        return std::nullopt;
    return static_cast<people::FamilyList>(found - list_words.begin());
}

} // namespace

Status run_families(Context& context)
{
    const auto word = context.arguments.value(u"status"_s, u"all"_s);
    const auto list = list_from(word);
    if (!list) {
        context.dialogue.show({u"There is no family list \"%1\"."_s.arg(word)});
        return Status::wrong_usage;
    }
    Listing listing({{u"surname_id"_s, u"Key"_s},
                     {u"surname"_s, u"Surname"_s},
                     {u"name"_s, u"Name"_s},
                     {u"street"_s, u"Street"_s},
                     {u"suburb"_s, u"Suburb"_s},
                     {u"phone"_s, u"Phone"_s},
                     {u"condition"_s, u"Status"_s},
                     {u"booked_out"_s, u"Booked out"_s}});
    const auto& office = *context.office;
    for (const auto& entry : people::read_address_book(*office.session, *list, office.settings.use_preferred_names))
        listing.add({entry.Surname_ID, entry.surname, entry.name, entry.street, entry.suburb, entry.phone,
                     file_status_word(entry.Condition), entry.booked_out});
    listing.print(context.out, context.arguments.has(u"json"_s));
    return Status::done;
}

Status run_family(Context& context)
{
    bool whole = false;
    const int key = context.arguments.positional.front().toInt(&whole);
    if (!whole) {
        context.dialogue.show({u"The key of a family is a whole number, see \"kindrelctl families\"."_s});
        return Status::wrong_usage;
    }
    auto file = people::load_family(*context.office->session, key);
    if (!file) {
        context.dialogue.show({u"There is no family with the key %1."_s.arg(key)});
        return Status::refused;
    }
    const auto family = people::disclose(std::move(*file), people::Disclosure::of(*context.office));
    print_family(context.out, family, *context.office, context.arguments.has(u"json"_s));
    return Status::done;
}

} // namespace kindrel::apps
