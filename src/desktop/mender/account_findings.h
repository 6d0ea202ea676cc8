#pragma once

#include "desktop/mender/account.h"

namespace kindrel::desktop {

/// A sentence that a report may show as it stands.
[[nodiscard]] AccountLine plain(const QString& sentence);
/// "1 finding", "3 findings".
[[nodiscard]] QString findings_in_words(std::size_t count);
/// The words for whoever sits at the window: without the commands of the terminal.
[[nodiscard]] QString without_commands(QString words);
/// A line for each finding, with its remedy beneath.
[[nodiscard]] std::vector<AccountLine> lines_of(const core::Findings& findings);
/// Adds the findings by what takes them away, and what they mean for the church: outcome and next act, whatever was
/// done before.
void judge(Account& account, const core::Findings& findings);

} // namespace kindrel::desktop
