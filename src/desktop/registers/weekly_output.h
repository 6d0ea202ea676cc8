#pragma once

#include "desktop/shell/desk.h"
#include "registers/weekly_reports.h"

#include <QWidget>

class QComboBox;

namespace kindrel::desktop {

class CategoryTicks;
class ChartChoice;
class WeeklyPeriodFields;
class WeeklyReportList;

/// Chooses a report of a weekly project, its categories, period and chart, and opens it in a preview. Every choice is
/// remembered.
class WeeklyOutput : public QWidget
{
    Q_OBJECT

public:
    /// Settles what is not saved of a project before it is reported on: what is then to be remarked on the report;
    /// nullopt when none is to be made.
    using Settle = std::function<std::optional<QString>(int project)>;

    WeeklyOutput(Desk& desk, Settle settle, QWidget* parent = nullptr);

    /// Reads the projects and their categories again.
    void reload();
    void focus_reports();
    void run();
    /// The table of the report that is chosen.
    void save_csv();

Q_SIGNALS:
    /// Nothing to be said any more when empty.
    void remarked(const QString& words);

private:
    [[nodiscard]] QWidget* make_choices();
    [[nodiscard]] QWidget* make_categories();
    void choose_project(int key);
    void keep_ticks();
    /// What the report is to be written from, its choices remembered. Nullopt when it was refused; the cursor then
    /// stands in the choice that is in the way.
    [[nodiscard]] std::optional<registers::WeeklyPlan> plan(registers::ReportParts parts);
    [[nodiscard]] registers::WeeklyReportRequest request(const registers::PeriodChoice& period,
                                                         registers::ReportParts parts) const;
    void focus_choice(registers::ReportField choice);
    /// The list in which a choice of categories is to be mended.
    [[nodiscard]] CategoryTicks& guilty_ticks() const;
    [[nodiscard]] int project() const;

    Desk& m_desk;
    Settle m_settle;
    QComboBox* m_project;
    WeeklyReportList* m_reports;
    WeeklyPeriodFields* m_period;
    ChartChoice* m_chart;
    CategoryTicks *m_attendance, *m_finance;
};

} // namespace kindrel::desktop
