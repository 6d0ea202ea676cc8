#pragma once

#include "core/rights.h"

#include <QWidget>

#include <array>

class QCheckBox;
class QVBoxLayout;

namespace kindrel::desktop {

struct AreaGroup;

/// A tick box for each access area, in groups.
class AccessAreas : public QWidget
{
    Q_OBJECT

public:
    explicit AccessAreas(QWidget* parent = nullptr);

    void show_rights(const core::Rights& rights);
    [[nodiscard]] QCheckBox& box(core::Area area) { return *m_boxes[static_cast<std::size_t>(area)]; }

Q_SIGNALS:
    /// The person ticked or unticked an area.
    void ticked(core::Area area, bool granted);

private:
    [[nodiscard]] QVBoxLayout* make_group(const AreaGroup& group);
    void add_area(QVBoxLayout& column, core::Area area);

    std::array<QCheckBox*, core::area_count> m_boxes{};
};

} // namespace kindrel::desktop
