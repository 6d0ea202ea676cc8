#include "desktop/people/process_panel.h"

#include "desktop/output/report_drawing.h"
#include "desktop/output/report_run.h"
#include "desktop/output/report_tree.h"
#include "desktop/people/bulk_panel.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QLabel>
#include <QPushButton>
#include <QTabWidget>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString tab_key = u"tagging/process"_s;

} // namespace

ProcessPanel::ProcessPanel(Desk& desk, TaggingSheet& sheet)
    : StepPanel(sheet, u"Process"_s), m_desk(desk), m_tree(new ReportTree(desk.office)),
      m_drawing(new ReportDrawing(desk)), m_description(make_value()), m_bulk(new BulkPanel(desk)),
      m_tabs(new QTabWidget)
{
    m_tabs->setObjectName(u"process_tabs"_s);
    m_tabs->setDocumentMode(true);
    m_tabs->addTab(make_reports(), u"&Report"_s);
    m_tabs->addTab(m_bulk, u"&Bulk change"_s);
    m_tabs->setCurrentIndex(desk.remembered.value(tab_key, 0).toInt());
    connect(m_tabs, &QTabWidget::currentChanged, this, [this](int tab) {
        m_desk.remembered.keep(tab_key, tab);
        focus_first();
    });
    connect(m_bulk, &BulkPanel::done, this, &ProcessPanel::tagged);
    auto* column = new QVBoxLayout(this);
    column->setContentsMargins(0, 0, 0, 0);
    column->addWidget(m_tabs);
}

QWidget* ProcessPanel::make_reports()
{
    auto* preview = new QPushButton(icon(u"document-print-preview"_s), u"Pre&view"_s);
    preview->setObjectName(u"preview"_s);
    preview->setToolTip(u"Enter, Ctrl+P"_s);
    connect(preview, &QPushButton::clicked, this, &ProcessPanel::open_report);
    connect(m_tree, &ReportTree::wanted, this, &ProcessPanel::open_report);
    connect(m_tree, &ReportTree::chosen_changed, this, &ProcessPanel::show_chosen);
    auto* reports = new QWidget;
    auto* column = new QVBoxLayout(reports);
    column->setContentsMargins(0, space::field, 0, 0);
    column->setSpacing(space::field);
    column->addWidget(m_tree, 3);
    column->addWidget(m_description);
    column->addWidget(m_drawing, 2);
    column->addWidget(preview, 0, Qt::AlignLeft);
    show_chosen();
    return reports;
}

void ProcessPanel::show_chosen()
{
    const auto* report = m_tree->chosen();
    m_description->setText(report ? report->description : QString());
    m_drawing->show_report(report, m_list, sheet().options);
}

void ProcessPanel::reload()
{
    m_bulk->reload();
    m_tree->reload();
    show_chosen();
}

void ProcessPanel::focus_first()
{
    if (m_tabs->currentWidget() == m_bulk)
        m_bulk->focus_first();
    else
        m_tree->setFocus(Qt::OtherFocusReason);
}

void ProcessPanel::set_list(const people::WorkingList& list)
{
    m_list = list;
    m_bulk->set_list(list);
    show_chosen();
}

void ProcessPanel::open_report()
{
    if (const auto* report = m_tree->chosen_or_told(m_desk.office.dialogue))
        desktop::open_report(m_desk, *report, m_list, sheet().options);
}

} // namespace kindrel::desktop
