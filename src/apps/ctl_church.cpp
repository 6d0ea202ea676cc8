#include "apps/ctl_command.h"
#include "apps/ctl_listing.h"

#include "core/install.h"
#include "core/side_files.h"
#include "people/address_book.h"
#include "sample/church.h"

namespace kindrel::apps {

using namespace Qt::StringLiterals;

namespace {

constexpr int most_families = 100'000;

int families_in(core::Session& session)
{
    for (const auto& total : people::family_totals(session)) {
        if (total.list == people::FamilyList::all)
            return total.count;
    }
    return 0;
}

/// Start-up finds a church by its marker; training and booked-out data have none.
void mark_as_in_use(const core::Office& office)
{
    if (office.mode == core::Mode::normal || office.mode == core::Mode::network)
        core::write_side_file(office.paths, core::SideRecord(core::side_files::set_up));
}

} // namespace

Status run_install(Context& context)
{
    const auto drive = context.arguments.value(u"data-drive"_s, context.workstation.default_data_drive());
    core::install(context.workstation.program_folder(), drive);
    context.out << u"The data folder is laid down at "_s << core::as_folder(drive) << core::data_folder << '\n';
    return Status::done;
}

Status run_make_church(Context& context)
{
    const auto families = context.arguments.number(u"families"_s);
    const auto seed = context.arguments.has(u"seed"_s) ? context.arguments.number(u"seed"_s) : 1;
    if (!families || *families < 1 || *families > most_families || !seed) {
        context.dialogue.show({u"--families is a number from 1 to %1, --seed a whole number."_s.arg(most_families)});
        return Status::wrong_usage;
    }
    auto& office = *context.office;
    if (const int there = families_in(*office.session)) {
        context.dialogue.show({u"%1 holds %2 families already, only an empty church can be filled."_s.arg(
            office.church_name, QString::number(there))});
        return Status::refused;
    }
    sample::fill_church(*office.session,
                        {.families = *families,
                         .seed = static_cast<quint32>(*seed),
                         .training = office.mode == core::Mode::training,
                         .today = office.clock.today()},
                        office.paths.folder(core::Folder::portrait), office.paths.folder(core::Folder::notebook));
    mark_as_in_use(office);
    context.out << office.church_name << u" now holds "_s << families_in(*office.session) << u" families.\n"_s;
    return Status::done;
}

Status run_totals(Context& context)
{
    Listing listing({{u"total"_s, u"Families"_s}, {u"count"_s, u"Count"_s}});
    for (const auto& total : people::family_totals(*context.office->session))
        listing.add({total.caption, total.count});
    listing.print(context.out, context.arguments.has(u"json"_s));
    return Status::done;
}

} // namespace kindrel::apps
