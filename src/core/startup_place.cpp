#include "core/startup_steps.h"

#include <QDir>
#include <QFileInfo>

#include <vector>

// The first half of start-up: the machine, the data folder, the network and the church.
namespace kindrel::core::startup_steps {

using namespace Qt::StringLiterals;

namespace {

#ifdef Q_OS_WIN
constexpr bool on_windows = true;
#else
constexpr bool on_windows = false;
#endif

/// Asks for the themed controls of the platform.
constexpr auto manifest = R"(<?xml version="1.0" encoding="UTF-8" standalone="yes"?>
<assembly xmlns="urn:schemas-microsoft-com:asm.v1" manifestVersion="1.0">
  <dependency>
    <dependentAssembly>
      <assemblyIdentity type="win32" name="Microsoft.Windows.Common-Controls" version="6.0.0.0"
                        processorArchitecture="*" publicKeyToken="6595b64144ccf1df" language="*"/>
    </dependentAssembly>
  </dependency>
</assembly>
)";

constexpr int shortest_data_drive = 3;
constexpr int own_churches = 7;

const QString network_unreachable =
    u"%1 is in Network mode and is unable to access the %1 Data Files on '%2'. The problem may be caused by "
    "one of the following:"_s;
const QString not_logged_on = u"(1) Your PC is not logged onto the network. (Network connection might be down)"_s;
const QString data_moved =
    u"(2) The %1 data files have been moved to a new location on the network server and you need to set a new "
    "path for this PC to access them."_s;
const QString no_privileges =
    u"(3) Your PC doesn't have read / write privileges to the folder on the network that has the %1 files."_s;
const QString not_mapped = u"(4) This computer has not been mapped yet for the drive that has the %1 network files"_s;
const QString leaving_network =
    u"%1 is now removing itself from the network, and setting access to a local database. You are unable to "
    "use any %1 data files that are saved on the network. You need to contact your network administrator and "
    "inform him of this message."_s;
const QString network_help =
    u"Full network installation instructions are available on the Kindrel installation CD in the document "
    "'Network Installation.Doc'"_s;
const QString booked_out_offer =
    u"%1 is unable to access the network. Do you wish to work on the booked out data that is held on this "
    "computer?"_s;
const QString data_folder_removed =
    u"Kindrel_10_Data' Please confirm this folder has not been removed from your computer, if it has then "
    "Kindrel will require to be installed again."_s;
const QString one_instance =
    u"Only one instance of Kindrel is permitted to run on a workstation. Kindrel is a complete network "
    "solution where many computers can run Kindrel at the same time."_s;
const QString wrong_separator =
    u"Currently you have Windows date configured to have a separator other than a forward slash, for example "
    "you have DD.MM.YYYY or DD-MM-YYYY, you need to configure your date separator to have DD/MM/YYYYY "
    "(forward slash) for Kindrel to correctly work. Kindrel is now going to shut down. After you have "
    "changed the Windows setting to a slash separator you will need to reboot Windows."_s;
const QString own_values_used = u"%1 uses its own values instead until the file is put right or saved anew."_s;

/// Empty when `local_data_drive.dat` names none.
QString stored_data_drive(const QString& program_folder)
{
    const auto content = read_file(program_folder + existing_name(program_folder, u"local_data_drive.dat"_s));
    QString line = QString::fromLocal8Bit(content.value_or(QByteArray()).split('\n').first()).trimmed();
    if (line.startsWith(QChar::ByteOrderMark))
        line.remove(0, 1);
    return line.size() < shortest_data_drive ? QString() : line;
}

Paths paths_at(const Office& office, const QString& root, Mode mode, int church)
{
    return {office.paths.folder(Folder::program), office.paths.data_drive(), root, mode, church};
}

QString local_root(const Office& office)
{
    return office.paths.data_drive() + existing_name(office.paths.data_drive(), data_folder.toString());
}

bool reachable(const Paths& network)
{
    try {
        if (!read_file(network.file(Folder::global, u"common.dat"_s)))
            return false;
        write_side_file(network, SideRecord(side_files::write_test));
        return true;
    } catch (const FileError&) {
        return false;
    }
}

QStringList why_unreachable(const QString& path)
{
    return {
        network_unreachable.arg(product, path),
        not_logged_on,
        data_moved.arg(product),
        no_privileges.arg(product),
        not_mapped.arg(product),
    };
}

/// The values hold for this start; when they cannot be written the next one tries again.
void write_if_possible(const Paths& paths, const SideRecord& record)
{
    try {
        write_side_file(paths, record);
    } catch (const FileError&) {
    }
}

bool chooses_booked_out(State& state)
{
    Office& office = state.office;
    const Paths booked_out = paths_at(office, local_root(office), Mode::booked_out, booked_out_church);
    return booked_out.exists(Folder::church, u"KR10_records.kdl"_s) &&
           office.dialogue.confirm(information(booked_out_offer.arg(product)), Answer::yes);
}

void leave_network(Office& office, SideRecord network)
{
    const QStringList lines = why_unreachable(network.text("path")) << leaving_network.arg(product);
    office.dialogue.show(information(lines.join(u'\n'), network_help));
    network.set_flag("network", false);
    network.set_text("path", {});
    write_if_possible(office.paths, network);
}

/// A command that runs by itself must not work on other data than it was meant for.
bool give_up_network(Office& office, const SideRecord& network)
{
    office.dialogue.show(information(why_unreachable(network.text("path")).join(u'\n')));
    return false;
}

/// The churches 1 to 7 that are in use.
std::vector<int> churches_in_use(const Office& office)
{
    std::vector<int> found;
    for (int church = 1; church <= own_churches; ++church) {
        if (paths_at(office, office.paths.folder(Folder::data_root), office.mode, church)
                .exists(Folder::church, QLatin1String(side_files::set_up.name)))
            found.push_back(church);
    }
    return found;
}

/// Nullopt when the person chose none.
std::optional<int> church_from_chooser(const Office& office, const std::vector<int>& churches)
{
    QStringList names;
    for (const int church : churches)
        names += office.church_names[church - 1];
    const auto place = office.dialogue.choose(
        {.text = u"Please choose the church to load"_s, .caption = product.toString(), .icon = Icon::question}, names);
    return place ? std::optional(churches[static_cast<std::size_t>(*place)]) : std::nullopt;
}

} // namespace

SideRecord read_or_default(Office& office, const SideFile& file)
{
    try {
        return read_side_file(office.paths, file).value_or(SideRecord(file));
    } catch (const FileError& error) {
        office.dialogue.show(information(error.text(), own_values_used.arg(product)));
        return SideRecord(file);
    }
}

SideRecord read_or_create(Office& office, const SideFile& file)
{
    SideRecord record = read_or_default(office, file);
    if (office.paths.exists(file.folder, QLatin1String(file.name)))
        return record;
    write_if_possible(office.paths, record);
    return record;
}

Paths first_paths(const StartRequest& request, const Workstation& workstation)
{
    const QString program = workstation.program_folder();
    QString drive = request.data_drive.isEmpty() ? stored_data_drive(program) : request.data_drive;
    if (drive.isEmpty())
        drive = workstation.default_data_drive();
    drive = as_folder(drive);
    return {program, drive, drive + existing_name(drive, data_folder.toString()), Mode::normal, 1};
}

bool write_manifest(State& state)
{
    const QString file = state.office.paths.file(Folder::program, u"kr10.exe.manifest"_s);
    if (!on_windows || QFileInfo::exists(file))
        return true;
    try {
        write_file(file, manifest);
    } catch (const FileError&) {
        // The screens look plainer; nothing else depends on it.
    }
    return true;
}

bool confirm_data_folder(State& state)
{
    const Paths& paths = state.office.paths;
    if (QFileInfo(paths.folder(Folder::local_settings)).isDir())
        return true;
    state.office.dialogue.show(information(u"Kindrel is unable to establish connection to its data folder at '"_s +
                                           paths.data_drive() + data_folder_removed));
    return false;
}

bool claim_single_instance(State& state)
{
    Office& office = state.office;
    if (office.workstation.claim_single_instance(office.paths.folder(Folder::local_settings)))
        return true;
    office.dialogue.show({.text = one_instance, .caption = u"System Information"_s, .icon = Icon::information});
    return false;
}

bool check_date_separator(State& state)
{
    const QString pattern = state.office.workstation.short_date_pattern();
    if (pattern.isEmpty() || pattern.contains(u'/'))
        return true;
    state.office.dialogue.show(information(wrong_separator));
    return false;
}

bool reach_network(State& state)
{
    Office& office = state.office;
    if (state.request.church == booked_out_church)
        return true; // The booked-out data lie on this computer.
    const SideRecord network =
        read_side_file(office.paths, side_files::network).value_or(SideRecord(side_files::network));
    if (!network.flag("network"))
        return true;
    const QString path = network.text("path");
    const Paths there = paths_at(office, path, Mode::network, 1);
    if (!path.isEmpty() && reachable(there)) {
        office.mode = Mode::network;
        office.paths = there;
        return true;
    }
    if (!state.on_desktop())
        return give_up_network(office, network);
    state.working_on_booked_out = chooses_booked_out(state);
    if (!state.working_on_booked_out)
        leave_network(office, network);
    return true;
}

bool read_church_names(State& state)
{
    SideRecord record = read_or_create(state.office, side_files::church_names);
    record.fill_blanks();
    for (const auto& field : side_files::church_names.fields)
        state.office.church_names += record.text(field.name);
    return true;
}

bool choose_church(State& state)
{
    Office& office = state.office;
    const int requested = state.request.church;
    if (state.working_on_booked_out) {
        office.church = booked_out_church;
    } else if (requested >= 1 && requested <= booked_out_church) {
        office.church = requested;
    } else {
        const std::vector<int> churches = churches_in_use(office);
        office.church = churches.empty() ? 1 : churches.front();
        if (churches.size() > 1 && state.on_desktop()) {
            const auto chosen = church_from_chooser(office, churches);
            if (!chosen)
                return false;
            office.church = *chosen;
        }
    }
    return true;
}

bool build_paths(State& state)
{
    Office& office = state.office;
    if (office.church == training_church)
        office.mode = Mode::training;
    else if (office.church == booked_out_church)
        office.mode = Mode::booked_out;
    office.paths = paths_at(office, office.paths.folder(Folder::data_root), office.mode, office.church);
    return true;
}

} // namespace kindrel::core::startup_steps
