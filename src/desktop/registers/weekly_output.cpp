#include "desktop/registers/weekly_output.h"

#include "desktop/output/preview_window.h"
#include "desktop/registers/category_ticks.h"
#include "desktop/registers/chart_choice.h"
#include "desktop/registers/weekly_period_fields.h"
#include "desktop/registers/weekly_report_list.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/side_panel.h"
#include "desktop/shell/table_text.h"
#include "registers/projects.h"
#include "registers/weekly_tables.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QPushButton>
#include <QScrollArea>
#include <QStandardItemModel>

#include <algorithm>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;
using registers::FigureKind;
using registers::ReportField;
using registers::ReportParts;

namespace {

constexpr int choices_width = 308;
constexpr auto kind = registers::Kind::weekly;
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

} // namespace

WeeklyOutput::WeeklyOutput(Desk& desk, Settle settle, QWidget* parent)
    : QWidget(parent), m_desk(desk), m_settle(std::move(settle)), m_project(new QComboBox),
      m_reports(new WeeklyReportList(desk.remembered)), m_period(new WeeklyPeriodFields(desk)),
      m_chart(new ChartChoice(desk.remembered)),
      m_attendance(new CategoryTicks({u"Atten&dance categories"_s, u"A&ll"_s, u"&None"_s}, u"A_att"_s)),
      m_finance(new CategoryTicks({u"Financial cate&gories"_s, u"&All"_s, u"N&one"_s}, u"A_fin"_s))
{
    auto* row = new QHBoxLayout(this);
    row->setContentsMargins(space::group, space::margin, space::group, space::margin);
    row->setSpacing(space::group);
    row->addWidget(make_choices());
    row->addWidget(make_categories(), 1);
    connect(m_project, &QComboBox::activated, this, [this] { choose_project(project()); });
    connect(m_reports, &WeeklyReportList::shown, this, [this] {
        m_period->fit(m_reports->report().period);
        m_chart->fit(m_reports->report().charts);
    });
    connect(m_reports, &WeeklyReportList::activated, this, &WeeklyOutput::run);
    connect(m_attendance, &CategoryTicks::changed, this, &WeeklyOutput::keep_ticks);
    connect(m_finance, &CategoryTicks::changed, this, &WeeklyOutput::keep_ticks);
}

QWidget* WeeklyOutput::make_choices()
{
    m_project->setObjectName(u"output_project"_s);
    m_project->setSizeAdjustPolicy(QComboBox::AdjustToMinimumContentsLengthWithIcon);
    m_chart->setObjectName(u"chart"_s);
    auto* preview = new QPushButton(icon(u"document-print-preview"_s), u"Pre&view"_s);
    preview->setObjectName(u"btn_up_down"_s);
    preview->setToolTip(u"Enter in the list of reports, Ctrl+P"_s);
    connect(preview, &QPushButton::clicked, this, &WeeklyOutput::run);
    auto* column = new QVBoxLayout;
    column->setContentsMargins(0, 0, 0, 0);
    column->setSpacing(space::field);
    column->addLayout(with_caption(u"&Project"_s, m_project));
    column->addWidget(m_reports);
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
    m_reports->choose(int(m_attendance->ticked().size() + m_finance->ticked().size()));
}

int WeeklyOutput::project() const
{
    return m_project->currentData().toInt();
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

void WeeklyOutput::keep_ticks()
{
    QVariantList left_out;
    for (const int key : m_attendance->left_out() + m_finance->left_out())
        left_out += key;
    m_desk.remembered.keep(left_out_key(project()), left_out);
}

registers::WeeklyReportRequest WeeklyOutput::request(const registers::PeriodChoice& period, ReportParts parts) const
{
    auto categories = m_attendance->ticked();
    std::ranges::copy(m_finance->ticked(), std::back_inserter(categories));
    return {.project = project(),
            .report = &m_reports->report(),
            .categories = std::move(categories),
            .period = period,
            .chart = m_chart->style(),
            .parts = parts};
}

std::optional<registers::WeeklyPlan> WeeklyOutput::plan(ReportParts parts)
{
    Q_EMIT remarked({});
    const auto period = m_period->choice();
    if (!period)
        return {};
    auto& office = m_desk.office;
    registers::ReportCheck check{office.dialogue};
    auto made = registers::check_weekly_report(office, request(*period, parts), check);
    const auto remark = made ? m_settle(project()) : std::nullopt;
    made = remark ? registers::with_figures(*office.session, std::move(*made), check) : std::nullopt;
    if (made) {
        m_period->remember();
        m_chart->remember();
        Q_EMIT remarked(*remark);
    } else if (check.guilty) {
        focus_choice(*check.guilty);
    }
    return made;
}

CategoryTicks& WeeklyOutput::guilty_ticks() const
{
    const bool any_ticked = !m_attendance->ticked().empty();
    const bool any_to_tick = !m_attendance->left_out().isEmpty() && m_finance->ticked().empty();
    return any_ticked || any_to_tick ? *m_attendance : *m_finance;
}

void WeeklyOutput::focus_choice(ReportField choice)
{
    switch (choice) {
    case ReportField::project:
        return m_project->setFocus();
    case ReportField::report:
        return m_reports->setFocus();
    case ReportField::categories:
        return guilty_ticks().focus_list();
    case ReportField::chart:
        return m_chart->setFocus();
    case ReportField::from:
    case ReportField::to:
        return m_period->focus_end(choice);
    }
}

void WeeklyOutput::run()
{
    auto made = plan(ReportParts::pages);
    if (!made)
        return;
    const auto paper = static_cast<pages::Paper>(m_desk.remembered.value(paper_key, 0).toInt() == 1);
    const auto title = QString::fromUtf8(made->report->title);
    open_preview(m_desk, title,
                 [&office = m_desk.office, plan = std::make_shared<const registers::WeeklyPlan>(std::move(*made)),
                  paper](core::Progress& progress, pages::PageSpool& spool) {
                     return registers::write_weekly_report(office, *plan, paper, progress, spool);
                 });
}

void WeeklyOutput::save_csv()
{
    if (!core::permitted(m_desk.office, core::Area::export_text))
        return;
    const auto made = plan(ReportParts::table);
    if (!made)
        return;
    const auto table = registers::weekly_table(*made);
    QStandardItemModel model(0, int(table.columns.size()));
    model.setHorizontalHeaderLabels(table.columns);
    for (const auto& row : table.rows) {
        if (row.kind == registers::WeeklyTable::RowKind::section)
            continue; // Money has its sign.
        QList<QStandardItem*> items;
        for (const auto& text : row.texts)
            items += new QStandardItem(text);
        model.appendRow(items);
    }
    save_as_csv(model, QString::fromUtf8(made->report->title), m_desk.office.dialogue);
}

void WeeklyOutput::focus_reports()
{
    m_reports->setFocus();
}

} // namespace kindrel::desktop
