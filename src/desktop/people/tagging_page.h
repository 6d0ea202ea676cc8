#pragma once

#include "core/entry.h"
#include "desktop/people/step_bar.h"
#include "desktop/people/step_panel.h"
#include "desktop/people/undo_offers.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "people/tagging.h"

class QStackedWidget;
class QTimer;

namespace kindrel::desktop {

class FilterPanel;
class ProcessPanel;
class WorkingListView;

/// The bench between the people of the church and its output: a list is made step by step, and a report or a bulk
/// change goes over it.
class TaggingPage : public Page
{
    Q_OBJECT

public:
    /// Null, after saying why, when the area cannot be entered.
    [[nodiscard]] static TaggingPage* open(Desk& desk);
    ~TaggingPage() override;

    /// Brings people who were found elsewhere: they become the list, or join the one that is there. The page goes on to
    /// its last step with them.
    void take_people(const people::WorkingList& found);
    [[nodiscard]] QString help() const override { return QStringLiteral("tagging"); }
    void entered() override;
    void find() override;
    void print() override;

private:
    TaggingPage(Desk& desk, core::AreaEntry entry);

    [[nodiscard]] QWidget* make_bench();
    void add_panels();
    void add_keys();
    void add_actions();
    [[nodiscard]] StepPanel& panel(StepBar::Step step) const { return *m_steps[std::size_t(step) - 1]; }
    /// Goes to the step unless the open one lacks something.
    void go_to(StepBar::Step step);
    [[nodiscard]] bool finish_step();
    void take_filter();
    void sheet_changed();
    void make_list();
    /// With the pages that make reports.
    void share_list();
    void tagged(const people::BulkChange& change);
    [[nodiscard]] std::optional<QString> untag(const people::BulkChange& change);

    Desk& m_desk;
    core::AreaEntry m_entry;
    TaggingSheet m_sheet;
    UndoOffers m_undo;
    StepBar* m_bar;
    FilterPanel* m_filter;
    WorkingListView* m_list;
    ProcessPanel* m_process = nullptr;
    QStackedWidget *m_views, *m_panels;
    std::vector<StepPanel*> m_steps; ///< From the sort step on.
    QTimer* m_pause;
};

} // namespace kindrel::desktop
