#include "desktop/registers/roll_fields.h"

#include "desktop/registers/name_field.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QCheckBox>
#include <QGridLayout>
#include <QLabel>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::ProjectSetup;

RollFields::RollFields(const std::unique_ptr<ProjectSetup>& setup, const int& project, QWidget* parent)
    : QWidget(parent), m_setup(setup), m_project(project)
{
    auto* grid = new QGridLayout(this);
    grid->setContentsMargins(space::margin, space::margin, space::margin, space::margin);
    grid->setHorizontalSpacing(space::margin);
    grid->setVerticalSpacing(space::field);
    grid->setColumnStretch(1, 1);
    add_services(*grid);
    add_absences(*grid);
    grid->setRowStretch(grid->rowCount(), 1);
}

NameField* RollFields::make_field(const QString& caption, int place, Set set)
{
    auto* field = new NameField([this, place, set](const QString& name) { return take(place, name, set); });
    field->setAccessibleName(u"%1 %2"_s.arg(caption).arg(place + 1));
    connect(field, &QLineEdit::textEdited, this, &RollFields::changed);
    return field;
}

void RollFields::add_services(QGridLayout& grid)
{
    auto* heading = make_heading(u"Ser&vices"_s);
    grid.addWidget(heading, 0, 0, 1, 3);
    for (int place = 0; place < registers::service_count; ++place) {
        auto* field = make_field(u"Service"_s, place, &ProjectSetup::set_service);
        field->setObjectName(u"description_%1"_s.arg(place + 1));
        auto* number = new QLabel(QString::number(place + 1));
        grid.addWidget(number, place + 1, 0, Qt::AlignRight);
        grid.addWidget(field, place + 1, 1);
        m_services.push_back(field);
    }
    heading->setBuddy(m_services.front());
}

void RollFields::add_absences(QGridLayout& grid)
{
    const int first_row = grid.rowCount();
    auto* heading = make_heading(u"Reasons for &being absent"_s);
    heading->setContentsMargins(0, space::field, 0, 0);
    grid.addWidget(heading, first_row, 0, 1, 3);
    for (int place = 0; place < registers::absence_count; ++place) {
        auto* field = make_field(u"Reason for being absent"_s, place, &ProjectSetup::set_absence);
        field->setObjectName(u"absence_%1"_s.arg(place + 1));
        auto* counted = new QCheckBox(u"Count as attending"_s);
        counted->setObjectName(u"include_%1"_s.arg(place + 1));
        counted->setToolTip(u"Analyses count who is absent for this reason among those who attended"_s);
        connect(counted, &QCheckBox::clicked, this, [this, place](bool on) { include(place, on); });
        const int row = first_row + place + 1;
        grid.addWidget(new QLabel(QString::number(place + 1)), row, 0, Qt::AlignRight);
        grid.addWidget(field, row, 1);
        grid.addWidget(counted, row, 2);
        m_absences.push_back(field);
        m_includes.push_back(counted);
    }
    heading->setBuddy(m_absences.front());
}

bool RollFields::take(int place, const QString& name, Set set)
{
    const bool chosen = m_setup->list(registers::Kind::roll).holds(m_project);
    const bool taken = ((*m_setup).*set)(m_project, place, name);
    if (!taken && chosen && !name.trimmed().isEmpty())
        return false;
    // Without a project the name has no place to stay in; one that was not to go after all comes back.
    show_project();
    Q_EMIT changed();
    if (!chosen)
        Q_EMIT project_wanted();
    return true;
}

void RollFields::include(int place, bool on)
{
    const bool taken = m_setup->set_include(m_project, place, on);
    show_project();
    Q_EMIT changed();
    if (!taken)
        Q_EMIT project_wanted();
}

void RollFields::show_project()
{
    const auto& projects = m_setup->list(registers::Kind::roll);
    const auto shown = projects.holds(m_project) ? projects[m_project] : registers::ProjectItem{};
    for (std::size_t place = 0; place < m_services.size(); ++place)
        m_services[place]->show_name(shown.services[place]);
    for (std::size_t place = 0; place < m_absences.size(); ++place) {
        m_absences[place]->show_name(shown.absences[place]);
        m_includes[place]->setChecked(shown.include[place]);
    }
}

void RollFields::focus_services()
{
    m_services.front()->setFocus();
}

bool RollFields::typing() const
{
    return std::ranges::any_of(m_services, &NameField::typing) || std::ranges::any_of(m_absences, &NameField::typing);
}

bool RollFields::finish_typing()
{
    return std::ranges::all_of(m_services, &NameField::finish) && std::ranges::all_of(m_absences, &NameField::finish);
}

void RollFields::drop_typing()
{
    for (const auto* fields : {&m_services, &m_absences})
        for (NameField* field : *fields)
            field->drop();
}

} // namespace kindrel::desktop
