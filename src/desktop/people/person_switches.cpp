#include "desktop/people/person_switches.h"

#include "desktop/shell/look.h"

#include <QCheckBox>
#include <QGridLayout>

namespace kindrel::desktop {

PersonSwitches::PersonSwitches(int columns, QWidget* parent) : QWidget(parent)
{
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(0, 0, 0, 0);
    grid->setHorizontalSpacing(space::group);
    grid->setVerticalSpacing(space::field / 2);
    for (const auto& row : people::person_states()) {
        auto* box = new QCheckBox(row.caption.toString());
        box->setObjectName(QString::fromLatin1(row.column).toLower());
        connect(box, &QCheckBox::clicked, this, &PersonSwitches::turned);
        const int place = int(m_switches.size());
        grid->addWidget(box, place / columns, place % columns);
        m_switches.push_back(box);
    }
    grid->setColumnStretch(columns, 1);
    setFocusProxy(m_switches.front());
}

void PersonSwitches::show_states(const people::PersonStates& states)
{
    for (std::size_t place = 0; const auto& row : people::person_states())
        m_switches[place++]->setChecked(states.*row.on);
}

people::PersonStates PersonSwitches::states() const
{
    people::PersonStates states;
    for (std::size_t place = 0; const auto& row : people::person_states())
        states.*row.on = m_switches[place++]->isChecked();
    return states;
}

} // namespace kindrel::desktop
