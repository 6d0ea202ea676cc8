#include "apps/ctl_terminal.h"
#include "apps/mender_commands.h"

#include "core/mender_place.h"
#include "core/system_workstation.h"
#include "desktop/mender/mender_program.h"

#include <QCommandLineParser>
#include <QCoreApplication>

#include <algorithm>

using namespace kindrel;
using namespace Qt::StringLiterals;

namespace {

constexpr int done = 0, findings = 1, wrong_usage = 2;

QString help_text()
{
    return u"Usage: kindrel-mender [OPTIONS] check|mend|unlock|recover FILE|put-in-place FILE|set-aside\n\n"
           "Looks after a church's records that Kindrel cannot or must not open. Without a command it opens its window.\n\n"
           "  check              tell what is wrong; nothing is changed\n"
           "  mend               put it right, after a copy of the database was laid into the church's folder 'mended'\n"
           "  unlock             remove every lock and marker that keeps people out; make sure that nobody is inside\n"
           "  recover FILE       write what can be read of a damaged church file into FILE, a new church file\n"
           "  put-in-place FILE  set the damaged or empty church file aside, put the recovered FILE in its place, mend\n"
           "  set-aside          move a damaged church file away, so that Kindrel starts and a backup can be restored\n\n"
           "Options:\n"
           "  --data-drive DIR  the folder that holds Kindrel_10_Data (default: the workstation's own)\n"
           "  --church N        the church: 1 to 7, 8 for training data, 9 for booked-out data\n"
           "  --from FILE       the damaged church file (recover only; default: the church's own)\n"
           "  --json            the findings for programs (check only)\n"
           "  --remove-locks    unlock the church before mending it\n"
           "  --yes             ask nothing\n"
           "  --help            show this help\n\n"
           "The status is 0 when the church is sound, 1 when something is wrong, was refused or failed, 2 for wrong\n"
           "usage.\n"_s;
}

void declare_options(QCommandLineParser& parser)
{
    parser.addOptions({{u"data-drive"_s, {}, u"DIR"_s},
                       {u"church"_s, {}, u"N"_s},
                       {u"from"_s, {}, u"FILE"_s},
                       {u"json"_s, {}},
                       {u"yes"_s, {}},
                       {u"remove-locks"_s, {}},
                       {u"help"_s, {}}});
}

/// 0 where none is named, nullopt for what is no church.
std::optional<int> church_of(const QCommandLineParser& parser)
{
    if (!parser.isSet(u"church"_s))
        return 0;
    bool number = false;
    const int church = parser.value(u"church"_s).toInt(&number);
    const bool known = number && church >= 1 && church <= core::booked_out_church;
    return known ? std::optional(church) : std::nullopt;
}

bool has_display()
{
#if defined(Q_OS_WIN) || defined(Q_OS_MACOS)
    return true;
#else
    return !qEnvironmentVariableIsEmpty("DISPLAY") || !qEnvironmentVariableIsEmpty("WAYLAND_DISPLAY");
#endif
}

/// The place to begin with when the window is meant: there is a display, and nothing is asked for but a place.
std::optional<core::StartRequest> window_request(int& count, char** words)
{
    const QCoreApplication application(count, words);
    QCommandLineParser parser;
    declare_options(parser);
    if (!has_display() || !parser.parse(QCoreApplication::arguments()) || !parser.positionalArguments().isEmpty())
        return std::nullopt;
    const auto is_place = [](const QString& option) {
        return option == u"data-drive" || option == u"church";
    };
    const auto church = church_of(parser);
    if (!church || !std::ranges::all_of(parser.optionNames(), is_place))
        return std::nullopt;
    return core::StartRequest{core::Purpose::command_line, *church, parser.value(u"data-drive"_s)};
}

/// Nullopt where the command line cannot be understood; `fault` says why.
std::optional<apps::MenderOrder> order_of(const QCommandLineParser& parser, QString& fault)
{
    const auto words = parser.positionalArguments();
    apps::MenderOrder order{.command = apps::mender_command(words.value(0)),
                            .target = words.value(1),
                            .damaged = parser.value(u"from"_s),
                            .json = parser.isSet(u"json"_s),
                            .ask = !parser.isSet(u"yes"_s),
                            .remove_locks = parser.isSet(u"remove-locks"_s)};
    const auto church = church_of(parser);
    order.request = {core::Purpose::command_line, church.value_or(0), parser.value(u"data-drive"_s)};
    const int expected = apps::takes_file(order.command) ? 2 : 1;
    if (!order.command)
        fault = u"Say what to do: check, mend, unlock, recover FILE, put-in-place FILE or set-aside."_s;
    else if (words.size() != expected)
        fault =
            words.size() < expected ? u"The name of the church file is missing."_s : u"There are too many arguments."_s;
    else if (!church)
        fault = u"The church is a number from 1 to %1."_s.arg(core::booked_out_church);
    return fault.isEmpty() ? std::optional(order) : std::nullopt;
}

/// The edge at which every failure turns into a message and a status.
int run(const apps::MenderOrder& order, core::Dialogue& dialogue, QTextStream& out)
{
    core::SystemWorkstation workstation;
    core::SystemClock clock;
    try {
        auto place = core::find_church_to_mend(order.request, workstation, clock);
        const bool sound = order.command({order, place, dialogue, out});
        out.flush();
        return sound ? done : findings;
    } catch (const core::DatabaseError& error) {
        dialogue.show({u"The database could not be read or written."_s, error.text()});
    } catch (const core::FileError& error) {
        dialogue.show({error.text()});
    } catch (const std::exception& error) {
        dialogue.show({QString::fromUtf8(error.what())});
    }
    out.flush();
    return findings;
}

} // namespace

int main(int count, char** words)
{
    if (const auto request = window_request(count, words))
        return desktop::run_mender(count, words, *request);
    const QCoreApplication application(count, words);
    QCommandLineParser parser;
    declare_options(parser);
    QTextStream out(stdout);
    apps::TerminalDialogue dialogue;
    QString fault;
    if (!parser.parse(QCoreApplication::arguments()))
        fault = parser.errorText();
    else if (parser.isSet(u"help"_s)) {
        out << help_text();
        return done;
    }
    const auto order = fault.isEmpty() ? order_of(parser, fault) : std::nullopt;
    if (order)
        return run(*order, dialogue, out);
    dialogue.show({fault, u"See: kindrel-mender --help"_s});
    return wrong_usage;
}
