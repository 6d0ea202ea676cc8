#include "desktop/registers/weekly_output.h"

#include "desktop/output/preview_window.h"
#include "desktop/registers/category_ticks.h"
#include "desktop/registers/weekly_period_fields.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/side_panel.h"
#include "desktop/shell/value_form.h"
#include "registers/projects.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QListWidget>
#include <QPushButton>
#include <QScrollArea>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::FigureKind;
using registers::ReportCharts;

namespace {

constexpr int choices_width = 308;
constexpr int caption_width = WeeklyPeriodFields::caption_width;
constexpr int description_lines = 5;
constexpr auto kind = registers::Kind::weekly;
const QString report_key = u"weekly/report"_s;
const QString chart_key = u"weekly/chart"_s;
const QString paper_key = u"reports/paper"_s; ///< As for all reports.

QString left_out_key(int project)
{
    return u"weekly/left_out_%1"_s.arg(project);
}

QList<int> numbers(const QVariantList& values)
{
    QList<int> found;
    for (const QVariant& value : values)
        found += value.toInt();
    return found;
}

QLayout* with_caption(const QString& caption, QWidget* control)
{
    auto* words = new QLabel(caption);
    words->setBuddy(control);
    keep_width(*words, caption_width);
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(words);
    row->addWidget(control, 1);
    return row;
}

} // namespace

WeeklyOutput::WeeklyOutput(Desk& desk, QWidget* parent)
    : QWidget(parent), m_desk(desk), m_project(new QComboBox), m_reports(new QListWidget), m_description(make_value()),
      m_period(new WeeklyPeriodFields(desk)), m_chart(new QComboBox),
      m_attendance(new CategoryTicks({u"Atten&dance categories"_s, u"A&ll"_s, u"&None"_s}, u"A_att"_s)),
      m_finance(new CategoryTicks({u"Financial cate&gories"_s, u"&All"_s, u"N&one"_s}, u"A_fin"_s))
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(space::group, space::margin, space::group, space::margin);
    row->setSpacing(space::group);
    row->addWidget(make_choices());
    row->addWidget(make_categories(), 1);
    fill_reports();
    connect(m_project, &QComboBox::activated, this, [this] { choose_project(project()); });
    connect(m_reports, &QListWidget::currentRowChanged, this, [this] {
        show_report();
        if (const auto* chosen = report())
            m_desk.remembered.keep(report_key, QString::fromLatin1(chosen->name));
    });
    connect(m_reports, &QListWidget::itemActivated, this, &WeeklyOutput::run);
    connect(m_attendance, &CategoryTicks::changed, this, &WeeklyOutput::keep_ticks);
    connect(m_finance, &CategoryTicks::changed, this, &WeeklyOutput::keep_ticks);
}

QWidget* WeeklyOutput::make_choices()
{
    m_project->setObjectName(u"output_project"_s);
    m_project->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_reports->setObjectName(u"output_type"_s);
    m_description->setObjectName(u"description"_s);
    m_description->setAlignment(Qt::AlignTop);
    m_description->setMinimumHeight(description_lines * m_description->fontMetrics().lineSpacing());
    m_chart->setObjectName(u"chart"_s);
    auto* reports = new QLabel(u"&Report"_s);
    reports->setBuddy(m_reports);
    auto* preview = new QPushButton(icon(u"document-print-preview"_s), u"Pre&view"_s);
    preview->setObjectName(u"btn_up_down"_s);
    preview->setToolTip(u"Enter in the list of reports, Ctrl+P"_s);
    connect(preview, &QPushButton::clicked, this, &WeeklyOutput::run);
    auto* column = new QVBoxLayout;
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addLayout(with_caption(u"&Project"_s, m_project));
    column->addWidget(reports);
    column->addWidget(m_reports);
    column->addWidget(m_description);
    column->addWidget(m_period);
    column->addLayout(with_caption(u"&Chart"_s, m_chart));
    column->addWidget(preview, 0, Qt::AlignLeft);
    column->addStretch(1);
    return make_side_panel(column, choices_width);
}

QWidget* WeeklyOutput::make_categories()
{
    auto* both = new QWidget;
    auto* row = new QHBoxLayout(both);
    row->setContentsMargins(0, 0, 0, 0);
    row->setSpacing(space::group);
    row->addWidget(m_attendance, 1);
    row->addWidget(m_finance, 1);
    return both;
}

void WeeklyOutput::fill_reports()
{
    QString before;
    for (const auto& each : registers::weekly_reports()) {
        const QString title = QString::fromUtf8(each.title);
        m_reports->addItem(title == before ? title + u", across the page"_s : title);
        before = title;
    }
    m_reports->setFixedHeight(m_reports->count() * row_height() + 2 * m_reports->frameWidth());
    m_chart->addItem(u"No chart"_s);
    for (const auto& style : pages::chart_styles())
        m_chart->addItem(QString::fromLatin1(style.name));
    const int kept = m_chart->findText(m_desk.remembered.value(chart_key).toString());
    m_chart->setCurrentIndex(std::max(kept, 0));
}

void WeeklyOutput::reload()
{
    auto& session = *m_desk.office.session;
    const auto& of = registers::register_kind(kind);
    {
        const QSignalBlocker quiet(m_project);
        m_project->clear();
        for (const auto& each : registers::read_projects(session, of))
            m_project->addItem(each.name, each.key);
        m_project->setCurrentIndex(
            m_project->findData(registers::remembered_project(session, of, registers::Page::output)));
    }
    choose_project(project());
    choose_report();
}

int WeeklyOutput::project() const
{
    return m_project->currentData().toInt();
}

const registers::WeeklyReport* WeeklyOutput::report() const
{
    const int row = m_reports->currentRow();
    return row < 0 ? nullptr : &registers::weekly_reports()[std::size_t(row)];
}

void WeeklyOutput::choose_project(int key)
{
    auto& session = *m_desk.office.session;
    const auto& of = registers::register_kind(kind);
    if (key != 0 && key != registers::remembered_project(session, of, registers::Page::output))
        registers::remember_project(session, of, registers::Page::output, key);
    m_project->setToolTip(m_project->currentText());
    const auto left_out = numbers(m_desk.remembered.value(left_out_key(key)).toList());
    auto finance = registers::read_categories(session, key);
    const auto money =
        std::ranges::stable_partition(finance, [](const auto& each) { return each.kind == FigureKind::attendance; });
    m_attendance->show_categories({finance.begin(), money.begin()}, left_out);
    m_finance->show_categories({money.begin(), money.end()}, left_out);
}

void WeeklyOutput::choose_report()
{
    const auto reports = registers::weekly_reports();
    const auto* wanted = registers::find_weekly_report(m_desk.remembered.value(report_key).toString());
    const auto categories = int(m_attendance->ticked().size() + m_finance->ticked().size());
    const auto fitting =
        std::ranges::find_if(reports, [&](const auto& each) { return each.most_categories >= categories; });
    if (!wanted && fitting != reports.end())
        wanted = &*fitting;
    {
        const QSignalBlocker quiet(m_reports);
        m_reports->setCurrentRow(wanted ? int(wanted - reports.data()) : 0);
    }
    show_report();
}

void WeeklyOutput::show_report()
{
    const auto* chosen = report();
    if (!chosen)
        return;
    m_description->setText(QString::fromUtf8(chosen->description) + u'.');
    m_period->fit(chosen->period);
    m_chart->setEnabled(chosen->charts != ReportCharts::none);
    if (chosen->charts == ReportCharts::required && m_chart->currentIndex() == 0)
        m_chart->setCurrentIndex(1);
}

void WeeklyOutput::keep_ticks()
{
    QVariantList left_out;
    for (const int key : m_attendance->left_out() + m_finance->left_out())
        left_out += key;
    m_desk.remembered.keep(left_out_key(project()), left_out);
}

void WeeklyOutput::run()
{
    const auto* chosen = report();
    const auto period = m_period->choice();
    if (!period)
        return;
    auto categories = m_attendance->ticked();
    std::ranges::copy(m_finance->ticked(), std::back_inserter(categories));
    registers::WeeklyReportRequest request{.project = project(),
                                           .report = chosen,
                                           .categories = std::move(categories),
                                           .period = *period,
                                           .chart = pages::find_chart_style(m_chart->currentText())};
    m_period->remember();
    m_desk.remembered.keep(chart_key, m_chart->currentText());
    const auto paper = static_cast<pages::Paper>(m_desk.remembered.value(paper_key, 0).toInt() == 1);
    const auto title = chosen ? QString::fromUtf8(chosen->title) : u"Weekly Statistics"_s;
    open_preview(m_desk, title,
                 [&office = m_desk.office, request, paper](core::Progress& progress, pages::PageSpool& spool) {
                     return registers::run_weekly_report(office, request, paper, progress, spool);
                 });
}

void WeeklyOutput::focus_reports()
{
    m_reports->setFocus();
}

} // namespace kindrel::desktop
