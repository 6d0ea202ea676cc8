#pragma once

#include "desktop/people/step_panel.h"
#include "desktop/shell/desk.h"
#include "people/tagging.h"

class QLabel;
class QTabWidget;

namespace kindrel::desktop {

class BulkPanel;
class ReportDrawing;
class ReportTree;

/// The last step: a report over the list, or a bulk change of its people.
class ProcessPanel : public StepPanel
{
    Q_OBJECT

public:
    ProcessPanel(Desk& desk, TaggingSheet& sheet);

    void reload() override;
    void focus_first() override;
    void set_list(const people::WorkingList& list);
    /// Shows the chosen report in a preview.
    void open_report();

Q_SIGNALS:
    void tagged(const people::BulkChange& change);

private:
    [[nodiscard]] QWidget* make_reports();
    void show_chosen();

    Desk& m_desk;
    people::WorkingList m_list;
    ReportTree* m_tree;
    ReportDrawing* m_drawing;
    QLabel* m_description;
    BulkPanel* m_bulk;
    QTabWidget* m_tabs;
};

} // namespace kindrel::desktop
