#include "desktop/mender/account.h"

#include "core/mender_checks.h"
#include "core/mender_words.h"
#include "desktop/mender/account_findings.h"
#include "desktop/mender/discreet.h"

#include <algorithm>
#include <numeric>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Findings;

namespace {

namespace words = core::mender_words;

constexpr qsizetype most_told = 8;

QString is_sound(const QString& church)
{
    return u"%1 is sound."_s.arg(church);
}

QString left_over(const QString& church, const Findings& left)
{
    return left.empty() ? is_sound(church) : u"%1: %2 left"_s.arg(church, findings_in_words(left.size()));
}

/// Key counters say nothing to people.
bool is_counter(const core::RecoveredTable& table)
{
    return table.table.startsWith(u"tbl_id_"_s, Qt::CaseInsensitive);
}

int rows_of(const std::vector<core::RecoveredTable>& tables)
{
    return std::accumulate(tables.begin(), tables.end(), 0, [](int sum, const core::RecoveredTable& table) {
        return sum + (is_counter(table) ? 0 : table.rows);
    });
}

AccountGroup recovered_group(const QString& heading, const std::vector<core::RecoveredTable>& tables, bool whole)
{
    AccountGroup group{heading, {}, {}};
    for (const auto& table : tables) {
        if (words::came_whole(table) == whole && !(whole && (table.rows == 0 || is_counter(table))))
            group.lines.push_back(
                plain(u"%1: %2"_s.arg(core::mender_checks::in_words(table.table), words::came_of(table))));
    }
    return group;
}

QString how_to_go_on(WayIntoPlace way)
{
    switch (way) {
    case WayIntoPlace::taken:
        return u"It stands in the church's place: check the church now."_s;
    case WayIntoPlace::open:
        return without_commands(words::after_recovering());
    case WayIntoPlace::closed:
        break;
    }
    return words::no_place_for_recovered();
}

} // namespace

QString found_for(const Account& account, MenderAct act)
{
    QStringList found;
    for (const auto& group : account.groups)
        if (group.act == act)
            for (const auto& line : group.lines)
                found += line.words;
    const auto more = found.size() - most_told;
    if (more > 0)
        found = found.first(most_told) << u"… and %1 more"_s.arg(more);
    return found.join(u'\n');
}

Account account_at_start()
{
    return {.title = u"Which church does not open?"_s,
            .lines = {plain(u"Choose it above and press 'Check'. Checking looks at its records, its folder and what "
                            "locks it, tells what is wrong, and changes nothing."_s)}};
}

Account account_of_work(const QString& what, bool changes)
{
    return {.chip = u"At work"_s,
            .state = State::prospect,
            .title = what,
            .lines = {plain(changes ? u"Leave this window open and the workstation on until it is done."_s
                                    : u"This changes nothing. A large church takes a little while."_s)},
            .next = MenderAct::none};
}

Account account_of_no_place(const QString& why)
{
    return {.chip = u"No data"_s,
            .state = State::error,
            .title = u"There is no church to look at here."_s,
            .lines = {plain(why),
                      plain(u"Choose the data drive, that is the folder in which '%1' lies, and a church."_s.arg(
                          core::data_folder))}};
}

Account account_of_no_church(const QString& church, const QString& file)
{
    return {
        .chip = u"No records"_s,
        .state = State::error,
        .title = u"There are no records of %1 here."_s.arg(church),
        .lines = {plain(u"'%1' is missing."_s.arg(file)),
                  plain(u"If this church was never set up, choose another one above."_s),
                  plain(u"If it had records, put back a backup: started without them, %1 would begin an empty "
                        "church. Where there is only a damaged church file, 'Recover what can be read' makes a new "
                        "one of it, and 'Put recovered file in place' gives that to the church."_s.arg(core::product))},
        .next = MenderAct::none,
        .looked = true};
}

Account account_of_failure(const QString& why)
{
    return {.chip = u"Failed"_s,
            .state = State::error,
            .title = u"This could not be done."_s,
            .lines = {plain(why), plain(u"Check the church again to see how it stands now."_s)}};
}

Account account_of_check(const QString& church, const Findings& findings)
{
    Account account;
    judge(account, findings);
    account.title = findings.empty() ? is_sound(church) : u"%1: %2"_s.arg(church, findings_in_words(findings.size()));
    account.lines = {plain(findings.empty()
                               ? u"Nothing is wrong with its records and its folder, and nothing locks it."_s
                               : u"So far nothing was changed."_s)};
    return account;
}

Account account_of_refusal(const QString& church, const QStringList& why, const Findings& findings)
{
    Account account;
    judge(account, findings);
    account.chip = u"Refused"_s;
    account.state = State::error;
    account.title = u"%1: %2"_s.arg(church, words::nothing_changed());
    for (const auto& line : why)
        account.lines.push_back(
            {.words = without_commands(line),
             .in_report = line.contains(u" is held"_s) ? discreet_lock(line) : without_commands(line)});
    return account;
}

Account account_of_mending(const QString& church, const core::Mending& mending)
{
    Account account;
    if (!mending.mended.empty())
        account.groups.push_back(
            {u"Mended: %1"_s.arg(findings_in_words(mending.mended.size())), {}, lines_of(mending.mended)});
    judge(account, mending.left);
    account.title = left_over(church, mending.left);
    if (account.next == MenderAct::mend) // What is left waits for what a person must decide.
        account.next = MenderAct::none;
    if (mending.mended.empty())
        account.lines.push_back(plain(words::nothing_changed()));
    if (!mending.copy.isEmpty())
        account.lines.push_back(
            {.words = u"The database as it was before: %1"_s.arg(mending.copy),
             .beneath = u"Keep this copy until you have seen that all is well."_s,
             .in_report = u"A copy of the database as it was before lies in its folder 'mended'."_s});
    return account;
}

Account account_of_unlocking(const QString& church, const QStringList& removed, const Findings& left)
{
    Account account;
    AccountGroup group{u"Removed: %1"_s.arg(removed.size()), {}, {}};
    for (const auto& line : removed)
        group.lines.push_back({.words = line, .in_report = discreet_lock(line)});
    if (!removed.isEmpty())
        account.groups.push_back(group);
    judge(account, left);
    account.title = left_over(church, left);
    account.lines = {
        plain(removed.isEmpty() ? u"%1 was not locked."_s.arg(church) : u"Nothing keeps people out of it any more."_s)};
    return account;
}

Account account_of_setting_aside(const QString& aside)
{
    return {
        .chip = u"Set aside"_s,
        .state = State::altered,
        .title = u"The church begins anew."_s,
        .lines = {{.words = words::where_set_aside(aside), .in_report = u"The damaged church file was set aside."_s},
                  plain(words::after_setting_aside()),
                  plain(u"Keep the damaged file until you have seen that all is there."_s)},
        .next = MenderAct::none};
}

Account account_of_recovery(const RecoveryFiles& files, WayIntoPlace way,
                            const std::vector<core::RecoveredTable>& tables)
{
    const bool whole = std::ranges::all_of(tables, words::came_whole);
    const QString count = core::counted(rows_of(tables), u"row"_s, u"rows"_s);
    Account account{.chip = whole ? u"Recovered"_s : u"Recovered in part"_s,
                    .state = whole ? State::contact : State::altered,
                    .title = whole ? u"All of it could be read: %1."_s.arg(count)
                                   : u"%1 could be read; something is lost."_s.arg(count),
                    .lines = {{.words = words::where_recovered(files.damaged, files.fresh),
                               .in_report = u"What could be read stands in a new church file; the damaged one was left "
                                            "as it is."_s},
                              plain(how_to_go_on(way))},
                    .next = way == WayIntoPlace::open ? MenderAct::put_in_place : MenderAct::check,
                    .makes_way = way == WayIntoPlace::open,
                    .recovered = files.fresh};
    for (auto group : {recovered_group(u"Not whole"_s, tables, false), recovered_group(u"Whole"_s, tables, true)}) {
        if (!group.lines.empty())
            account.groups.push_back(std::move(group));
    }
    return account;
}

Account account_of_placing(const QString& church, const core::Placement& placement, const QString& database,
                           const Findings& findings)
{
    const auto& mending = placement.mending;
    auto account = mending.refusal.isEmpty() ? account_of_mending(church, mending)
                                             : account_of_refusal(church, mending.refusal.split(u'\n'), findings);
    if (!mending.refusal.isEmpty()) {
        account.chip = u"Not mended yet"_s;
        account.title = u"%1: the recovered file is in place"_s.arg(church);
    } else if (mending.mended.empty()) {
        account.lines.erase(account.lines.begin()); // That nothing was changed holds for the mending alone.
    }
    std::vector<AccountLine> lines;
    for (const auto& line : words::where_put(placement, database))
        lines.push_back({.words = line, .in_report = line.section(u'\'', 0, 0) + u"…"_s});
    account.lines.insert(account.lines.begin(), lines.begin(), lines.end());
    return account;
}

} // namespace kindrel::desktop
