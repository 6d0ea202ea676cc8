#include "people/move_files.h"

#include "core/files.h"
#include "people/person_files.h"

#include <QDirIterator>
#include <QHash>

#include <algorithm>
#include <map>

namespace kindrel::people {

using namespace Qt::StringLiterals;

namespace {

/// A copy that was cut off lies beside its file under a longer name.
const QString unfinished = u".unfinished"_s;

struct Found
{
    std::size_t which; ///< Of the wanted ones.
    QString path;
    bool whole;
};

/// Which of these files lie in their folders. One pass over each folder: looking for one name that is not there takes
/// as long.
std::vector<Found> lying(const core::Paths& paths, const std::vector<OwnFile>& wanted)
{
    std::map<core::Folder, QHash<QString, std::size_t>> folders;
    for (std::size_t i = 0; i < wanted.size(); ++i)
        folders[wanted[i].folder].insert(wanted[i].name.toLower(), i);
    std::vector<Found> found;
    for (const auto& [folder, names] : folders) {
        for (QDirIterator files(paths.folder(folder), QDir::Files | QDir::Hidden); files.hasNext();) {
            const auto path = files.next();
            const auto name = files.fileName().toLower();
            const auto end = name.indexOf(unfinished);
            if (const auto match = names.constFind(name.left(end)); match != names.constEnd())
                found.push_back({*match, path, end < 0});
        }
    }
    return found;
}

std::vector<OwnFile> files_of(int surname_id, const QList<int>& person_ids)
{
    auto files = surname_id > 0 ? files_of_family(surname_id) : std::vector<OwnFile>();
    for (const int person : person_ids)
        std::ranges::move(files_of_person(person), std::back_inserter(files));
    return files;
}

} // namespace

void copy_own_files(const core::Paths& here, const core::Paths& there, const Passage& passage)
{
    const auto from = files_of(passage.from, passage.people.keys());
    const auto to = files_of(passage.to, passage.people.values());
    for (const auto& left : lying(there, to))
        core::remove_file(left.path);
    auto found = lying(here, from);
    // Of two files whose names differ in case alone, the one under the program's own spelling is the one it shows.
    std::ranges::partition(found, [&](const Found& file) { return file.path.endsWith(u'/' + from[file.which].name); });
    QSet<std::size_t> copied;
    for (const auto& [which, path, whole] : found) {
        if (!whole || copied.contains(which))
            continue;
        const auto& [folder, name] = to[which];
        core::make_folder(there.folder(folder));
        core::copy_file(path, there.folder(folder) + name);
        copied.insert(which);
    }
}

void remove_left_files(const Place& place, int surname_id, const QList<int>& person_ids)
{
    const auto people = present_people(place.session, person_ids);
    auto gone = person_ids;
    gone.removeIf([&](int person) { return people.contains(person); });
    const bool family_stays = present_families(place.session, {surname_id}).contains(surname_id);
    for (const auto& left : lying(place.paths, files_of(family_stays ? 0 : surname_id, gone)))
        core::remove_file(left.path);
}

} // namespace kindrel::people
