#include "desktop/registers/chart_choice.h"

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::ReportCharts;

namespace {

const QString chart_key = u"weekly/chart"_s;
constexpr int no_chart = 0;
constexpr int proposed = 1;

} // namespace

ChartChoice::ChartChoice(Remembered& remembered, QWidget* parent) : QComboBox(parent), m_remembered(remembered)
{
    addItem(u"No chart"_s);
    for (const auto& style : pages::chart_styles())
        addItem(QString::fromLatin1(style.name));
    m_own = std::max(findText(remembered.value(chart_key).toString()), no_chart);
    setCurrentIndex(m_own);
    connect(this, &QComboBox::activated, this, [this](int chosen) { m_own = chosen; });
}

void ChartChoice::fit(ReportCharts charts)
{
    setEnabled(charts != ReportCharts::none);
    setCurrentIndex(charts == ReportCharts::required && m_own == no_chart ? proposed : m_own);
}

const pages::ChartStyle* ChartChoice::style() const
{
    return pages::find_chart_style(currentText());
}

void ChartChoice::remember()
{
    m_remembered.keep(chart_key, itemText(m_own));
}

} // namespace kindrel::desktop
