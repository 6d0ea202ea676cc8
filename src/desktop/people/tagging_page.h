#pragma once

#include "core/entry.h"
#include "desktop/people/step_bar.h"
#include "desktop/people/step_panel.h"
#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "people/tagging.h"

#include <functional>

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
    void sheet_changed();
    void make_list();
    void tagged(const people::BulkChange& change);
    [[nodiscard]] std::optional<QString> untag(const people::BulkChange& change);
    /// Something that was done, and what takes it back: that tells how it went, or nullopt where it could not.
    struct Undo
    {
        QString words;
        std::function<std::optional<QString>()> act;
    };
    /// In the note bar and by Ctrl+Z, one after the other, the last first.
    void offer_undo(Undo undo);
    void show_undo(const QString& told = {});
    void take_back();

    Desk& m_desk;
    core::AreaEntry m_entry;
    TaggingSheet m_sheet;
    std::vector<Undo> m_undos; ///< The latest last.
    StepBar* m_bar;
    FilterPanel* m_filter;
    WorkingListView* m_list;
    ProcessPanel* m_process = nullptr;
    QStackedWidget *m_views, *m_panels;
    std::vector<StepPanel*> m_steps; ///< From the sort step on.
    QTimer* m_pause;
};

} // namespace kindrel::desktop
