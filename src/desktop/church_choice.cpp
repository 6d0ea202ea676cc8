#include "desktop/church_choice.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int church_count = 7;

/// The data root of the seven churches, wherever the office itself works.
QString churches_root(const core::Office& office)
{
    if (office.mode == core::Mode::normal || office.mode == core::Mode::network)
        return office.paths.folder(core::Folder::data_root);
    const auto network = core::read_side_file(office.paths, core::side_files::network);
    if (network && network->flag("network"))
        return network->text("path");
    return office.paths.data_drive() + core::existing_name(office.paths.data_drive(), core::data_folder.toString());
}

bool is_set_up(const core::Office& office, int church)
{
    const core::Paths paths(office.paths.folder(core::Folder::program), office.paths.data_drive(),
                            churches_root(office), core::Mode::normal, church);
    return office.church == church || paths.exists(core::Folder::church, QLatin1String(core::side_files::set_up.name));
}

QStringList offered(const core::Office& office)
{
    QStringList names;
    for (int church = 1; church <= church_count; ++church)
        names += office.church_names.value(church - 1) + (is_set_up(office, church) ? QString() : u" (new)"_s);
    return names;
}

} // namespace

void load_another_church(Desk& desk)
{
    const core::Message question{.text = u"Load a New Church Database"_s,
                                 .more = u"Choose the church to work with. One marked (new) is created empty."_s,
                                 .caption = core::product.toString(),
                                 .icon = core::Icon::question};
    if (const auto place = desk.office.dialogue.choose(question, offered(desk.office)))
        desk.navigation.load_church(*place + 1);
}

void mark_as_set_up(const core::Office& office)
{
    const core::SideRecord mark(core::side_files::set_up);
    if (office.church <= church_count && !office.paths.exists(core::Folder::church, QLatin1String(mark.file().name)))
        core::write_side_file(office.paths, mark);
}

} // namespace kindrel::desktop
