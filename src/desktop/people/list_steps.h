#pragma once

#include "desktop/people/step_panel.h"
#include "desktop/shell/desk.h"

class QCheckBox;
class QLineEdit;

namespace kindrel::desktop {

/// A part of the list: by the letters of the surnames, and by places.
class RangePanel : public StepPanel
{
    Q_OBJECT

public:
    explicit RangePanel(TaggingSheet& sheet);
    void focus_first() override;
    [[nodiscard]] bool is_set() const override { return sheet().plan.range != people::ListRange{}; }

private:
    void take();

    QLineEdit *m_first_letter, *m_last_letter, *m_first, *m_last;
};

/// Leaves out people without what is to be printed.
class SuppressPanel : public StepPanel
{
    Q_OBJECT

public:
    SuppressPanel(Desk& desk, TaggingSheet& sheet);
    void focus_first() override;
    [[nodiscard]] bool is_set() const override { return sheet().plan.needs.any(); }

private:
    std::vector<QCheckBox*> m_needs;
};

} // namespace kindrel::desktop
