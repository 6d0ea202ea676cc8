#pragma once

#include "apps/ctl_command.h"

namespace kindrel::apps {

/// A command line as it was understood.
struct CommandLine
{
    const Command* command = nullptr; ///< Null where none was named.
    Arguments arguments;              ///< Those of the program itself included.
    bool help = false;
    QString fault; ///< What is wrong with it; empty when nothing is.
};

/// `words` begins with the program's name.
[[nodiscard]] CommandLine parse(const QStringList& words);

[[nodiscard]] QString help_text();
[[nodiscard]] QString help_text(const Command& command);
/// Where to look after wrong usage; `command` is null where none was understood.
[[nodiscard]] QString usage_hint(const Command* command);

} // namespace kindrel::apps
