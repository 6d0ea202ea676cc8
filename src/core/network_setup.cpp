#include "core/network_setup.h"

#include "core/entry.h"
#include "core/side_files.h"

namespace kindrel::core {

using namespace Qt::StringLiterals;

namespace {

const QString no_path = u"Please enter the path of the folder on the network that has the %1 files"_s;
const QString no_data_files = u"Unable to find the %1 Data Files on '%2'."_s;
const QString no_data_files_why =
    u"This must be the folder that holds the folder 'Global' with the file 'Common.Dat'. Is your PC logged onto the "
    "network, and the drive mapped?"_s;
const QString not_writable = u"Unable to write to '%1'."_s;
const QString not_writable_why =
    u"Your PC needs read / write privileges to the folder on the network that has the %1 files."_s;
const QString nothing_chosen = u"You need to choose what you wish to unlock before performing the unlock function."_s;
const QString note = u"The network setting is saved. It takes effect the next time %1 is started on this computer."_s;

Paths paths_under(const Office& office, const QString& path)
{
    return {office.paths.folder(Folder::program), office.paths.data_drive(), path, Mode::network, 1};
}

bool holds_data_files(const Paths& network)
{
    try {
        return read_side_file(network, side_files::common).has_value();
    } catch (const FileError&) {
        return false;
    }
}

} // namespace

NetworkSetup::NetworkSetup(Office& office) : m_office(&office)
{
    const auto network = read_side_file(office.paths, side_files::network).value_or(SideRecord(side_files::network));
    m_switched_on = m_stored_switch = network.flag("network");
    m_path = m_stored_path = network.text("path");
    refresh();
}

std::optional<NetworkSetup> NetworkSetup::open(Office& office)
{
    if (!permitted(office, Area::network_setup))
        return std::nullopt;
    try {
        return NetworkSetup(office);
    } catch (const FileError& error) {
        office.dialogue.show({error.text()});
        return std::nullopt;
    }
}

bool NetworkSetup::altered() const
{
    return m_switched_on != m_stored_switch || m_path != m_stored_path;
}

bool NetworkSetup::test() const
{
    Dialogue& dialogue = m_office->dialogue;
    if (m_path.isEmpty()) {
        dialogue.show({no_path.arg(product)});
        return false;
    }
    const Paths network = paths_under(*m_office, m_path);
    if (!holds_data_files(network)) {
        dialogue.show({no_data_files.arg(product, m_path), no_data_files_why});
        return false;
    }
    try {
        write_side_file(network, SideRecord(side_files::write_test));
        return true;
    } catch (const FileError& error) {
        dialogue.show({not_writable.arg(m_path), not_writable_why.arg(product) + u'\n' + error.text()});
        return false;
    }
}

bool NetworkSetup::save()
{
    if (m_switched_on && !test())
        return false;
    try {
        SideRecord record(side_files::network);
        record.set_flag("network", m_switched_on);
        record.set_text("path", m_path);
        write_side_file(m_office->paths, record);
    } catch (const FileError& error) {
        m_office->dialogue.show({error.text()});
        return false;
    }
    m_stored_switch = m_switched_on;
    m_stored_path = m_path;
    return true;
}

QString NetworkSetup::saved_note()
{
    return note.arg(product);
}

void NetworkSetup::refresh()
{
    m_locks = Locks(*m_office).all();
}

bool NetworkSetup::unlock(std::optional<int> place)
{
    if (!place || *place < 0 || *place >= static_cast<int>(m_locks.size())) {
        m_office->dialogue.show({nothing_chosen});
        return false;
    }
    const HeldLock& chosen = m_locks[static_cast<std::size_t>(*place)];
    Locks(*m_office).unlock(chosen.kind, chosen.key);
    refresh();
    return true;
}

} // namespace kindrel::core
