#include "apps/ctl_command.h"
#include "apps/ctl_progress.h"

#include "core/copy_church.h"
#include "core/open_church.h"
#include "core/startup.h"

#include <QDir>
#include <QFileInfo>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

/// Nullopt when it is no church's number; 0 leaves the choice to start-up.
std::optional<int> source_church(const Arguments& arguments)
{
    if (!arguments.has(u"from"_s))
        return arguments.number(u"church"_s).value_or(0);
    const auto number = arguments.number(u"from"_s);
    return number && *number >= 1 && *number <= core::booked_out_church ? number : std::nullopt;
}

QString fault_of(const Arguments& arguments)
{
    if (arguments.value(u"to"_s).isEmpty())
        return u"--to names where the church is copied to."_s;
    return source_church(arguments) ? QString() : u"--from is a church's number from 1 to 9."_s;
}

/// What is left to do for those who wish to go on with the copy.
QString next_step(const core::Office& office, const core::CopyEnd& to)
{
    const auto folder = QDir::toNativeSeparators(office.paths.folder(core::Folder::church));
    const auto named = core::connection_file.toString();
    if (!to.connection.isEmpty())
        return u"To go on with the copy, write the server's keywords into '%1%2' and put the church file away."_s.arg(
            folder, named);
    const auto own = office.paths.database();
    const bool in_place = QFileInfo(to.file) == QFileInfo(own);
    return u"To go on with the copy, "_s + (in_place ? QString() : u"put it at '%1' and "_s.arg(own)) +
           u"see that there is no '%1%2'."_s.arg(folder, named);
}

Status copy(Context& context, core::Office& office)
{
    const core::CopyRequest request{.to = core::copy_end(context.arguments.value(u"to"_s)),
                                    .replace = context.arguments.has(u"replace"_s)};
    TerminalProgress progress;
    const auto report = core::copy_church(office, request, progress);
    if (report) {
        context.out << u"%1 is copied and compared: %2 tables with %3 rows.\n"_s.arg(
                           office.church_name, QString::number(report->tables), QString::number(report->rows))
                    << next_step(office, request.to) << '\n';
        return Status::done;
    }
    if (progress.given_up())
        context.dialogue.show({u"Given up; there is no copy."_s});
    return Status::refused;
}

} // namespace

Status run_copy_church(Context& context)
{
    if (const auto fault = fault_of(context.arguments); !fault.isEmpty()) {
        context.dialogue.show({fault});
        return Status::wrong_usage;
    }
    core::SystemClock clock;
    core::SilentProgress silent;
    const core::StartRequest request{core::Purpose::command_line, *source_church(context.arguments),
                                     context.arguments.value(u"data-drive"_s)};
    const auto office = core::start_up(request, context.workstation, context.dialogue, clock, silent);
    return office ? copy(context, *office) : Status::refused;
}

} // namespace kindrel::apps
