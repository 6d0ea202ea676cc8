#pragma once

#include "core/office.h"

#include <QHash>
#include <QStringList>
#include <QTextStream>

#include <optional>
#include <span>

namespace kindrel::apps {

/// What the program ends with.
enum class Status {
    done = 0,
    refused = 1,    ///< Refused or failed; the reason stands on standard error.
    wrong_usage = 2 ///< The command line could not be understood; nothing was done.
};

/// An option of a command or of the program. Without a value name it is a switch.
struct Option
{
    const char* name;
    const char* value;
    const char* summary;
};

/// What was typed behind the command.
struct Arguments
{
    QStringList positional;
    QHash<QString, QStringList> options; ///< Each with its values in order; a switch that was given has an empty one.

    [[nodiscard]] bool has(const QString& option) const { return options.contains(option); }
    [[nodiscard]] QString value(const QString& option, const QString& fallback = {}) const
    {
        return has(option) ? values(option).last() : fallback;
    }
    /// Of an option that may be given again and again.
    [[nodiscard]] QStringList values(const QString& option) const { return options.value(option); }
    /// Nullopt when it is not given or is no whole number.
    [[nodiscard]] std::optional<int> number(const QString& option) const;
};

/// What a command works with. Results go to `out`; the dialogue speaks on standard error.
struct Context
{
    const Arguments& arguments;
    core::Workstation& workstation;
    core::Dialogue& dialogue;
    QTextStream& out;
    core::Office* office; ///< Null for a command that opens no church.
};

/// What must be there before a command can run.
enum class Needs { nothing, church, church_and_fonts };

struct Command
{
    const char* name;
    const char* arguments; ///< As the help shows them.
    const char* summary;
    const char* details;
    Needs needs;
    std::optional<core::Area> area; ///< The right that the person must have.
    int positional;                 ///< How many arguments it takes, no more and no fewer.
    std::span<const Option> options;
    Status (*run)(Context&);
};

[[nodiscard]] std::span<const Command> commands();

// The commands, by the files that hold them.
[[nodiscard]] Status run_install(Context& context);
[[nodiscard]] Status run_make_church(Context& context);
[[nodiscard]] Status run_totals(Context& context);
[[nodiscard]] Status run_families(Context& context);
[[nodiscard]] Status run_family(Context& context);
[[nodiscard]] Status run_people(Context& context);
[[nodiscard]] Status run_reports(Context& context);
[[nodiscard]] Status run_report(Context& context);
[[nodiscard]] Status run_weekly_report(Context& context);
[[nodiscard]] Status run_backup(Context& context);
[[nodiscard]] Status run_backups(Context& context);
[[nodiscard]] Status run_show_backup(Context& context);
[[nodiscard]] Status run_restore(Context& context);
[[nodiscard]] Status run_copy_church(Context& context);

} // namespace kindrel::apps
