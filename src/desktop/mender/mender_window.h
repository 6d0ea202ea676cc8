#pragma once

#include "desktop/mender/mender_works.h"
#include "desktop/shell/page.h"

class QBoxLayout;
class QProgressBar;

namespace kindrel::desktop {

class AccountView;
class ActPanel;
class PlaceBar;
class Windows;

/// What the window was given to work with.
struct MenderSurroundings
{
    /// A new one each time: some are used beside the window.
    std::function<std::unique_ptr<core::Workstation>()> workstation;
    core::Dialogue& dialogue;
    core::Clock& clock;
    Windows& windows;
    core::StartRequest request; ///< The data drive and church that are chosen at first.
};

/// The window of the Mender: chooses a church, looks at it and, when asked to, mends, unlocks or recovers it. Keeps no
/// church open between two pieces of work.
class MenderWindow : public Page
{
    Q_OBJECT

public:
    explicit MenderWindow(MenderSurroundings surroundings);

    [[nodiscard]] QString help() const override { return QStringLiteral("mender"); }
    /// Writes what the window tells to a file that the person names.
    void save_report();

Q_SIGNALS:
    void closed();

protected:
    void closeEvent(QCloseEvent* event) override;

private:
    [[nodiscard]] QBoxLayout* make_content();
    void add_keys();
    void list_churches(const QString& data_drive, int church);
    void browse();
    void forget();
    void show_account(const Account& account);
    void lead_on();

    void act(MenderAct what);
    void check();
    void recover(const MenderJob& job);
    void put_in_place(const MenderJob& job);
    [[nodiscard]] MenderJob chosen_job() const;
    /// Shows `what` while the work runs beside the window, then what came of it.
    void work(const MenderJob& job, const QString& what, bool changes,
              const std::function<Account(const MenderJob&)>& work);

    MenderSurroundings m_surroundings;
    PlaceBar* m_place;
    AccountView* m_view;
    QProgressBar* m_running;
    ActPanel* m_acts;
    QAction* m_report;
    Account m_account;
    std::optional<MenderJob> m_told; ///< Of which church the account tells; that one is worked on, whatever is chosen.
    bool m_busy = false;
};

} // namespace kindrel::desktop
