#pragma once

#include "core/church_recovery.h"
#include "core/mender.h"
#include "desktop/shell/palette.h"

namespace kindrel::desktop {

/// What can be done in the mender's window.
enum class MenderAct { none, check, mend, unlock, recover, put_in_place, set_aside };

/// A sentence, and what stands quietly beneath it.
struct AccountLine
{
    QString words;
    QString beneath = {};
    QString in_report = {}; ///< The sentence without what may name a person or this machine.
};

struct AccountGroup
{
    QString heading, explanation = {};
    std::vector<AccountLine> lines = {};
    MenderAct act = MenderAct::none; ///< What takes these away.
};

/// A damaged church file, and the new one for what can be read of it.
struct RecoveryFiles
{
    QString damaged, fresh;
};

/// What the window tells of a church: a page in words.
struct Account
{
    QString chip = {}; ///< The outcome in a word or two.
    State state = State::plain;
    QString title = {};
    std::vector<AccountLine> lines = {};
    std::vector<AccountGroup> groups = {};
    MenderAct next = MenderAct::check; ///< What helps most now.
    bool looked = false;               ///< The church was found and looked at, so that it may be worked on.
    bool mendable = false;             ///< There is something that mending cures.
    bool damaged = false;              ///< The church's own file is, so that it may be set aside.
    QString database = {};             ///< The church's own file; empty where there is none.
    bool makes_way = false;            ///< A recovered file may take the place of the church's own.
    QString recovered = {};            ///< That file; empty where none was recovered just now.
    QString data_root = {};            ///< Under which the church lies.
};

/// What the act takes away, a line each, as far as a box has room.
[[nodiscard]] QString found_for(const Account& account, MenderAct act);

[[nodiscard]] Account account_at_start();
[[nodiscard]] Account account_of_work(const QString& what, bool changes);
/// `why` tells what is missing: the data folder, the network or the choice of a church.
[[nodiscard]] Account account_of_no_place(const QString& why);
[[nodiscard]] Account account_of_no_church(const QString& church, const QString& file);
[[nodiscard]] Account account_of_failure(const QString& why);

/// `church` is its name in words.
[[nodiscard]] Account account_of_check(const QString& church, const core::Findings& findings);
/// Why nothing was done, one reason a line, and what was found besides.
[[nodiscard]] Account account_of_refusal(const QString& church, const QStringList& why, const core::Findings& findings);
[[nodiscard]] Account account_of_mending(const QString& church, const core::Mending& mending);
/// `removed` in words.
[[nodiscard]] Account account_of_unlocking(const QString& church, const QStringList& removed,
                                           const core::Findings& left);
/// What a new church file can be to the church: it was written in the place of the church's own, or may come there.
enum class WayIntoPlace { taken, open, closed };
[[nodiscard]] Account account_of_recovery(const RecoveryFiles& files, WayIntoPlace way,
                                          const std::vector<core::RecoveredTable>& tables);

[[nodiscard]] Account account_of_setting_aside(const QString& aside);
/// `database` is the church's own file; the findings are those that are left.
[[nodiscard]] Account account_of_placing(const QString& church, const core::Placement& placement,
                                         const QString& database, const core::Findings& findings);

} // namespace kindrel::desktop
