#pragma once

#include "people/filter.h"

#include <QWidget>

#include <vector>

class QCheckBox;

namespace kindrel::desktop {

/// The six switches of the states that a person can be in.
class PersonSwitches : public QWidget
{
    Q_OBJECT

public:
    explicit PersonSwitches(int columns, QWidget* parent = nullptr);

    void show_states(const people::PersonStates& states);
    [[nodiscard]] people::PersonStates states() const;

Q_SIGNALS:
    /// A switch was turned by the person at the keyboard.
    void turned();

private:
    std::vector<QCheckBox*> m_switches; ///< In the order of people::person_states().
};

} // namespace kindrel::desktop
