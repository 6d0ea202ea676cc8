#include "desktop/mender/mender_works.h"

#include "core/locks.h"
#include "core/mender_place.h"
#include "core/mender_words.h"
#include "core/open_church.h"
#include "people/mender_people.h"

#include <QFileInfo>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Folder;
using core::MenderPlace;

namespace {

core::Findings examine(MenderPlace& place)
{
    return core::examine_church(place, people::mender_checks());
}

/// Who holds what in the church, as far as it can be read.
QStringList holders(MenderPlace& place)
{
    QStringList lines;
    try {
        if (place.session)
            for (const auto& lock : core::Locks(*place.session, place.workstation, place.clock).all())
                lines += core::held_line(lock, core::DayOrder::day_first);
    } catch (const core::DatabaseError&) {
        // A church without lock tables is told by its findings.
    }
    return lines;
}

/// Claims the workstation for the church's mending; a refusal that tells who is inside when the program runs.
std::optional<Account> refusal_while_running(const MenderJob& job, MenderPlace& place)
{
    if (place.workstation.claim_single_instance(place.paths.folder(Folder::local_settings)))
        return std::nullopt;
    return account_of_refusal(job.church, QStringList{core::mender_words::running_here()} + holders(place),
                              examine(place));
}

Account with_place(const MenderJob& job, core::Workstation& workstation,
                   const std::function<Account(MenderPlace&)>& act)
{
    std::optional<MenderPlace> place;
    try {
        place.emplace(core::find_church_to_mend(job.request, workstation, job.clock));
    } catch (const core::FileError& error) {
        return account_of_no_place(error.text());
    }
    auto account = act(*place);
    if (account.looked)
        account.makes_way = core::gives_way(*place, account.damaged);
    account.data_root = place->paths.folder(Folder::data_root);
    if (const QString file = place->paths.database(); QFileInfo::exists(file))
        account.database = file;
    return account;
}

/// The edge at which every failure turns into an account.
Account at_the_church(const MenderJob& job, const std::function<Account(MenderPlace&)>& act)
{
    try {
        const auto workstation = job.workstation();
        return with_place(job, *workstation, act);
    } catch (const core::DatabaseError& error) {
        return account_of_failure(error.text());
    } catch (const core::FileError& error) {
        return account_of_failure(error.text());
    } catch (const std::exception& error) {
        return account_of_failure(QString::fromUtf8(error.what()));
    }
}

/// The same for a church that must be there.
Account in_the_church(const MenderJob& job, const std::function<Account(MenderPlace&)>& act)
{
    return at_the_church(job, [&](MenderPlace& place) {
        return core::church_present(place.paths) ? act(place)
                                                 : account_of_no_church(job.church, place.paths.database());
    });
}

} // namespace

Account check_church(const MenderJob& job)
{
    return in_the_church(job, [&](MenderPlace& place) { return account_of_check(job.church, examine(place)); });
}

Account mend_church(const MenderJob& job)
{
    return in_the_church(job, [&](MenderPlace& place) {
        if (const auto refusal = refusal_while_running(job, place))
            return *refusal;
        const auto mending = core::mend_church(place, people::mender_checks());
        return mending.refusal.isEmpty() ? account_of_mending(job.church, mending)
                                         : account_of_refusal(job.church, mending.refusal.split(u'\n'), examine(place));
    });
}

Account unlock_church(const MenderJob& job)
{
    return at_the_church(job, [&](MenderPlace& place) {
        if (const auto refusal = refusal_while_running(job, place))
            return *refusal;
        const auto removed = core::unlock_church(place);
        return account_of_unlocking(job.church, removed, examine(place));
    });
}

Account recover_church(const MenderJob& job, const RecoveryFiles& files, bool makes_way)
{
    return at_the_church(job, [&](MenderPlace& place) {
        if (const auto refusal = refusal_while_running(job, place))
            return *refusal;
        place.session.reset();
        const auto tables = core::recover_church(files.damaged, files.fresh);
        const QFileInfo own(place.paths.database());
        const bool taken = own.exists() && own == QFileInfo(files.fresh);
        const auto way = makes_way ? WayIntoPlace::open : WayIntoPlace::closed;
        return account_of_recovery(files, taken ? WayIntoPlace::taken : way, tables);
    });
}

Account set_church_aside(const MenderJob& job)
{
    return in_the_church(job, [&](MenderPlace& place) {
        if (const auto refusal = refusal_while_running(job, place))
            return *refusal;
        return account_of_setting_aside(core::set_database_aside(place));
    });
}

Account put_church_in_place(const MenderJob& job, const QString& recovered)
{
    return at_the_church(job, [&](MenderPlace& place) {
        if (const auto refusal = refusal_while_running(job, place))
            return *refusal;
        const auto placement = core::put_in_place(place, recovered, people::mender_checks());
        const auto left = placement.mending.refusal.isEmpty() ? placement.mending.left : examine(place);
        return account_of_placing(job.church, placement, place.paths.database(), left);
    });
}

} // namespace kindrel::desktop
