#include "apps/ctl_command_line.h"

#include <QCommandLineParser>

#include <algorithm>
#include <array>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

/// Understood before the command as well as behind it.
constexpr std::array program_options{
    Option{"data-drive", "DIR", "the folder that holds Kindrel_10_Data (default: the workstation's own)"},
    Option{"church", "N", "the church: 1 to 7, 8 for training data, 9 for booked-out data (default: the one in use)"},
    Option{"password-file", "FILE", "the password's file, where the church asks for one (default: standard input)"},
    Option{"help", nullptr, "show this help, or that of the command"},
};

constexpr int option_column = 31;

void add(QCommandLineParser& parser, std::span<const Option> options)
{
    for (const auto& option : options)
        parser.addOption(
            {QString::fromLatin1(option.name), QString::fromLatin1(option.summary), QString::fromLatin1(option.value)});
}

void take(Arguments& arguments, const QCommandLineParser& parser, std::span<const Option> options)
{
    for (const auto& option : options) {
        const auto name = QString::fromLatin1(option.name);
        if (parser.isSet(name))
            arguments.options.insert(name, option.value ? parser.values(name) : QStringList{QString()});
    }
}

const Command* find_command(const QString& name)
{
    const auto all = commands();
    const auto found = std::ranges::find_if(all, [&](const auto& c) { return name == QLatin1StringView(c.name); });
    return found == all.end() ? nullptr : &*found;
}

bool number_fits(const Arguments& arguments, const QString& option, int least, int most)
{
    const auto number = arguments.number(option);
    return !arguments.has(option) || (number && *number >= least && *number <= most);
}

/// What stands behind the command; `words` begins with its name.
void parse_command(CommandLine& line, const QStringList& words)
{
    QCommandLineParser parser;
    add(parser, program_options);
    add(parser, line.command->options);
    if (!parser.parse(words)) {
        line.fault = parser.errorText();
        return;
    }
    take(line.arguments, parser, program_options);
    take(line.arguments, parser, line.command->options);
    line.arguments.positional = parser.positionalArguments();
    line.help = line.arguments.has(u"help"_s);
    if (!line.help && line.arguments.positional.size() != line.command->positional)
        line.fault = line.arguments.positional.size() < line.command->positional ? u"An argument is missing."_s
                                                                                 : u"There are too many arguments."_s;
}

QString option_lines(std::span<const Option> options)
{
    QString text;
    for (const auto& option : options) {
        auto shown = u"  --"_s + QString::fromLatin1(option.name);
        if (option.value)
            shown += u' ' + QString::fromLatin1(option.value);
        text += shown.leftJustified(option_column) + QString::fromLatin1(option.summary) + u'\n';
    }
    return text;
}

QString usage_of(const Command& command)
{
    return u"Usage: kindrelctl [OPTIONS] %1 %2"_s
        .arg(QLatin1StringView(command.name), QLatin1StringView(command.arguments))
        .trimmed();
}

} // namespace

std::optional<int> Arguments::number(const QString& option) const
{
    bool whole = false;
    const int number = value(option).toInt(&whole);
    return whole ? std::optional(number) : std::nullopt;
}

CommandLine parse(const QStringList& words)
{
    CommandLine line;
    QCommandLineParser parser;
    parser.setOptionsAfterPositionalArgumentsMode(QCommandLineParser::ParseAsPositionalArguments);
    add(parser, program_options);
    if (!parser.parse(words)) {
        line.fault = parser.errorText();
        return line;
    }
    take(line.arguments, parser, program_options);
    line.help = line.arguments.has(u"help"_s);
    const auto rest = parser.positionalArguments();
    if (rest.isEmpty()) {
        line.fault = line.help ? QString() : u"No command was given."_s;
        return line;
    }
    line.command = find_command(rest.front());
    if (!line.command) {
        line.fault = u"There is no command \"%1\"."_s.arg(rest.front());
        return line;
    }
    if (!line.help)
        parse_command(line, rest);
    if (line.fault.isEmpty() && !number_fits(line.arguments, u"church"_s, 1, core::booked_out_church))
        line.fault = u"The church is a number from 1 to %1."_s.arg(core::booked_out_church);
    return line;
}

QString help_text()
{
    auto text = u"Usage: kindrelctl [OPTIONS] COMMAND …\n\n"
                "Looks into the records of a church and writes its reports, without the desktop.\n\nCommands:\n"_s;
    for (const auto& command : commands())
        text += u"  %1%2\n"_s.arg(QString::fromLatin1(command.name).leftJustified(option_column - 2),
                                  QString::fromLatin1(command.summary));
    return text + u"\nOptions:\n"_s + option_lines(program_options) +
           u"\n\"kindrelctl COMMAND --help\" explains a command. Results go to standard output, messages to standard\n"
           "error. The status is 0 when everything was done, 1 when it was refused or failed, 2 for wrong usage.\n"_s;
}

QString help_text(const Command& command)
{
    return usage_of(command) + u"\n\n"_s + QString::fromLatin1(command.details) + u"\n\nOptions:\n"_s +
           option_lines(command.options) + option_lines(program_options);
}

QString usage_hint(const Command* command)
{
    if (!command)
        return u"See: kindrelctl --help"_s;
    return usage_of(*command) + u"\nSee: kindrelctl %1 --help"_s.arg(QLatin1StringView(command->name));
}

} // namespace kindrel::apps
