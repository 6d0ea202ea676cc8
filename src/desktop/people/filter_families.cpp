#include "desktop/people/filter_families.h"

#include "desktop/people/person_switches.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QComboBox>
#include <QLabel>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

FilterFamilies::FilterFamilies(Desk& desk, people::Filter& filter)
    : FilterPart(desk, filter, u"File Status, People"_s), m_families(new QComboBox), m_states(new PersonSwitches(2))
{
    m_families->setObjectName(u"file_status"_s);
    m_families->setAccessibleName(u"File Status"_s);
    m_families->addItem(u"Choose a file status"_s);
    for (int list = 0; list < people::family_list_count; ++list)
        m_families->addItem(people::family_list_name(people::FamilyList(list)));
    connect(m_families, &QComboBox::activated, this, [this](int row) {
        this->filter().families = row == 0 ? std::nullopt : std::optional(people::FamilyList(row - 1));
        Q_EMIT changed();
    });
    connect(m_states, &PersonSwitches::turned, this, [this] {
        this->filter().states = m_states->states();
        Q_EMIT changed();
    });
    auto* hint = new QLabel(u"People without any of these states are always taken."_s);
    hint->setWordWrap(true);
    dress(*hint, TextSize::secondary);

    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(make_heading(u"Families with the file status"_s));
    column->addWidget(m_families, 0, Qt::AlignLeft);
    column->addSpacing(space::field);
    column->addWidget(make_heading(u"Their people who are"_s));
    column->addWidget(m_states);
    column->addWidget(hint);
    column->addStretch(1);
}

void FilterFamilies::show_filter()
{
    m_families->setCurrentIndex(filter().families ? int(*filter().families) + 1 : 0);
    m_states->show_states(filter().states);
}

void FilterFamilies::focus_first()
{
    m_families->setFocus(Qt::TabFocusReason);
}

} // namespace kindrel::desktop
