#include "desktop/mender/church_list.h"

#include "core/mender_place.h"
#include "core/open_church.h"
#include "core/startup_steps.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::Paths;

namespace {

core::SideRecord read_if_whole(const Paths& paths, const core::SideFile& file)
{
    try {
        return core::read_side_file(paths, file).value_or(core::SideRecord(file));
    } catch (const core::FileError&) {
        return core::SideRecord(file);
    }
}

QString name_of(int church, const core::SideRecord& names)
{
    if (church == core::training_church)
        return u"Training data"_s;
    if (church == core::booked_out_church)
        return u"Booked-out data"_s;
    const QString number = QString::number(church);
    const QString given = names.text("church_" + std::to_string(church));
    const bool own = !given.isEmpty() && given.simplified().compare(u"Church"_s + number, Qt::CaseInsensitive) != 0;
    return u"Church "_s + number + (own ? u", "_s + given : QString());
}

} // namespace

ChurchList list_churches(const core::StartRequest& request, const core::Workstation& workstation)
{
    const Paths local = core::startup_steps::first_paths(request, workstation);
    const auto names = read_if_whole(core::church_paths(local, 1), core::side_files::church_names);
    ChurchList list{.data_drive = local.data_drive(), .churches = {}};
    for (int church = 1; church <= core::booked_out_church; ++church) {
        const bool present = core::church_present(core::church_paths(local, church));
        list.churches.push_back({church, name_of(church, names), present});
    }
    const auto in_use = core::churches_in_use(local);
    if (request.church > 0)
        list.chosen = request.church;
    else if (in_use.size() < 2)
        list.chosen = in_use.empty() ? 1 : in_use.front();
    return list;
}

} // namespace kindrel::desktop
