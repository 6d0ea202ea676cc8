#pragma once

#include "desktop/people/filter_part.h"

class QComboBox;

namespace kindrel::desktop {

class PersonSwitches;

/// The file status of the families that are asked for, and the states that their people may be in.
class FilterFamilies : public FilterPart
{
    Q_OBJECT

public:
    FilterFamilies(Desk& desk, people::Filter& filter);

    [[nodiscard]] int uses() const override { return 0; }
    void show_filter() override;
    void focus_first() override;

private:
    QComboBox* m_families;
    PersonSwitches* m_states;
};

} // namespace kindrel::desktop
