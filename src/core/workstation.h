#pragma once

#include <QSize>
#include <QString>

namespace kindrel::core {

/// What start-up must know of the machine and the desktop it runs on.
class Workstation
{
public:
    virtual ~Workstation() = default;
    /// Folder of the executable, ending in the separator.
    [[nodiscard]] virtual QString program_folder() const = 0;
    /// Where the data folder is sought when `local_data_drive.dat` names none, ending in the separator.
    [[nodiscard]] virtual QString default_data_drive() const = 0;
    /// The system's short date pattern, for example "d/MM/yyyy"; empty when no region is configured.
    [[nodiscard]] virtual QString short_date_pattern() const = 0;
    /// True for the first copy that asks; holds the claim until the object dies.
    [[nodiscard]] virtual bool claim_single_instance(const QString& local_settings) = 0;
    /// Null when there is no display.
    [[nodiscard]] virtual QSize display_size() const = 0;
    /// Number of colours as a power of two; 0 when there is no display.
    [[nodiscard]] virtual int display_depth() const = 0;
    /// Free bytes of the volume that holds the folder.
    [[nodiscard]] virtual qint64 free_bytes(const QString& folder) const = 0;
    /// The machine's name, as it stands in lock rows.
    [[nodiscard]] virtual QString name() const = 0;
    /// Whether a process of this machine has not ended yet.
    [[nodiscard]] virtual bool process_runs(qint64 process) const = 0;
};

} // namespace kindrel::core
