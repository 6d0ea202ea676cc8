#include "apps/ctl_command_line.h"
#include "apps/ctl_terminal.h"

#include "core/entry.h"
#include "core/files.h"
#include "core/startup.h"
#include "core/system_workstation.h"

#include <QGuiApplication>

#include <memory>

using namespace kindrel;
using namespace Qt::StringLiterals;

namespace {

QStringList words_of(int count, char** words)
{
    QStringList all;
    for (int i = 0; i < count; ++i)
        all += QString::fromLocal8Bit(words[i]);
    return all;
}

/// Pages are drawn without a display, so a broken one cannot stop a report.
std::unique_ptr<QCoreApplication> application_for(apps::Needs needs, int& count, char** words)
{
    if (needs != apps::Needs::church_and_fonts)
        return std::make_unique<QCoreApplication>(count, words);
    if (!qEnvironmentVariableIsSet("QT_QPA_PLATFORM"))
        qputenv("QT_QPA_PLATFORM", "offscreen");
    return std::make_unique<QGuiApplication>(count, words);
}

apps::Status run_in_church(const apps::CommandLine& line, apps::Context& context)
{
    core::SystemClock clock;
    core::SilentProgress progress;
    const core::StartRequest request{core::Purpose::command_line, line.arguments.number(u"church"_s).value_or(0),
                                     line.arguments.value(u"data-drive"_s)};
    const auto office = core::start_up(request, context.workstation, context.dialogue, clock, progress);
    if (!office || (line.command->area && !core::permitted(*office, *line.command->area)))
        return apps::Status::refused;
    context.office = office.get();
    const auto status = line.command->run(context);
    context.office = nullptr;
    return status;
}

/// The edge at which every failure turns into a message and a status.
apps::Status run(const apps::CommandLine& line, core::Dialogue& dialogue, QTextStream& out)
{
    core::SystemWorkstation workstation;
    apps::Context context{line.arguments, workstation, dialogue, out, nullptr};
    try {
        const bool alone = line.command->needs == apps::Needs::nothing;
        const auto status = alone ? line.command->run(context) : run_in_church(line, context);
        out.flush();
        if (out.status() == QTextStream::Ok)
            return status;
        dialogue.show({u"The result could not be written to standard output."_s});
    } catch (const core::DatabaseError& error) {
        dialogue.show({u"The database could not be read or written."_s, error.text()});
    } catch (const core::FileError& error) {
        dialogue.show({error.text()});
    } catch (const std::exception& error) {
        dialogue.show({QString::fromUtf8(error.what())});
    }
    return apps::Status::refused;
}

} // namespace

int main(int count, char** words)
{
    const auto line = apps::parse(words_of(count, words));
    QTextStream out(stdout);
    if (line.fault.isEmpty() && line.help) {
        out << (line.command ? apps::help_text(*line.command) : apps::help_text());
        out.flush();
        return static_cast<int>(out.status() == QTextStream::Ok ? apps::Status::done : apps::Status::refused);
    }
    const auto questions = line.arguments.has(u"yes"_s) ? apps::Questions::answered_yes : apps::Questions::asked;
    apps::TerminalDialogue dialogue(line.arguments.value(u"password-file"_s), questions);
    auto status = apps::Status::wrong_usage;
    if (line.fault.isEmpty()) {
        const auto application = application_for(line.command->needs, count, words);
        status = run(line, dialogue, out);
    } else {
        dialogue.show({line.fault});
    }
    if (status == apps::Status::wrong_usage)
        dialogue.show({apps::usage_hint(line.command)});
    return static_cast<int>(status);
}
