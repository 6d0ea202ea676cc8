#include "desktop/registers/project_tab.h"

#include "desktop/registers/project_lists.h"
#include "desktop/registers/roll_fields.h"
#include "desktop/shell/look.h"
#include "desktop/shell/ordered_list_editor.h"
#include "desktop/shell/value_form.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QLineEdit>
#include <QScrollArea>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::FigureKind;
using registers::Kind;

namespace {

/// A list under its heading; the heading's letter leads to the line that adds to it.
QWidget* headed(const QString& heading, OrderedListEditor* list)
{
    auto* words = make_heading(heading);
    words->setContentsMargins(space::margin, space::margin, 0, 0);
    words->setBuddy(list->findChild<QLineEdit*>(u"new_0"_s));
    auto* part = new QWidget;
    auto* column = new QVBoxLayout(part);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(words);
    column->addWidget(list, 1);
    return part;
}

/// Scrolls when the window is low.
QWidget* scrolling(QWidget* content)
{
    auto* scroll = new QScrollArea;
    scroll->setWidgetResizable(true);
    scroll->setFrameShape(QFrame::NoFrame);
    scroll->setFocusPolicy(Qt::NoFocus);
    scroll->setWidget(content);
    content->setAutoFillBackground(false);
    scroll->viewport()->setAutoFillBackground(false);
    return scroll;
}

} // namespace

ProjectTab::ProjectTab(const SharedSetup& setup, Kind kind, const QString& heading)
    : m_setup(setup), m_kind(kind),
      m_list(new OrderedListEditor(std::make_unique<ProjectOperations>(setup, kind),
                                   QString::fromUtf16(registers::register_kind(kind).project_table))),
      m_row(new QHBoxLayout(this))
{
    m_row->setContentsMargins(0, 0, 0, 0);
    m_row->setSpacing(0);
    m_row->addWidget(headed(heading, m_list), 1);
    connect(m_list, &OrderedListEditor::changed, this, &ProjectTab::changed);
    connect(m_list, &OrderedListEditor::chosen, this, &ProjectTab::choose);
}

void ProjectTab::add_details(QWidget* details)
{
    m_row->addWidget(details, 1);
}

void ProjectTab::choose(int row)
{
    const bool other = row != m_project && m_setup->list(m_kind).holds(m_project);
    QWidget* cursor = window()->focusWidget();
    if (other && !settle_details()) {
        QMetaObject::invokeMethod(
            this, [this] { m_list->show_list(m_project); }, Qt::QueuedConnection);
        return;
    }
    if (other && cursor)
        cursor->setFocus(); // What was typed beside the list is settled; the cursor belongs where it was put.
    m_project = row;
    show_details();
}

void ProjectTab::show_projects()
{
    m_list->show_list(std::max(m_list->current(), 0));
}

void ProjectTab::focus_list()
{
    m_list->focus_list();
}

void ProjectTab::go_to_fault(int project)
{
    m_list->show_list(project);
    focus_details();
}

bool ProjectTab::typing() const
{
    return m_list->typing();
}

bool ProjectTab::finish_typing()
{
    return m_list->finish_typing();
}

void ProjectTab::drop_typing()
{
    m_list->drop_typing();
}

// Roll.

RollProjectTab::RollProjectTab(const SharedSetup& setup)
    : ProjectTab(setup, Kind::roll, u"Roll &projects"_s), m_fields(new RollFields(setup, project()))
{
    add_details(scrolling(m_fields));
    connect(m_fields, &RollFields::changed, this, &ProjectTab::changed);
    connect(
        m_fields, &RollFields::project_wanted, this, [this] { list().focus_list(); }, Qt::QueuedConnection);
}

bool RollProjectTab::typing() const
{
    return ProjectTab::typing() || m_fields->typing();
}

bool RollProjectTab::finish_typing()
{
    // First what belongs to the project that is chosen now: a project that is added becomes the chosen one.
    return m_fields->finish_typing() && ProjectTab::finish_typing();
}

void RollProjectTab::drop_typing()
{
    ProjectTab::drop_typing();
    m_fields->drop_typing();
}

bool RollProjectTab::settle_details()
{
    return !m_fields->typing(); // What is still typed there was refused.
}

void RollProjectTab::show_details()
{
    m_fields->show_project();
}

void RollProjectTab::focus_details()
{
    m_fields->focus_services();
}

// Weekly statistics.

WeeklyProjectTab::WeeklyProjectTab(const SharedSetup& setup) : ProjectTab(setup, Kind::weekly, u"Weekly &projects"_s)
{
    auto* both = new QWidget;
    auto* column = new QVBoxLayout(both);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(0);
    column->addWidget(
        headed(u"A&ttendance categories"_s, make_categories(FigureKind::attendance, u"attendance_input"_s)));
    column->addWidget(headed(u"&Financial categories"_s, make_categories(FigureKind::money, u"finance_input"_s)));
    add_details(scrolling(both));
}

OrderedListEditor* WeeklyProjectTab::make_categories(FigureKind kind, const QString& name)
{
    auto* categories =
        new OrderedListEditor(std::make_unique<CategoryOperations>(setup(), kind, project()), name + u"_list"_s);
    categories->setObjectName(name);
    categories->drop_letters();
    connect(categories, &OrderedListEditor::changed, this, &ProjectTab::changed);
    m_categories.push_back(categories);
    return categories;
}

bool WeeklyProjectTab::typing() const
{
    return ProjectTab::typing() || std::ranges::any_of(m_categories, &OrderedListEditor::typing);
}

bool WeeklyProjectTab::finish_typing()
{
    return settle_details() && ProjectTab::finish_typing();
}

void WeeklyProjectTab::drop_typing()
{
    ProjectTab::drop_typing();
    for (OrderedListEditor* categories : m_categories)
        categories->drop_typing();
}

bool WeeklyProjectTab::settle_details()
{
    return std::ranges::all_of(m_categories, [](OrderedListEditor* categories) {
        return !categories->typing() || categories->finish_typing();
    });
}

void WeeklyProjectTab::show_details()
{
    for (OrderedListEditor* categories : m_categories)
        categories->show_list(std::max(categories->current(), 0));
}

void WeeklyProjectTab::focus_details()
{
    m_categories.front()->focus_add_line();
}

} // namespace kindrel::desktop
