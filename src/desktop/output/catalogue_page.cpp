#include "desktop/output/catalogue_page.h"

#include "desktop/output/preview_window.h"
#include "desktop/output/report_tree.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QHBoxLayout>
#include <QLabel>
#include <QPushButton>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int tree_width = 320;

} // namespace

CataloguePage::CataloguePage(Desk& desk)
    : Page(u"Create Reports and Data Analysis"_s), m_desk(desk), m_tree(new ReportTree), m_leaf(make_heading({})),
      m_description(make_value())
{
    setObjectName(u"reports"_s);
    keep_width(*m_tree, tree_width);
    connect(m_tree, &ReportTree::chosen_changed, this, &CataloguePage::show_chosen);
    connect(m_tree, &ReportTree::wanted, this, &CataloguePage::open_chosen);
    auto* preview = new QPushButton(icon(u"document-print-preview"_s), u"&Preview"_s);
    preview->setObjectName(u"preview"_s);
    connect(preview, &QPushButton::clicked, this, &CataloguePage::open_chosen);
    auto* scope = make_value();
    scope->setText(u"The report is made of all active families."_s);
    dress(*scope, TextSize::secondary);

    auto* details = new QVBoxLayout;
    details->setSpacing(space::margin);
    for (QLabel* label : {m_leaf, m_description, scope})
        details->addWidget(label);
    details->addWidget(preview, 0, Qt::AlignLeft);
    details->addStretch(1);
    auto* content = new QWidget;
    auto* row = new QHBoxLayout(content);
    row->setContentsMargins(space::group, 0, space::group, space::margin);
    row->setSpacing(2 * space::group);
    row->addWidget(m_tree);
    row->addLayout(details, 1);
    set_content(content);
    set_status(m_tree->reports() == 1 ? u"1 report"_s : u"%1 reports"_s.arg(m_tree->reports()));
    show_chosen();
}

void CataloguePage::show_chosen()
{
    const auto* report = m_tree->chosen();
    m_leaf->setText(report ? QString::fromLatin1(report->leaf) : QString());
    m_description->setText(report ? QString::fromLatin1(report->description) : QString());
}

void CataloguePage::open_chosen()
{
    const auto* report = m_tree->chosen_or_told(m_desk.office.dialogue);
    if (!report)
        return;
    open_preview(m_desk, QString::fromLatin1(report->leaf),
                 [report, &office = m_desk.office](core::Progress& progress, pages::PageSpool& spool) {
                     const people::WorkingList list = people::active_families(*office.session);
                     return output::run_report(*report, {office, list}, progress, spool);
                 });
}

void CataloguePage::entered()
{
    m_tree->setFocus();
}

} // namespace kindrel::desktop
