#include "desktop/people/main_menu.h"

#include "core/entry.h"
#include "desktop/church_choice.h"
#include "desktop/output/list_report.h"
#include "desktop/people/family_card.h"
#include "desktop/people/family_list.h"
#include "desktop/people/family_totals.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/link_button.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"
#include "desktop/shell/side_panel.h"
#include "desktop/shell/table_text.h"
#include "desktop/shell/value_form.h"
#include "people/drafts.h"

#include <QAction>
#include <QEvent>
#include <QHBoxLayout>
#include <QLabel>
#include <QScrollArea>

#include <functional>
#include <utility>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using people::FamilyList;

namespace {

constexpr int side_width = 264;

/// One of the ways out of the main menu.
struct Task
{
    QString key, title, description, icon_name;
    std::optional<core::Area> right;
    std::function<void()> run;
};

std::function<void()> to_area(Desk& desk, const QString& key)
{
    return [&desk, key] {
        desk.navigation.open_area(key);
    };
}

std::vector<Task> tasks_of(Desk& desk)
{
    return {
        {u"reports"_s, u"Create Reports and Data Analysis"_s,
         u"Directories, lists, labels, albums and every other report."_s, u"office-report"_s,
         core::Area::report_outputs, to_area(desk, u"reports"_s)},
        {u"backup"_s, u"Backup Data"_s, u"Compress and backup the database files."_s, u"backup"_s,
         core::Area::backup_data, to_area(desk, u"backup"_s)},
        {u"restore"_s, u"Restore Data"_s, u"Restore a backup."_s, u"document-revert"_s, core::Area::restore_data,
         to_area(desk, u"restore"_s)},
        {u"load_church"_s, u"Load a New Church Database"_s,
         u"Load a completely different and Independent database for keeping records."_s, u"document-open-folder"_s,
         std::nullopt,
         [&desk] {
             load_another_church(desk);
         }},
        {u"load_training"_s, u"Load Training Data"_s,
         u"Load sample church data to both learn how to use Kindrel and to experiment with."_s, u"view-presentation"_s,
         std::nullopt,
         [&desk] {
             desk.navigation.load_church(core::training_church);
         }},
    };
}

} // namespace

MainMenu::MainMenu(Desk& desk) : Page(desk.office.church_name), m_desk(desk)
{
    setObjectName(u"main_menu"_s);
    auto* content = new QWidget;
    auto* row = new QHBoxLayout(content);
    row->setContentsMargins(0, 0, space::group, space::margin);
    row->setSpacing(space::margin);
    row->addWidget(make_side());
    row->addWidget(make_list(), 1);
    set_content(content);
    add_list_actions();
}

QWidget* MainMenu::make_side()
{
    m_totals = new FamilyTotals;
    connect(m_totals, &FamilyTotals::chosen, this, [this](FamilyList list) { m_families->choose(list); });
    m_vision = make_value();
    m_vision->setObjectName(u"vision"_s);
    m_vision->setContentsMargins(space::field, 0, 0, 0);

    auto* column = new QVBoxLayout;
    column->setContentsMargins(space::field, 0, 0, 0);
    column->setSpacing(space::group);
    column->addWidget(m_vision);
    column->addWidget(m_totals);
    add_tasks(*column);
    column->addStretch(1);
    return make_side_panel(column, side_width);
}

void MainMenu::add_tasks(QVBoxLayout& column)
{
    auto* tasks = new QVBoxLayout;
    tasks->setSpacing(space::field / 2);
    for (const Task& task : tasks_of(m_desk)) {
        auto* button = new LinkButton(task.title);
        button->setObjectName(task.key);
        button->setIcon(icon(task.icon_name));
        button->set_description(task.description);
        button->setEnabled(!task.right || m_desk.office.may(*task.right));
        connect(button, &QAbstractButton::clicked, this, task.run);
        tasks->addWidget(button);
    }
    column.addLayout(tasks);
}

QWidget* MainMenu::make_list()
{
    m_families = new FamilyListWidget(m_desk);
    connect(m_families, &FamilyListWidget::opened, this, &MainMenu::open);
    connect(m_families, &FamilyListWidget::looked_at, this, &MainMenu::look_at);
    connect(m_families, &FamilyListWidget::shown_changed, this, [this] {
        m_totals->mark(m_families->list());
        set_status(m_families->count_words());
    });
    return m_families;
}

void MainMenu::add_list_actions()
{
    auto* look = add_action(u"Card"_s, u"view-list-details"_s,
                            u"Look at the chosen family without opening its file (Space in the list, Ctrl+Enter)"_s);
    connect(look, &QAction::triggered, this, [this] { look_at(m_families->chosen_row()); });
    auto* print_list = add_action(u"Print"_s, u"document-print"_s, u"Print this list (Ctrl+P)"_s);
    connect(print_list, &QAction::triggered, this, &MainMenu::print);
    auto* save = add_action(u"Save as CSV"_s, u"document-save"_s, u"Save this list as comma-separated text"_s);
    connect(save, &QAction::triggered, this, [this] {
        if (core::permitted(m_desk.office, core::Area::export_text))
            save_as_csv(m_families->model(), people::family_list_name(m_families->list()), m_desk.office.dialogue);
    });
}

void MainMenu::show_vision()
{
    m_vision->setText(m_desk.office.settings.vision);
    m_vision->setVisible(!m_vision->text().isEmpty());
}

void MainMenu::load()
{
    show_vision();
    m_change_mark = m_desk.office.session->change_mark();
    m_totals->show_totals(people::family_totals(*m_desk.office.session));
    m_families->reload();
}

void MainMenu::load_if_changed()
{
    if (m_desk.office.session->change_mark() != m_change_mark)
        load();
}

void MainMenu::entered()
{
    load_if_changed();
    offer_draft();
    m_families->focus_filter();
}

void MainMenu::find()
{
    m_families->focus_filter();
}

void MainMenu::print()
{
    print_list(m_desk, people::family_list_name(m_families->list()), m_families->model());
}

void MainMenu::open(int row)
{
    const FamilyListModel& shown = m_families->model();
    m_desk.navigation.open_family(shown.entry(row).Surname_ID, shown.surname_ids(),
                                  people::family_list_name(m_families->list()));
}

void MainMenu::look_at(int row)
{
    if (row >= 0)
        open_family_card(m_desk, m_families->model().surname_ids(), row);
}

void MainMenu::offer_draft()
{
    if (std::exchange(m_drafts_offered, true))
        return;
    const auto drafts = people::Drafts(m_desk.office).all();
    if (drafts.empty())
        return;
    const people::Draft& newest = drafts.front();
    const QString surname = newest.typed.family.surname.trimmed();
    const auto day = core::Date::from(newest.kept.date()).shown(m_desk.office.day_order());
    const QString whose = surname.isEmpty() ? u"a new family"_s : u"the %1 family"_s.arg(surname);
    note().offer(
        u"Work on %1 was not saved; it was kept on %2 at %3."_s.arg(whose, day, newest.kept.toString(u"HH:mm"_s)),
        u"Open it"_s, [this, key = newest.stored.family.Surname_ID] { m_desk.navigation.open_draft(key); });
}

void MainMenu::changeEvent(QEvent* event)
{
    Page::changeEvent(event);
    if (event->type() == QEvent::ActivationChange && isActiveWindow() && isVisible())
        load_if_changed();
}

} // namespace kindrel::desktop
