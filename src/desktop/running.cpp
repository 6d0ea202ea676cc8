#include "desktop/running.h"

#include "desktop/areas.h"
#include "desktop/backup/backup_page.h"
#include "desktop/backup/exit_question.h"
#include "desktop/backup/restore_page.h"
#include "desktop/church_choice.h"
#include "desktop/people/editor_page.h"
#include "desktop/people/speed_find.h"
#include "desktop/people/tagging_page.h"
#include "desktop/shell/main_window.h"
#include "desktop/shell/page.h"

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

Running::Running(Surroundings surroundings) : m_surroundings(std::move(surroundings)) {}

Running::~Running()
{
    close();
}

bool Running::start(int church)
{
    const core::StartRequest request{.church = church, .data_drive = m_surroundings.data_drive};
    m_office = core::start_up(request, m_surroundings.workstation, m_surroundings.dialogue, m_surroundings.clock,
                              m_surroundings.progress);
    if (!m_office)
        return false;
    if (m_surroundings.opened)
        m_surroundings.opened(*m_office);
    build();
    return true;
}

void Running::build()
{
    m_remembered = std::make_unique<Remembered>(m_office->paths.folder(core::Folder::local_settings), m_office->church);
    const int appearance = m_remembered->common_value(u"appearance"_s, int(Appearance::desktop)).toInt();
    m_surroundings.look.apply(Appearance(appearance), m_remembered->common_value(u"text_percent"_s, 100).toInt());
    m_windows = std::make_unique<Windows>(*m_remembered);
    m_desk.reset(
        new Desk{*m_office, m_surroundings.progress, *m_remembered, *m_windows, m_surroundings.printing, *this});
    m_window = std::make_unique<MainWindow>(*m_desk, all_areas(), m_surroundings.look);
    connect(m_window.get(), &MainWindow::closed, this, [this] {
        m_windows->close_all();
        if (m_surroundings.ended)
            m_surroundings.ended();
    });
    connect(m_window.get(), &MainWindow::page_made, this, &Running::listen_to);
    m_window->set_last_question([this] { return may_exit(); });
    m_window->show();
}

void Running::close()
{
    m_windows.reset();
    m_window.reset();
    m_desk.reset();
    m_remembered.reset();
    m_office.reset();
}

void Running::find_family()
{
    bring_forward(*m_window);
    if (!m_speed_find) {
        m_speed_find = new SpeedFindWindow(*m_desk, *m_window);
        connect(m_speed_find, &SpeedFindWindow::family_wanted, this, [this](const QString& surname) {
            in_editor([surname](EditorPage& page) { return page.new_family(surname); });
        });
    }
    m_speed_find->ask();
}

void Running::open_area(const QString& key)
{
    QMetaObject::invokeMethod(
        m_window.get(), [this, key] { m_window->open_area(key); }, Qt::QueuedConnection);
}

void Running::in_editor(std::function<bool(EditorPage&)> act)
{
    QMetaObject::invokeMethod(
        m_window.get(),
        [this, act = std::move(act)] {
            const auto key = u"editor"_s;
            const bool parked = m_window->page_of(key);
            m_window->open_area(key);
            auto* page = qobject_cast<EditorPage*>(m_window->page());
            if (page && !act(*page) && !parked)
                Q_EMIT page->finished();
        },
        Qt::QueuedConnection);
}

void Running::open_family(int surname_id, std::vector<int> among, const QString& among_name)
{
    in_editor([surname_id, among = std::move(among), among_name](EditorPage& page) {
        return page.open_family(surname_id, among, among_name);
    });
}

void Running::new_family()
{
    in_editor([](EditorPage& page) { return page.new_family(); });
}

void Running::to_tagging(people::WorkingList found)
{
    QMetaObject::invokeMethod(
        m_window.get(),
        [this, found = std::move(found)] {
            m_window->open_area(u"tagging"_s);
            if (auto* page = qobject_cast<TaggingPage*>(m_window->page()))
                page->take_people(found);
        },
        Qt::QueuedConnection);
}

void Running::open_draft(int surname_id)
{
    in_editor([surname_id](EditorPage& page) { return page.open_draft(surname_id); });
}

void Running::load_church(int church)
{
    QMetaObject::invokeMethod(
        this, [this, church] { switch_to(church); }, Qt::QueuedConnection);
}

void Running::switch_to(int church)
{
    if (!m_window->leave_all())
        return;
    // From the moment there is a second church, start-up goes by the marks: the first one needs its own.
    const bool to_own_church = church < core::training_church;
    if (to_own_church && church != m_office->church)
        mark_as_set_up(*m_office);
    close();
    const bool started = start(church);
    if (started && to_own_church)
        mark_as_set_up(*m_office);
    if (!started && m_surroundings.ended)
        m_surroundings.ended();
}

void Running::listen_to(Page* page)
{
    // Put off until the page's own slot has returned: the page may have to go.
    if (auto* restoring = qobject_cast<RestorePage*>(page))
        connect(
            restoring, &RestorePage::restore_wanted, this,
            [this, still_there = QPointer(restoring)] {
                if (still_there)
                    restore(*still_there);
            },
            Qt::QueuedConnection);
    if (auto* backup = qobject_cast<BackupPage*>(page))
        connect(backup, &BackupPage::exit_wanted, this, &Running::exit_after_backup, Qt::QueuedConnection);
}

void Running::restore(RestorePage& page)
{
    if (!m_window->make_way_for(u"restore"_s))
        return;
    core::Message outcome;
    try {
        const auto report = core::restore_backup(*m_office, page.request(), m_surroundings.progress);
        if (!report) {
            page.say_unchanged();
            return;
        }
        outcome = restored_message(*report, m_office->day_order());
    } catch (const core::RestoreUnsettled& unsettled) {
        outcome.text = unsettled.text();
    }
    const int church = m_office->church;
    close();
    m_surroundings.dialogue.show(outcome);
    if (!start(church) && m_surroundings.ended)
        m_surroundings.ended();
}

bool Running::may_exit()
{
    if (m_exit_backup_made)
        return true;
    const auto backup_first = wants_backup_before_exit(*m_office);
    if (!backup_first || !*backup_first)
        return backup_first.has_value();
    m_window->open_area(u"backup"_s);
    if (auto* page = qobject_cast<BackupPage*>(m_window->page()))
        page->exit_afterwards();
    return false;
}

void Running::exit_after_backup()
{
    m_exit_backup_made = true;
    m_exit_backup_made = !m_window->close();
}

} // namespace kindrel::desktop
