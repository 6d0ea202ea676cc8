#include "desktop/registers/weekly_page.h"

#include "desktop/registers/weekly_entry.h"
#include "desktop/registers/weekly_output.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/empty_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"

#include <QAction>
#include <QPushButton>
#include <QShortcut>
#include <QStackedWidget>
#include <QTabWidget>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int entry_tab = 0;
constexpr int output_tab = 1;

/// What the page shows.
enum Content { tabs, empty, unread };

/// Words in the middle of the page, and what one can do about it.
QWidget* make_panel(const QString& what, const QString& next, QPushButton* button)
{
    auto* words = new EmptyPanel;
    words->say(what, next);
    words->setSizePolicy(QSizePolicy::Preferred, QSizePolicy::Maximum);
    auto* panel = new QWidget;
    auto* column = new QVBoxLayout(panel);
    column->addStretch(1);
    column->addWidget(words);
    column->addWidget(button, 0, Qt::AlignHCenter);
    column->addStretch(2);
    panel->setFocusProxy(button);
    return panel;
}

} // namespace

WeeklyPage* WeeklyPage::open(Desk& desk)
{
    auto entry = core::enter(desk.office, core::AreaId::weekly);
    return entry ? new WeeklyPage(desk, std::move(*entry)) : nullptr;
}

WeeklyPage::WeeklyPage(Desk& desk, core::AreaEntry entry)
    : Page(u"Weekly Statistics"_s), m_desk(desk), m_entry(std::move(entry)), m_weekly(desk.office),
      m_tabs(new QTabWidget), m_content(new QStackedWidget), m_figures(new WeeklyEntry(desk, m_weekly)),
      m_output(new WeeklyOutput(desk, [this](int project) { return settle_for_report(project); }))
{
    setObjectName(u"weekly"_s);
    m_tabs->setObjectName(u"weekly_tabs"_s);
    m_tabs->setDocumentMode(true);
    m_tabs->addTab(m_figures, u"Entry"_s);
    m_tabs->addTab(m_output, u"Output"_s);
    m_content->addWidget(m_tabs);
    m_content->addWidget(make_empty());
    m_content->addWidget(make_unread());
    set_content(m_content);
    add_actions();
    connect(m_figures, &WeeklyEntry::changed, this, &WeeklyPage::show_state);
    connect(m_figures, &WeeklyEntry::remarked, this, &WeeklyPage::remark);
    connect(m_output, &WeeklyOutput::remarked, this, &WeeklyPage::remark);
    connect(m_tabs, &QTabWidget::currentChanged, this, &WeeklyPage::turn_to);
}

WeeklyPage::~WeeklyPage() = default;

QWidget* WeeklyPage::make_empty()
{
    auto* setup = new QPushButton(icon(u"settings-configure"_s), u"&Set up a weekly project"_s);
    setup->setObjectName(u"open_setup"_s);
    setup->setEnabled(core::may_enter(m_desk.office, core::AreaId::project_setup));
    connect(setup, &QPushButton::clicked, this, [this] { m_desk.navigation.open_area(u"setup_projects"_s); });
    return make_panel(u"There is no weekly project yet"_s,
                      u"A weekly project is a list of what you count each week. Set one up, then come back."_s, setup);
}

QWidget* WeeklyPage::make_unread()
{
    auto* again = new QPushButton(icon(u"view-refresh"_s), u"&Try again"_s);
    again->setObjectName(u"try_again"_s);
    connect(again, &QPushButton::clicked, this, &WeeklyPage::entered);
    return make_panel(u"The weekly projects could not be read"_s,
                      u"What is stored is not lost. Try again once the connection is back."_s, again);
}

void WeeklyPage::add_actions()
{
    auto* keep = add_action(u"Save"_s, u"document-save"_s, u"Save the figures of the open date (Ctrl+S)"_s);
    connect(keep, &QAction::triggered, this, &WeeklyPage::save);
    auto* print_figures = add_action(u"Print"_s, u"document-print"_s,
                                     u"Print the figures of the open date, or the chosen report (Ctrl+P)"_s);
    connect(print_figures, &QAction::triggered, this, &WeeklyPage::print);
    auto* csv = add_action(u"Save as CSV"_s, u"document-save"_s,
                           u"Save the figures of the open date, or the chosen report, as comma-separated text"_s);
    connect(csv, &QAction::triggered, this, [this] { at_entry() ? m_figures->save_csv() : m_output->save_csv(); });
    const auto key = [this](const QKeySequence& keys, auto run) {
        auto* made = new QShortcut(keys, this);
        made->setContext(Qt::WidgetWithChildrenShortcut);
        connect(made, &QShortcut::activated, this, run);
    };
    key(Qt::CTRL | Qt::Key_PageUp, [this] { m_tabs->setCurrentIndex(entry_tab); });
    key(Qt::CTRL | Qt::Key_PageDown, [this] { m_tabs->setCurrentIndex(output_tab); });
    key(Qt::Key_Insert, [this] {
        m_tabs->setCurrentIndex(entry_tab);
        m_figures->focus_new_date();
    });
}

bool WeeklyPage::at_entry() const
{
    return m_tabs->currentIndex() == entry_tab;
}

bool WeeklyPage::enter_register()
{
    try {
        return m_weekly.enter();
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"Unable to read the weekly projects"_s, error.text()});
        return false;
    }
}

void WeeklyPage::entered()
{
    if (!m_figures->finish_typing())
        return;
    // Projects and dates may have come or gone while no date was open here.
    const bool usable = m_weekly.open_date() || enter_register();
    m_content->setCurrentIndex(usable ? tabs : m_weekly.none_set_up() ? empty : unread);
    if (!usable) {
        m_content->currentWidget()->setFocus();
        return;
    }
    m_figures->show_register();
    turn_to(m_tabs->currentIndex());
}

void WeeklyPage::turn_to(int tab)
{
    if (tab == entry_tab) {
        m_figures->focus_work();
        return;
    }
    m_output->reload();
    m_output->focus_reports();
}

void WeeklyPage::find()
{
    if (at_entry())
        m_figures->focus_dates();
    else
        m_output->focus_reports();
}

void WeeklyPage::print()
{
    if (at_entry())
        m_figures->print();
    else
        m_output->run();
}

bool WeeklyPage::altered() const
{
    return m_weekly.altered() || m_figures->typing();
}

bool WeeklyPage::save()
{
    if (!m_figures->finish_typing())
        return false;
    if (!m_weekly.open_date())
        return true;
    const bool saved = stored([this] { return m_weekly.save(); });
    m_saved = saved;
    show_state();
    return saved;
}

bool WeeklyPage::stored(const std::function<bool()>& store)
{
    try {
        return store();
    } catch (const core::DatabaseError& error) {
        m_desk.office.dialogue.show({u"Unable to save the figures of this date"_s, error.text()});
        return false;
    }
}

bool WeeklyPage::leave()
{
    if (!m_figures->finish_typing())
        return false;
    const bool left = stored([this] { return m_weekly.leave(); });
    m_figures->show_register();
    m_figures->focus_work();
    return left;
}

void WeeklyPage::remark(const QString& words)
{
    if (words.isEmpty())
        note().clear();
    else
        note().say(words);
}

std::optional<QString> WeeklyPage::settle_for_report(int project)
{
    if (!m_weekly.open_date() || !altered() || project != m_weekly.project())
        return QString();
    const auto date = m_weekly.open_date()->date.shown(m_desk.office.day_order());
    const auto answer = m_desk.office.dialogue.confirm_or_cancel(
        {.text = u"The figures of %1 are not saved, do you wish to save them before the report is made?"_s.arg(date),
         .icon = core::Icon::question});
    if (!answer || (*answer && !save()))
        return {};
    return *answer ? QString() : u"The figures of %1 are not saved; this report leaves them out."_s.arg(date);
}

void WeeklyPage::show_state()
{
    const bool unsaved = altered();
    m_saved = m_saved && !unsaved && m_weekly.open_date();
    chip().set(unsaved        ? u"not saved"_s
               : holds_lock() ? u"date open"_s
                              : QString(),
               unsaved ? State::altered : State::plain);
    const auto count = m_weekly.dates().size();
    set_status(m_saved ? u"Saved"_s : count == 1 ? u"1 date"_s : u"%1 dates"_s.arg(count));
    Q_EMIT state_changed();
}

} // namespace kindrel::desktop
