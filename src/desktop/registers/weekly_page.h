#pragma once

#include "core/entry.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "registers/weekly_register.h"

class QStackedWidget;
class QTabWidget;

namespace kindrel::desktop {

class WeeklyEntry;
class WeeklyOutput;

/// Weekly statistics: the figures of one date at a time, and the reports on them. The project is locked for others
/// while one of its dates is open.
class WeeklyPage : public Page
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static WeeklyPage* open(Desk& desk);
    ~WeeklyPage() override;

    [[nodiscard]] QString help() const override { return QStringLiteral("weekly"); }
    void entered() override;
    void find() override;
    void print() override;
    bool save() override;
    [[nodiscard]] bool altered() const override;
    [[nodiscard]] bool holds_lock() const override { return m_weekly.open_date().has_value(); }
    [[nodiscard]] bool leave() override;

private:
    WeeklyPage(Desk& desk, core::AreaEntry entry);

    [[nodiscard]] QWidget* make_empty();
    [[nodiscard]] QWidget* make_unread();
    /// False also when the projects could not be read, which is told.
    [[nodiscard]] bool enter_register();
    void add_actions();
    void turn_to(int tab);
    [[nodiscard]] bool at_entry() const;
    /// Runs what saves; false also when that failed, which is told.
    [[nodiscard]] bool stored(const std::function<bool()>& store);
    /// Offers to save the open date's figures, without which a report on its project would be made; returns what is
    /// then to be remarked on it. Nullopt: no report.
    [[nodiscard]] std::optional<QString> settle_for_report(int project);
    void remark(const QString& words);
    void show_state();

    Desk& m_desk;
    core::AreaEntry m_entry;
    registers::WeeklyRegister m_weekly;
    QTabWidget* m_tabs;
    QStackedWidget* m_content;
    WeeklyEntry* m_figures;
    WeeklyOutput* m_output;
    bool m_saved = false;
};

} // namespace kindrel::desktop
