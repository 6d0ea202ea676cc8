#pragma once

#include "desktop/shell/desk.h"
#include "desktop/shell/page.h"
#include "people/working_list.h"

class QLabel;
class QStackedWidget;

namespace kindrel::desktop {

class FilterPanel;
class FoundPeople;

/// Chooses people by a filter and lists those whom it finds.
class FiltersPage : public Page
{
    Q_OBJECT

public:
    explicit FiltersPage(Desk& desk);

    [[nodiscard]] QString help() const override { return QStringLiteral("filters"); }
    void entered() override;
    void find() override;
    void print() override;

private:
    [[nodiscard]] QWidget* make_filter();
    [[nodiscard]] QWidget* make_people();
    void add_actions();
    [[nodiscard]] bool shows_people() const;
    void show_people();
    void show_filter();
    void show_count();
    void save_list();
    /// Whether a list of people is there to be given out; finds them first where the filter stands in front.
    [[nodiscard]] bool people_at_hand();
    void open_family(int surname_id);

    Desk& m_desk;
    FilterPanel* m_panel;
    FoundPeople* m_people;
    QStackedWidget* m_stack;
    QLabel* m_criteria;
};

} // namespace kindrel::desktop
