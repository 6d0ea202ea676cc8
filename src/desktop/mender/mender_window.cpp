#include "desktop/mender/mender_window.h"

#include "core/mender_words.h"
#include "desktop/mender/account_report.h"
#include "desktop/mender/account_view.h"
#include "desktop/mender/act_panel.h"
#include "desktop/mender/beside.h"
#include "desktop/mender/mender_questions.h"
#include "desktop/mender/place_bar.h"
#include "desktop/shell/chip.h"
#include "desktop/shell/help.h"
#include "desktop/shell/look.h"
#include "desktop/shell/note_bar.h"

#include <QAction>
#include <QCloseEvent>
#include <QProgressBar>
#include <QShortcut>
#include <QStandardPaths>
#include <QVBoxLayout>

#include <array>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using core::FileQuestion;

namespace {

namespace words = core::mender_words;

constexpr QSize least_size{760, 520};

/// What needs no more than a yes.
struct PlannedAct
{
    MenderAct act;
    QString (*question)(int church);
    const char16_t* doing;
    Account (*work)(const MenderJob& job);
};
constexpr std::array planned_acts{
    PlannedAct{MenderAct::mend, words::mending_question, u"Mending %1", mend_church},
    PlannedAct{MenderAct::unlock, words::unlocking_question, u"Unlocking %1", unlock_church},
    PlannedAct{MenderAct::set_aside, words::setting_aside_question, u"Setting the damaged file of %1 aside",
               set_church_aside},
};

} // namespace

MenderWindow::MenderWindow(MenderSurroundings surroundings)
    : Page(u"%1 Mender"_s.arg(core::product)), m_surroundings(std::move(surroundings)), m_place(new PlaceBar),
      m_view(new AccountView), m_running(new QProgressBar), m_acts(new ActPanel),
      m_report(add_action(u"&Save report…"_s, u"document-save"_s,
                          u"Writes what stands here to a text file, without names of people (Ctrl+S)"_s))
{
    setObjectName(u"mender"_s);
    setWindowTitle(title());
    setMinimumSize(least_size);
    auto* content = new QWidget;
    content->setLayout(make_content());
    set_content(content);
    connect(m_report, &QAction::triggered, this, &MenderWindow::save_report);
    connect(m_place, &PlaceBar::drive_chosen, this, [this] {
        if (!m_busy) // Then the field is only left because it is closed.
            list_churches(m_place->data_drive(), 0);
    });
    connect(m_place, &PlaceBar::browse_wanted, this, &MenderWindow::browse);
    connect(m_place, &PlaceBar::church_chosen, this, &MenderWindow::forget);
    connect(m_place, &PlaceBar::check_wanted, this, &MenderWindow::check);
    connect(m_acts, &ActPanel::chosen, this, &MenderWindow::act);
    add_keys();
    list_churches(m_surroundings.request.data_drive, m_surroundings.request.church);
    m_place->lead_to_check();
}

QBoxLayout* MenderWindow::make_content()
{
    m_running->setObjectName(u"running"_s);
    m_running->setRange(0, 0);
    m_running->setTextVisible(false);
    auto* told = new QVBoxLayout;
    told->setSpacing(space::field);
    told->addWidget(m_running);
    told->addWidget(m_view, 1);
    auto* halves = new QHBoxLayout;
    halves->setSpacing(space::group);
    halves->addLayout(told, 1);
    halves->addWidget(m_acts);
    auto* column = new QVBoxLayout;
    column->setContentsMargins(space::group, 0, space::margin, space::margin);
    column->setSpacing(space::margin);
    column->addWidget(m_place);
    column->addLayout(halves, 1);
    return column;
}

void MenderWindow::add_keys()
{
    m_report->setShortcut(QKeySequence::Save);
    new QShortcut(Qt::Key_F5, this, [this] { check(); });
    new QShortcut(Qt::Key_F1, this, [this] { open_help(m_surroundings.windows, help()); });
    new QShortcut(Qt::CTRL | Qt::Key_W, this, [this] { close(); });
}

void MenderWindow::list_churches(const QString& data_drive, int church)
{
    const core::StartRequest request{core::Purpose::command_line, church, data_drive};
    m_place->show_list(desktop::list_churches(request, *m_surroundings.workstation()));
    forget();
}

void MenderWindow::browse()
{
    const auto folder = m_surroundings.dialogue.choose_file(
        {.title = u"Data drive: the folder in which '%1' lies"_s.arg(core::data_folder),
         .filter = {},
         .suggested = m_place->data_drive(),
         .kind = FileQuestion::Kind::folder});
    if (folder)
        list_churches(*folder, 0);
}

void MenderWindow::forget()
{
    note().clear();
    m_told.reset();
    show_account(account_at_start());
}

void MenderWindow::show_account(const Account& account)
{
    m_account = account;
    m_running->setVisible(m_busy);
    m_place->setEnabled(!m_busy);
    m_acts->setEnabled(!m_busy);
    m_report->setEnabled(!m_busy);
    chip().set(account.chip, account.state);
    m_view->show_account(account);
    m_acts->offer(account);
}

void MenderWindow::lead_on()
{
    if (m_acts->lead_to(m_account.next))
        return;
    if (m_account.next == MenderAct::check)
        m_place->lead_to_check();
    else
        m_view->setFocus(Qt::OtherFocusReason);
}

void MenderWindow::act(MenderAct what)
{
    if (m_place->settle_drive() || !m_told) // Nothing is known of a church of that drive.
        return;
    const MenderJob job = *m_told;
    if (what == MenderAct::recover)
        recover(job);
    else if (what == MenderAct::put_in_place)
        put_in_place(job);
    for (const auto& planned : planned_acts) {
        const core::Message question{.text = planned.question(job.request.church),
                                     .more = found_for(m_account, what),
                                     .icon = core::Icon::question};
        if (planned.act == what && m_surroundings.dialogue.confirm(question, core::Answer::no))
            work(job, QString::fromUtf16(planned.doing).arg(job.church), true, planned.work);
    }
}

MenderJob MenderWindow::chosen_job() const
{
    return {.workstation = m_surroundings.workstation,
            .clock = m_surroundings.clock,
            .request = {core::Purpose::command_line, m_place->church(), m_place->data_drive()},
            .church = m_place->church_in_words()};
}

void MenderWindow::work(const MenderJob& job, const QString& what, bool changes,
                        const std::function<Account(const MenderJob&)>& work)
{
    note().clear();
    m_busy = true;
    show_account(account_of_work(what, changes));
    Account account;
    try {
        run_beside([&] { account = work(job); });
    } catch (...) { // Whatever it is, the window must not stay at work.
        account = account_of_failure(u"The work ended in a way that cannot be told."_s);
    }
    m_busy = false;
    m_told.emplace(job);
    show_account(account);
    lead_on();
}

void MenderWindow::check()
{
    if (m_busy)
        return;
    const int church = m_place->church();
    m_place->settle_drive();
    if (m_place->church() > 0 && m_place->church() == church)
        return work(chosen_job(), u"Looking at %1"_s.arg(m_place->church_in_words()), false, check_church);
    m_place->lead_to_check();
    note().say(m_place->church() == 0 ? u"Choose the church first: there are several on this data drive."_s
                                      : u"See which church of this data drive is chosen, then check it."_s);
}

void MenderWindow::recover(const MenderJob& job)
{
    if (const auto files = ask_for_recovery(m_surroundings.dialogue, m_account, job.request.data_drive))
        work(job, u"Recovering what can be read"_s, true,
             [&, open = m_account.makes_way](const MenderJob& given) { return recover_church(given, *files, open); });
}

void MenderWindow::put_in_place(const MenderJob& job)
{
    if (const auto recovered = ask_for_placing(m_surroundings.dialogue, m_account, job))
        work(job, u"Putting the recovered file in the place of %1"_s.arg(job.church), true,
             [&](const MenderJob& given) { return put_church_in_place(given, *recovered); });
}

void MenderWindow::save_report()
{
    const QDateTime now = m_surroundings.clock.now();
    const QString folder = QStandardPaths::writableLocation(QStandardPaths::DocumentsLocation);
    const auto file = m_surroundings.dialogue.choose_file(
        {.title = u"Save report"_s,
         .filter = u"Text (*.txt)"_s,
         .suggested = u"%1/Kindrel Mender report %2.txt"_s.arg(folder, now.toString(u"yyyy-MM-dd")),
         .kind = FileQuestion::Kind::save});
    if (!file)
        return;
    core::write_file(*file, report_of(m_account, m_told ? m_told->request.church : m_place->church(), now));
    note().say(u"The report is saved as '%1'. It names nobody."_s.arg(*file));
}

void MenderWindow::closeEvent(QCloseEvent* event)
{
    if (!m_busy) {
        Q_EMIT closed();
        return;
    }
    event->ignore();
    note().say(u"The window stays open until the work is done."_s);
}

} // namespace kindrel::desktop
