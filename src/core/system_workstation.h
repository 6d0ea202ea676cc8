#pragma once

#include "core/workstation.h"

#include <memory>

QT_BEGIN_NAMESPACE
class QLockFile;
QT_END_NAMESPACE

namespace kindrel::core {

/// The machine that the program runs on. The display's facts come from the desktop; a program without one gives none.
class SystemWorkstation : public Workstation
{
public:
    explicit SystemWorkstation(QSize display_size = {}, int display_depth = 0);
    ~SystemWorkstation() override;
    [[nodiscard]] QString program_folder() const override;
    [[nodiscard]] QString default_data_drive() const override;
    [[nodiscard]] QString short_date_pattern() const override;
    /// A later claim of the same object is granted: the program starts again to switch church.
    [[nodiscard]] bool claim_single_instance(const QString& local_settings) override;
    [[nodiscard]] QSize display_size() const override { return m_display_size; }
    [[nodiscard]] int display_depth() const override { return m_display_depth; }
    [[nodiscard]] qint64 free_bytes(const QString& folder) const override;
    [[nodiscard]] QString name() const override;
    [[nodiscard]] bool process_runs(qint64 process) const override;

private:
    QSize m_display_size;
    int m_display_depth;
    std::unique_ptr<QLockFile> m_claim;
};

} // namespace kindrel::core
