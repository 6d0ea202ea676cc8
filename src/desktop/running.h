#pragma once

#include "core/startup.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/look.h"

#include <QObject>
#include <QPointer>

namespace kindrel::desktop {

class EditorPage;
class MainWindow;
class Page;
class QtDialogue;
class RestorePage;
class SpeedFindWindow;

/// What the running program was given to work with.
struct Surroundings
{
    core::Workstation& workstation;
    core::Dialogue& dialogue;
    core::Clock& clock;
    core::Progress& progress;
    Printing& printing;
    Look& look;
    QString data_drive;                                   ///< As of StartRequest.
    std::function<void(const core::Office&)> opened = {}; ///< An office is open; its screens come next.
    std::function<void()> ended = {};                     ///< The program is to end.
};

/// The office that is open and its screens; switching church closes both and builds new ones.
class Running : public QObject, public Navigation
{
    Q_OBJECT

public:
    explicit Running(Surroundings surroundings);
    ~Running() override;

    /// Starts up and shows the main window. False when start-up ended the program.
    [[nodiscard]] bool start(int church);
    /// Null while no office is open.
    [[nodiscard]] Desk* desk() { return m_desk.get(); }
    [[nodiscard]] MainWindow* window() { return m_window.get(); }

    void find_family() override;
    void open_area(const QString& key) override;
    void open_family(int surname_id, std::vector<int> among, const QString& among_name) override;
    void new_family() override;
    void to_tagging(people::WorkingList found) override;
    void open_draft(int surname_id) override;
    void load_church(int church) override;

private:
    /// Enters the editor; it is closed again when nothing could be opened in it.
    void in_editor(std::function<bool(EditorPage&)> act);
    void switch_to(int church);
    /// What pages ask for that only the running program can do.
    void listen_to(Page* page);
    /// Everything that is open leaves, and the program starts anew into the restored church.
    void restore(RestorePage& page);
    /// False: the person stays, or makes a backup first.
    [[nodiscard]] bool may_exit();
    void exit_after_backup();
    void build();
    void close();

    Surroundings m_surroundings;
    std::unique_ptr<core::Office> m_office;
    std::unique_ptr<Remembered> m_remembered;
    std::unique_ptr<Windows> m_windows;
    std::unique_ptr<Desk> m_desk;
    std::unique_ptr<MainWindow> m_window;
    bool m_exit_backup_made = false;
    QPointer<SpeedFindWindow> m_speed_find; ///< The main window's; null until it is first wanted.
};

} // namespace kindrel::desktop
