#pragma once

#include "core/office.h"
#include "core/settings_draft.h"

namespace kindrel::core {

inline constexpr int smallest_vision_letters = 6; ///< Points.
inline constexpr int largest_vision_letters = 48;
inline constexpr int longest_vision = 1000;
inline constexpr int longest_footer_line = 120;

/// The church's vision statement and how reports print it. Whatever refuses has said why.
class VisionSetup
{
public:
    /// Nullopt without the right.
    [[nodiscard]] static std::optional<VisionSetup> open(Office& office);

    /// All settings as they would be saved now. Only those of the vision statement are ever written.
    [[nodiscard]] Settings& settings() { return m_draft.edited; }
    [[nodiscard]] bool altered() const { return m_draft.altered(); }
    /// Writes what was altered and gives it to the office. Nothing is written when any of it is refused.
    [[nodiscard]] bool save();
    /// The stored name of the field that save() refused last.
    [[nodiscard]] QString faulty() const { return m_faulty; }

private:
    explicit VisionSetup(Office& office);
    [[nodiscard]] bool accepted();

    Office* m_office;
    SettingsDraft m_draft;
    QString m_faulty;
};

} // namespace kindrel::core
