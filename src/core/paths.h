#pragma once

#include <QStringList>

#include <array>

namespace kindrel::core {

/// How the started program works with its data; fixed for the life of an office.
enum class Mode { normal, network, training, booked_out };

enum class Folder {
    program,
    data_root,
    local_settings,
    church,
    roster_history,
    notebook,
    portrait,
    global,
    audio,
    wardline,
    images,
    letter,
    reports,
    custom,
    plugin_reports,
    plugin_letters,
    export_text,
    directory_setup
};
inline constexpr int folder_count = 18;

inline constexpr int training_church = 8;
inline constexpr int booked_out_church = 9;

/// The folder of the data drive under which everything lies.
inline constexpr QStringView data_folder = u"Kindrel_10_Data";

/// Where everything lies for one mode and church. Every folder ends in the native separator; those that exist are
/// given in the spelling under which they lie there, as it was when this object was made.
class Paths
{
public:
    /// `root` is the data root of normal and network mode: `Kindrel_10_Data` on the data drive, or the network path.
    Paths(const QString& program_folder, const QString& data_drive, const QString& root, Mode mode, int church);

    [[nodiscard]] QString folder(Folder folder) const { return m_folders[static_cast<std::size_t>(folder)]; }
    /// The file's path, in the spelling under which it lies there already (names are found without regard to case),
    /// else in the spelling given.
    [[nodiscard]] QString file(Folder folder, const QString& name) const;
    [[nodiscard]] bool exists(Folder folder, const QString& name) const;
    /// The church database, `KR10_records.kdl`.
    [[nodiscard]] QString database() const;
    [[nodiscard]] QString data_drive() const { return m_data_drive; }

private:
    QString m_data_drive;
    std::array<QString, folder_count> m_folders;
};

/// The name in every mixture of small and capital letters, as it is given first: two to the power of its letters.
[[nodiscard]] QStringList spellings(const QString& name);

/// The spelling of `name` that exists in `folder`, found without regard to case; `name` itself when there is none.
/// A name of several parts has them separated by "/".
[[nodiscard]] QString existing_name(const QString& folder, const QString& name);

} // namespace kindrel::core
