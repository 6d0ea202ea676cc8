#include "desktop/people/tagging_page.h"

#include "desktop/output/chosen_people.h"
#include "desktop/people/filter_panel.h"
#include "desktop/people/layout_steps.h"
#include "desktop/people/list_steps.h"
#include "desktop/people/process_panel.h"
#include "desktop/people/sort_panel.h"
#include "desktop/people/working_list_view.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"

#include <QAction>
#include <QHBoxLayout>
#include <QShortcut>
#include <QStackedWidget>
#include <QTimer>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using Step = StepBar::Step;

namespace {

constexpr int panel_width = 348;
/// A pause in typing, after which the list is made again.
constexpr int typing_pause = 150;

} // namespace

TaggingPage* TaggingPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::tagging);
    return entry ? new TaggingPage(desk, std::move(*entry)) : nullptr;
}

TaggingPage::TaggingPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Tagging"_s), m_desk(desk), m_entry(std::move(entry)), m_undo(note()), m_bar(new StepBar),
      m_filter(new FilterPanel(desk)), m_list(new WorkingListView(desk, m_sheet)), m_views(new QStackedWidget),
      m_panels(new QStackedWidget), m_pause(new QTimer(this))
{
    setObjectName(u"Tagging"_s);
    m_pause->setSingleShot(true);
    m_pause->setInterval(typing_pause);
    connect(m_pause, &QTimer::timeout, this, &TaggingPage::make_list);
    connect(m_bar, &StepBar::wanted, this, &TaggingPage::go_to);
    connect(m_list, &WorkingListView::made, this, [this] {
        m_process->set_list(m_list->list());
        set_status(m_list->count_words());
        share_list();
    });
    connect(m_list, &WorkingListView::told, this, [this](const QString& words) { note().say(words); });
    connect(m_list, &WorkingListView::changed_by_hand, this,
            [this](const QString& words, const std::function<void()>& undo) { m_undo.offer(words, undo); });
    add_panels();
    m_views->addWidget(m_filter);
    m_views->addWidget(make_bench());
    auto* content = new QWidget;
    auto* column = new QVBoxLayout(content);
    column->setContentsMargins(space::group, space::field / 2, space::group, space::margin);
    column->setSpacing(space::margin);
    column->addWidget(m_bar);
    column->addWidget(m_views, 1);
    set_content(content);
    add_keys();
    add_actions();
    sheet_changed();
}

TaggingPage::~TaggingPage()
{
    m_desk.chosen.reset();
}

void TaggingPage::add_panels()
{
    m_process = new ProcessPanel(m_desk, m_sheet);
    connect(m_process, &ProcessPanel::tagged, this, &TaggingPage::tagged);
    m_steps = {new SortPanel(m_desk, m_sheet),
               new HiddenPanel(m_sheet),
               new RangePanel(m_sheet),
               new TitlePanel(m_desk, m_sheet),
               new FormatPanel(m_desk, m_sheet),
               new SuppressPanel(m_desk, m_sheet),
               m_process};
    for (StepPanel* step : m_steps) {
        connect(step, &StepPanel::changed, this, &TaggingPage::sheet_changed);
        m_panels->addWidget(step);
    }
    keep_width(*m_panels, panel_width);
}

QWidget* TaggingPage::make_bench()
{
    auto* bench = new QWidget;
    bench->setObjectName(u"bench"_s);
    auto* parts = new QHBoxLayout(bench);
    parts->setContentsMargins(0, 0, 0, 0);
    parts->setSpacing(space::group);
    parts->addWidget(m_list, 1);
    parts->addWidget(m_panels);
    return bench;
}

void TaggingPage::add_keys()
{
    const auto key = [this](const QKeySequence& keys, const std::function<void()>& act) {
        auto* shortcut = new QShortcut(keys, this);
        shortcut->setContext(Qt::WidgetWithChildrenShortcut);
        connect(shortcut, &QShortcut::activated, this, act);
    };
    const auto turn = [this](int by) {
        go_to(Step(std::clamp(int(m_bar->open_step()) + by, 0, int(StepBar::step_count) - 1)));
    };
    key(Qt::CTRL | Qt::Key_PageUp, [turn] { turn(-1); });
    key(Qt::CTRL | Qt::Key_PageDown, [turn] { turn(1); });
    key(Qt::CTRL | Qt::Key_Return, [this] { go_to(Step::process); });
    key(QKeySequence::Undo, [this] { m_undo.take_back(); });
}

void TaggingPage::add_actions()
{
    auto* print_list = add_action(u"Print"_s, u"document-print"_s, u"Print the list itself"_s);
    connect(print_list, &QAction::triggered, m_list, &WorkingListView::print);
    auto* save = add_action(u"Save as CSV"_s, u"document-save"_s, u"Save the list itself as comma-separated text"_s);
    connect(save, &QAction::triggered, m_list, &WorkingListView::save);
}

void TaggingPage::entered()
{
    if (m_bar->open_step() == Step::filter) {
        m_filter->reload();
        m_filter->focus_kinds();
    } else {
        panel(m_bar->open_step()).focus_first();
    }
}

void TaggingPage::find()
{
    if (m_bar->open_step() == Step::filter)
        m_filter->focus_kinds();
    else
        m_list->focus_line();
}

void TaggingPage::print()
{
    go_to(Step::process);
    if (m_bar->open_step() == Step::process)
        m_process->open_report();
}

bool TaggingPage::finish_step()
{
    return m_bar->open_step() == Step::filter ? m_filter->finish() : panel(m_bar->open_step()).finish();
}

void TaggingPage::go_to(Step step)
{
    const Step from = m_bar->open_step();
    if (step == from || !finish_step())
        return;
    if (from == Step::filter)
        take_filter();
    m_bar->open(step);
    m_views->setCurrentIndex(step == Step::filter ? 0 : 1);
    if (step == Step::filter)
        return entered();
    if (from == Step::filter || m_pause->isActive())
        make_list();
    m_panels->setCurrentWidget(&panel(step));
    panel(step).reload();
    panel(step).focus_first();
}

void TaggingPage::take_filter()
{
    auto& plan = m_sheet.plan;
    auto filter = m_filter->filter();
    if (m_list->is_made() && filter != plan.filter)
        plan.found.reset(); // A filter that was changed chooses the people anew.
    plan.filter = std::move(filter);
}

void TaggingPage::take_people(const people::WorkingList& found)
{
    const bool first = !m_list->is_made();
    if (first)
        m_sheet.plan.found = found;
    go_to(Step::process);
    const bool refused = m_bar->open_step() != Step::process; // The step lacks something, which was said.
    if (refused && first)
        m_sheet.plan.found.reset();
    else if (!refused && !first)
        m_list->add_people(found.members);
}

void TaggingPage::sheet_changed()
{
    for (int step = Step::sort; step < Step::process; ++step)
        m_bar->mark(Step(step), panel(Step(step)).is_set());
    if (m_views->currentIndex() > 0)
        m_pause->start();
    share_list(); // What reports leave out must not wait for the list.
}

void TaggingPage::share_list()
{
    if (m_list->is_made())
        m_desk.chosen = std::make_shared<const ChosenPeople>(ChosenPeople{m_list->list(), m_sheet.options});
}

void TaggingPage::make_list()
{
    m_pause->stop();
    m_list->make();
}

void TaggingPage::tagged(const people::BulkChange& change)
{
    if (change.count.changed == 0)
        return;
    const bool given = change.act == people::TagAct::give;
    const QString words = given ? u"\u201c%1\u201d was given to %2."_s : u"\u201c%1\u201d was taken from %2."_s;
    m_undo.offer({words.arg(change.item.text, people_words(change.count.changed)), [this, change] {
                      return untag(change);
                  }});
}

std::optional<QString> TaggingPage::untag(const people::BulkChange& change)
{
    std::optional<int> stay;
    try {
        stay = people::undo_tagging(m_desk.office, change);
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"The change could not be taken back."_s, error.text()});
    }
    if (!stay)
        return std::nullopt;
    m_process->set_list(m_list->list());
    return stay == 0 ? u"The change was taken back."_s
                     : u"The change was taken back; %1 changed since stay as they are."_s.arg(people_words(*stay));
}

} // namespace kindrel::desktop
