#pragma once

#include "desktop/shell/desk.h"
#include "registers/weekly_reports.h"

#include <QWidget>

class QLabel;
class QListWidget;

namespace kindrel::desktop {

/// The reports on weekly statistics, and what the chosen one shows. The choice is remembered.
class WeeklyReportList : public QWidget
{
    Q_OBJECT

public:
    explicit WeeklyReportList(Remembered& remembered, QWidget* parent = nullptr);

    /// The report chosen last; at first the first one that holds so many categories.
    void choose(int categories);
    [[nodiscard]] const registers::WeeklyReport& report() const;

Q_SIGNALS:
    /// Another report is shown.
    void shown();
    /// Enter was pressed in the list, or a report clicked twice.
    void activated();

private:
    void show_report();

    Remembered& m_remembered;
    QListWidget* m_list;
    QLabel* m_description;
};

} // namespace kindrel::desktop
