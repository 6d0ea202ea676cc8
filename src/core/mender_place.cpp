#include "core/mender_place.h"

#include "core/open_church.h"
#include "core/side_files.h"
#include "core/startup_steps.h"

#include <QFileInfo>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr int own_churches = 7;

Paths paths_at(const Paths& from, const QString& root, Mode mode, int church)
{
    return {from.folder(Folder::program), from.data_drive(), root, mode, church};
}

/// The settings of the network; a damaged file leaves the workstation to its own data.
SideRecord network_settings(const Paths& paths)
{
    try {
        return read_side_file(paths, side_files::network).value_or(SideRecord(side_files::network));
    } catch (const FileError&) {
        return SideRecord(side_files::network);
    }
}

Mode mode_of(int church, Mode otherwise)
{
    if (church == training_church)
        return Mode::training;
    return church == booked_out_church ? Mode::booked_out : otherwise;
}

/// The only church in use, or the first when none is.
int only_church(const Paths& paths, Mode mode)
{
    QStringList in_use;
    for (int church = 1; church <= own_churches; ++church) {
        if (paths_at(paths, paths.folder(Folder::data_root), mode, church)
                .exists(Folder::church, QLatin1String(side_files::set_up.name)))
            in_use += QString::number(church);
    }
    if (in_use.size() > 1)
        throw FileError(u"Several churches are in use (%1): name one."_s.arg(in_use.join(u", ")));
    return in_use.isEmpty() ? 1 : in_use.first().toInt();
}

void open(MenderPlace& place)
{
    try {
        if (church_present(place.paths))
            place.session = connect_church(place.paths);
        else
            place.why_closed = u"'%1' is missing."_s.arg(place.paths.database());
    } catch (const DatabaseError& error) {
        place.why_closed = error.text();
    } catch (const FileError& error) {
        place.why_closed = error.text();
    }
}

} // namespace

MenderPlace find_church_to_mend(const StartRequest& request, Workstation& workstation, Clock& clock)
{
    Paths paths = startup_steps::first_paths(request, workstation);
    if (!QFileInfo(paths.folder(Folder::local_settings)).isDir())
        throw FileError(u"There is no data folder at '%1%2'."_s.arg(paths.data_drive(), data_folder));
    const SideRecord network = network_settings(paths);
    const bool shared = network.flag("network") && request.church != booked_out_church;
    if (shared)
        paths = paths_at(paths, network.text("path"), Mode::network, 1);
    if (!QFileInfo(paths.folder(Folder::data_root)).isDir())
        throw FileError(u"The network's data folder '%1' cannot be reached."_s.arg(network.text("path")));
    const Mode mode = shared ? Mode::network : Mode::normal;
    const int church = request.church > 0 ? request.church : only_church(paths, mode);
    MenderPlace place{.paths = paths_at(paths, paths.folder(Folder::data_root), mode_of(church, mode), church),
                      .church = church,
                      .workstation = workstation,
                      .clock = clock};
    open(place);
    return place;
}

} // namespace kindrel::core
