#pragma once

#include "desktop/shell/desk.h"
#include "registers/weekly_reports.h"

#include <QWidget>

class QComboBox;
class QLabel;
class QListWidget;

namespace kindrel::desktop {

class CategoryTicks;
class WeeklyPeriodFields;

/// Chooses a report of a weekly project, its categories, period and chart, and opens it in a preview. Every choice is
/// remembered.
class WeeklyOutput : public QWidget
{
    Q_OBJECT

public:
    explicit WeeklyOutput(Desk& desk, QWidget* parent = nullptr);

    /// Reads the projects and their categories again.
    void reload();
    void focus_reports();
    void run();

private:
    [[nodiscard]] QWidget* make_choices();
    [[nodiscard]] QWidget* make_categories();
    void fill_reports();
    void choose_project(int key);
    /// The report chosen last; at first the first one that holds all categories.
    void choose_report();
    void show_report();
    void keep_ticks();
    [[nodiscard]] int project() const;
    /// Null when there is none.
    [[nodiscard]] const registers::WeeklyReport* report() const;

    Desk& m_desk;
    QComboBox* m_project;
    QListWidget* m_reports;
    QLabel* m_description;
    WeeklyPeriodFields* m_period;
    QComboBox* m_chart;
    CategoryTicks *m_attendance, *m_finance;
};

} // namespace kindrel::desktop
