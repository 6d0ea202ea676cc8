#pragma once

#include "desktop/people/step_panel.h"
#include "desktop/shell/desk.h"

class QComboBox;
class QListWidget;

namespace kindrel::desktop {

class DateSearchFields;

/// The order of the working list, the search by date that narrows it, and the family type.
class SortPanel : public StepPanel
{
    Q_OBJECT

public:
    SortPanel(Desk& desk, TaggingSheet& sheet);

    void reload() override;
    void focus_first() override;
    [[nodiscard]] bool is_set() const override;
    [[nodiscard]] bool finish() override;

private:
    void make_orders();
    [[nodiscard]] QComboBox* make_types();
    void add_order(people::SortBy by, int item, const QString& text);
    void add_kinds(people::SortBy by, people::SetupKind kind);
    /// What is chosen goes into the sheet.
    void take();
    [[nodiscard]] bool may_sort() const;

    Desk& m_desk;
    QListWidget* m_orders;
    DateSearchFields* m_search;
    QComboBox* m_types;
};

} // namespace kindrel::desktop
