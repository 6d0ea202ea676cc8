#include "desktop/registers/weekly_report_list.h"

#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QLabel>
#include <QListWidget>
#include <QVBoxLayout>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int description_lines = 5;
const QString report_key = u"weekly/report"_s;

} // namespace

WeeklyReportList::WeeklyReportList(Remembered& remembered, QWidget* parent)
    : QWidget(parent), m_remembered(remembered), m_list(new QListWidget), m_description(make_value())
{
    m_list->setObjectName(u"output_type"_s);
    m_description->setObjectName(u"description"_s);
    m_description->setAlignment(Qt::AlignTop);
    m_description->setMinimumHeight(description_lines * m_description->fontMetrics().lineSpacing());
    auto* caption = new QLabel(u"&Report"_s);
    caption->setBuddy(m_list);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    for (QWidget* part :
         {static_cast<QWidget*>(caption), static_cast<QWidget*>(m_list), static_cast<QWidget*>(m_description)})
        column->addWidget(part);
    setFocusProxy(m_list);
    QString before;
    for (const auto& each : registers::weekly_reports()) {
        const QString title = QString::fromUtf8(each.title);
        m_list->addItem(title == before ? title + u", across the page"_s : title);
        before = title;
    }
    m_list->setFixedHeight(m_list->count() * row_height() + 2 * m_list->frameWidth());
    m_list->setCurrentRow(0);
    connect(m_list, &QListWidget::currentRowChanged, this, [this] {
        show_report();
        m_remembered.keep(report_key, QString::fromLatin1(report().name));
    });
    connect(m_list, &QListWidget::itemActivated, this, &WeeklyReportList::activated);
}

void WeeklyReportList::choose(int categories)
{
    const auto reports = registers::weekly_reports();
    const auto* wanted = registers::find_weekly_report(m_remembered.value(report_key).toString());
    const auto fitting =
        std::ranges::find_if(reports, [&](const auto& each) { return each.most_categories >= categories; });
    if (!wanted && fitting != reports.end())
        wanted = &*fitting;
    {
        const QSignalBlocker quiet(m_list);
        m_list->setCurrentRow(wanted ? int(wanted - reports.data()) : 0);
    }
    show_report();
}

const registers::WeeklyReport& WeeklyReportList::report() const
{
    return registers::weekly_reports()[std::size_t(std::max(m_list->currentRow(), 0))];
}

void WeeklyReportList::show_report()
{
    m_description->setText(QString::fromUtf8(report().description) + u'.');
    Q_EMIT shown();
}

} // namespace kindrel::desktop
