#include "core/mender_place.h"

#include "core/mender_obstacle.h"
#include "core/open_church.h"
#include "core/side_files.h"
#include "core/startup_steps.h"

#include <QFileInfo>

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

constexpr int own_churches = 7;

/// The settings of the network; a damaged file leaves the workstation to its own data.
SideRecord network_settings(const Paths& paths)
{
    try {
        return read_side_file(paths, side_files::network).value_or(SideRecord(side_files::network));
    } catch (const FileError&) {
        return SideRecord(side_files::network);
    }
}

/// The only church in use, or the first when none is.
int only_church(const Paths& local)
{
    const auto in_use = churches_in_use(local);
    if (in_use.size() > 1) {
        QStringList numbers;
        for (const int church : in_use)
            numbers += QString::number(church);
        throw FileError(u"Several churches are in use (%1): name one."_s.arg(numbers.join(u", ")));
    }
    return in_use.empty() ? 1 : in_use.front();
}

} // namespace

Paths church_paths(const Paths& local, int church)
{
    const SideRecord network = network_settings(local);
    const bool shared = network.flag("network") && church != booked_out_church;
    const Mode own = shared ? Mode::network : Mode::normal;
    const Mode mode = church == training_church ? Mode::training : church == booked_out_church ? Mode::booked_out : own;
    return {local.folder(Folder::program), local.data_drive(),
            shared ? network.text("path") : local.folder(Folder::data_root), mode, church};
}

std::vector<int> churches_in_use(const Paths& local)
{
    std::vector<int> in_use;
    for (int church = 1; church <= own_churches; ++church) {
        if (church_paths(local, church).exists(Folder::church, QLatin1String(side_files::set_up.name)))
            in_use.push_back(church);
    }
    return in_use;
}

void open_to_mend(MenderPlace& place)
{
    try {
        if (church_present(place.paths))
            place.session = connect_church(place.paths);
        else
            place.closed = mender_checks::missing(place.paths);
    } catch (const DatabaseError& error) {
        place.closed = mender_checks::closed(error);
    } catch (const FileError& error) {
        place.closed = mender_checks::closed(error);
    }
}

MenderPlace find_church_to_mend(const StartRequest& request, Workstation& workstation, Clock& clock)
{
    const Paths local = startup_steps::first_paths(request, workstation);
    if (!QFileInfo(local.folder(Folder::local_settings)).isDir())
        throw FileError(u"There is no data folder at '%1%2'."_s.arg(local.data_drive(), data_folder));
    const QString root = church_paths(local, std::max(request.church, 1)).folder(Folder::data_root);
    if (!QFileInfo(root).isDir())
        throw FileError(u"The network's data folder '%1' cannot be reached."_s.arg(root));
    const int church = request.church > 0 ? request.church : only_church(local);
    MenderPlace place{
        .paths = church_paths(local, church), .church = church, .workstation = workstation, .clock = clock};
    open_to_mend(place);
    return place;
}

} // namespace kindrel::core
