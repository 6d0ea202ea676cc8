#include "core/mender_checks.h"

#include "core/backup_files.h"
#include "core/restore_swap.h"
#include "core/side_files.h"

#include <QDirIterator>
#include <QFileInfo>

#include <algorithm>
#include <array>

// The church's folder and the side files.
namespace kindrel::core::mender_checks {

using namespace Qt::StringLiterals;

namespace {

constexpr std::array settings_files{
    &side_files::church_names, &side_files::sounds,     &side_files::common,           &side_files::labels,
    &side_files::backup,       &side_files::viewer,     &side_files::email_delay,      &side_files::tracking,
    &side_files::network,      &side_files::set_up,     &side_files::workstation_logo, &side_files::map_specification,
    &side_files::map_land,     &side_files::map_layers,
};

bool has_file(const Paths& paths, const SideFile& file)
{
    return paths.exists(file.folder, QLatin1String(file.name));
}

bool damaged(const Paths& paths, const SideFile& file)
{
    const auto content = read_file(paths.file(file.folder, QLatin1String(file.name)));
    return content && content->size() != file.length;
}

bool readable(const SideField& field, const QByteArray& content)
{
    const QByteArray part = content.mid(field.offset, field.length);
    const auto odd = [](char c) {
        return c > '\0' && c < ' ';
    };
    return part.size() == field.length && (field.type != SideType::text || std::ranges::none_of(part, odd));
}

/// The fields that are whole, and the program's own values for the others.
SideRecord salvaged(const SideFile& file, const QByteArray& content)
{
    QByteArray bytes = SideRecord(file).bytes();
    for (const auto& field : file.fields) {
        if (readable(field, content))
            bytes.replace(field.offset, field.length, content.mid(field.offset, field.length));
    }
    return {file, bytes};
}

/// What a cut-off copy, rotation or compaction leaves behind.
QStringList leftovers(const Paths& paths)
{
    struct Where
    {
        QString folder;
        QStringList patterns;
    };
    const QString unfinished = u"*.unfinished*"_s;
    QStringList found;
    for (const auto& [folder, patterns] :
         {Where{paths.folder(Folder::church), {unfinished, u"compact.kdl"_s}},
          Where{own_backup_folder(paths, 1), {unfinished, u"systembackup.new"_s}},
          Where{paths.file(Folder::church, u"compact"_s), {unfinished}},
          Where{paths.file(Folder::church, u"mended"_s), {unfinished}},
          Where{paths.folder(Folder::portrait), {unfinished}}, Where{paths.folder(Folder::notebook), {unfinished}}}) {
        for (QDirIterator files(folder, patterns, QDir::Files | QDir::Hidden); files.hasNext();)
            found += files.next();
    }
    return found;
}

/// Works on each, also when it fails with some of them; throws one FileError in the end then.
template <class Each, class Work>
void on_each(const Each& all, const Work& work)
{
    QStringList failures;
    for (const auto& one : all) {
        try {
            work(one);
        } catch (const FileError& error) {
            failures += error.text();
        }
    }
    if (!failures.isEmpty())
        throw FileError(failures.join(u'\n'));
}

/// The damaged content is kept first, and not kept again and again where the file cannot be written.
void renew(MenderPlace& place, const SideFile& file)
{
    const QString path = place.paths.file(file.folder, QLatin1String(file.name));
    const auto content = read_file(path);
    const QString copy = mended_place(place, QFileInfo(path).fileName());
    write_file(copy, *content);
    try {
        keep_private(copy);
        write_side_file(place.paths, salvaged(file, *content));
    } catch (const FileError&) {
        remove_file(copy);
        throw;
    }
}

} // namespace

Findings examine_markers(MenderPlace& place)
{
    Findings findings;
    if (has_file(place.paths, side_files::busy))
        findings.push_back(
            {u"markers"_s,
             u"The marker 'lock.dat' keeps everybody out: a backup, restore, compaction or booking runs, "
             "or one was cut off."_s,
             1, Cure::unlock, u"When none runs, unlock the church."_s});
    if (has_file(place.paths, side_files::opening))
        findings.push_back({u"markers"_s,
                            u"The marker 'security.dat' keeps everybody out: a workstation is entering, or was cut off "
                            "while it did."_s,
                            1, Cure::unlock, u"When nobody is entering, unlock the church."_s});
    return findings;
}

Findings examine_leftovers(MenderPlace& place)
{
    Findings findings;
    const auto files = leftovers(place.paths);
    if (!files.isEmpty())
        findings.push_back({u"leftovers"_s,
                            u"%1 of work that was cut off: %2"_s.arg(
                                counted(static_cast<int>(files.size()), u"unfinished file"_s, u"unfinished files"_s),
                                QFileInfo(files.first()).fileName()),
                            static_cast<int>(files.size()), Cure::mend, u"Moved into the folder 'mended'."_s});
    if (restore_unsettled(place.paths))
        findings.push_back({u"leftovers"_s, u"A restore was cut off."_s, 1, Cure::mend,
                            u"It is brought to its end, or taken back where the database is still the old one."_s});
    return findings;
}

void mend_leftovers(MenderPlace& place)
{
    on_each(leftovers(place.paths), [&](const QString& file) {
        const QFileInfo left(file);
        if (left.dir().dirName().compare(u"mended"_s, Qt::CaseInsensitive) == 0)
            remove_file(file); // Of an earlier mending, whose copy is not needed.
        else
            move_privately(file, mended_place(place, left.fileName().replace(u".unfinished"_s, u" unfinished"_s)));
    });
}

Findings examine_side_files(MenderPlace& place)
{
    Findings findings;
    for (const auto* file : settings_files) {
        if (damaged(place.paths, *file))
            findings.push_back(
                {u"side_files"_s,
                 u"The settings file '%1' is damaged: it has a wrong length."_s.arg(QLatin1String(file->name)), 1,
                 Cure::mend,
                 u"What can be read of it is kept and the rest gets the program's own values; the "
                 "damaged file is moved into the folder 'mended'."_s});
    }
    return findings;
}

void mend_side_files(MenderPlace& place)
{
    on_each(settings_files, [&](const SideFile* file) {
        if (damaged(place.paths, *file))
            renew(place, *file);
    });
}

} // namespace kindrel::core::mender_checks
