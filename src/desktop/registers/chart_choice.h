#pragma once

#include "desktop/shell/desk.h"
#include "registers/weekly_reports.h"

#include <QComboBox>

namespace kindrel::desktop {

/// The chart style of a report. The person's own choice stays while a report that needs a chart has one proposed.
class ChartChoice : public QComboBox
{
    Q_OBJECT

public:
    explicit ChartChoice(Remembered& remembered, QWidget* parent = nullptr);

    /// What the report can do with a chart.
    void fit(registers::ReportCharts charts);
    /// Null: without charts.
    [[nodiscard]] const pages::ChartStyle* style() const;
    /// The person's own choice, for the next time.
    void remember();

private:
    Remembered& m_remembered;
    int m_own; ///< The place in the list.
};

} // namespace kindrel::desktop
