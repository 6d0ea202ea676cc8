#include "apps/ctl_command.h"
#include "apps/ctl_listing.h"
#include "apps/ctl_progress.h"

#include "core/backup.h"
#include "core/files.h"
#include "core/restore.h"

#include <QFileInfo>

#include <algorithm>
#include <array>

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

/// What --without can leave out.
struct Part
{
    const char* name;
    bool core::BackupChoice::*choice;
};
constexpr std::array parts{
    Part{"pictures", &core::BackupChoice::with_pictures},
    Part{"documents", &core::BackupChoice::with_documents},
    Part{"letters", &core::BackupChoice::with_letters},
};

const QString moment_format = u"yyyy-MM-dd HH:mm"_s;

/// The whole path: the folder is kept in the church's settings and list of backups.
QString whole_path(const QString& path)
{
    return QFileInfo(path).absoluteFilePath();
}

/// Empty without the option. Throws FileError when the file holds no password: the backup would lie open.
QString backup_password(const Arguments& arguments)
{
    const auto file = arguments.value(u"backup-password-file"_s);
    if (!arguments.has(u"backup-password-file"_s))
        return {};
    const auto content = core::read_file(file);
    if (!content)
        throw core::FileError(u"The password file '%1' is not there."_s.arg(file));
    const auto password = QString::fromUtf8(content->split('\n').first()).remove(u'\r');
    if (password.isEmpty())
        throw core::FileError(u"The first line of the password file '%1' is empty."_s.arg(file));
    return password;
}

/// Nullopt when a word of the list is not known.
std::optional<core::BackupChoice> choice_from(const QString& list)
{
    core::BackupChoice choice;
    for (const auto& word : list.split(u',', Qt::SkipEmptyParts)) {
        const auto named = [&](const Part& part) {
            return word.trimmed() == QLatin1StringView(part.name);
        };
        const auto found = std::ranges::find_if(parts, named);
        if (found == parts.end())
            return std::nullopt;
        choice.*found->choice = false;
    }
    return choice;
}

/// What is wrong with the options of "backup"; empty when nothing is.
QString fault_of(const Arguments& arguments)
{
    if (arguments.has(u"encrypt"_s) != arguments.has(u"backup-password-file"_s))
        return u"--encrypt and --backup-password-file go together."_s;
    if (arguments.has(u"to"_s) && arguments.value(u"to"_s).isEmpty())
        return u"--to names a folder."_s;
    return choice_from(arguments.value(u"without"_s)) ? QString()
                                                      : u"--without is a list of pictures, documents and letters."_s;
}

Status refused(Context& context, const TerminalProgress& progress)
{
    if (progress.given_up())
        context.dialogue.show({u"Given up; nothing was changed."_s});
    return Status::refused;
}

void print_backup(QTextStream& out, const core::BackupContents& backup, const core::ChurchSummary& present)
{
    const auto& code = present.church_code;
    const bool foreign = !code.isEmpty() && code != backup.church.church_code;
    const auto church = foreign ? u"%1 (another church than this)"_s : u"%1"_s;
    out << u"Backup:     %1\n"_s.arg(backup.file) << u"Church:     %1\n"_s.arg(church.arg(backup.church.church_name))
        << u"Made:       %1\n"_s.arg(backup.made.toString(moment_format))
        << u"Encrypted:  %1\n\n"_s.arg(backup.encrypted ? u"yes"_s : u"no"_s);
}

void print_records(QTextStream& out, const core::BackupContents& backup, const core::ChurchSummary& present)
{
    Listing listing({{u"records"_s, u"Records"_s}, {u"backup"_s, u"In the backup"_s}, {u"present"_s, u"Now"_s}});
    for (const auto& kind : core::compared_kinds(backup.church, present))
        listing.add({kind.words, kind.then, kind.now});
    listing.print(out, false);
}

void print_files(QTextStream& out, const core::BackupContents& backup)
{
    Listing listing({{u"files"_s, u"Files"_s}, {u"count"_s, u"Number"_s}, {u"bytes"_s, u"Bytes"_s}});
    for (const auto& part : backup.parts)
        listing.add({part.words, part.files, part.bytes});
    out << '\n';
    listing.print(out, false);
}

} // namespace

Status run_backup(Context& context)
{
    const auto& arguments = context.arguments;
    if (const auto fault = fault_of(arguments); !fault.isEmpty()) {
        context.dialogue.show({fault});
        return Status::wrong_usage;
    }
    core::BackupRequest request{.password = backup_password(arguments),
                                .choice = *choice_from(arguments.value(u"without"_s))};
    if (arguments.has(u"to"_s))
        request.folder = whole_path(arguments.value(u"to"_s));
    TerminalProgress progress;
    const auto report = core::make_backup(*context.office, request, progress);
    if (!report)
        return refused(context, progress);
    context.out << u"The backup is made and compared: %1\n"_s.arg(report->contents.file);
    return Status::done;
}

Status run_backups(Context& context)
{
    Listing listing({{u"made"_s, u"Made"_s},
                     {u"bytes"_s, u"Bytes"_s},
                     {u"verified"_s, u"Verified"_s},
                     {u"present"_s, u"Present"_s},
                     {u"before_restore"_s, u"Before a restore"_s},
                     {u"file"_s, u"File"_s}});
    for (const auto& backup : core::backups_of(*context.office))
        listing.add({backup.made.toString(moment_format), backup.size, backup.verified, backup.present,
                     backup.before_restore, backup.file});
    listing.print(context.out, context.arguments.has(u"json"_s));
    return Status::done;
}

Status run_show_backup(Context& context)
{
    const auto file = whole_path(context.arguments.positional.front());
    const auto backup = core::read_backup(file, backup_password(context.arguments));
    const auto present = core::present_state(*context.office);
    print_backup(context.out, backup, present);
    print_records(context.out, backup, present);
    print_files(context.out, backup);
    return Status::done;
}

Status run_restore(Context& context)
{
    const core::RestoreRequest request{.file = whole_path(context.arguments.positional.front()),
                                       .password = backup_password(context.arguments)};
    TerminalProgress progress;
    const auto report = core::restore_backup(*context.office, request, progress);
    if (!report)
        return refused(context, progress);
    context.out << u"%1 is as it was on %2.\n"_s.arg(report->restored.church.church_name,
                                                     report->restored.made.toString(moment_format));
    if (report->before.isEmpty())
        context.out << u"The state before could not be backed up; its files lie as they were in %1\n"_s.arg(
            report->before_unchecked);
    else
        context.out << u"The state before is kept in %1\n"_s.arg(report->before);
    return Status::done;
}

} // namespace kindrel::apps
