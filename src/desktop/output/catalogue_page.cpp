#include "desktop/output/catalogue_page.h"

#include "core/entry.h"
#include "desktop/output/chosen_people.h"
#include "desktop/output/report_drawing.h"
#include "desktop/output/report_run.h"
#include "desktop/output/report_tree.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"

#include <QComboBox>
#include <QHBoxLayout>
#include <QLabel>
#include <QLocale>
#include <QPushButton>

#include <utility>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int tree_width = 340;
constexpr int from_tagging = 1; ///< The place of that choice of people.
const QString paper_key = u"reports/paper"_s;

} // namespace

CataloguePage::CataloguePage(Desk& desk)
    : Page(u"Create Reports and Data Analysis"_s), m_desk(desk), m_tree(new ReportTree(desk.office)),
      m_leaf(make_heading({})), m_description(make_value()), m_scope(make_value()), m_people(new QComboBox),
      m_paper(new QComboBox), m_drawing(new ReportDrawing(desk))
{
    setObjectName(u"reports"_s);
    keep_width(*m_tree, tree_width);
    connect(m_tree, &ReportTree::chosen_changed, this, &CataloguePage::show_chosen);
    connect(m_tree, &ReportTree::wanted, this, &CataloguePage::open_chosen);
    auto* content = new QWidget;
    auto* row = new QHBoxLayout(content);
    row->setContentsMargins(space::group, 0, space::group, space::margin);
    row->setSpacing(2 * space::group);
    row->addWidget(m_tree);
    row->addLayout(make_details(), 1);
    set_content(content);
}

QLayout* CataloguePage::make_details()
{
    auto* column = new QVBoxLayout;
    column->setSpacing(space::margin);
    for (QLabel* label : {m_leaf, m_description}) {
        label->setWordWrap(true);
        column->addWidget(label);
    }
    column->addLayout(make_people());
    column->addLayout(make_scope());
    column->addLayout(make_paper());
    column->addWidget(m_drawing, 1);
    return column;
}

QLayout* CataloguePage::make_people()
{
    m_people->setObjectName(u"people"_s);
    m_people->setSizeAdjustPolicy(QComboBox::AdjustToContents);
    connect(m_people, &QComboBox::activated, this, &CataloguePage::show_chosen);
    auto* caption = new QLabel(u"Pe&ople"_s);
    caption->setBuddy(m_people);
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(caption);
    row->addWidget(m_people);
    row->addStretch(1);
    return row;
}

QLayout* CataloguePage::make_scope()
{
    m_scope->setObjectName(u"scope"_s);
    dress(*m_scope, TextSize::secondary);
    auto* tagging = new QPushButton(icon(u"tag"_s), u"Choose people in &Tagging"_s);
    tagging->setObjectName(u"open_tagging"_s);
    tagging->setEnabled(core::may_enter(m_desk.office, core::AreaId::tagging));
    connect(tagging, &QPushButton::clicked, this, [this] {
        m_tagging_wanted = true;
        m_desk.navigation.open_area(u"tagging"_s);
    });
    auto* row = new QHBoxLayout;
    row->setSpacing(space::group);
    row->addWidget(m_scope, 1);
    row->addWidget(tagging, 0, Qt::AlignTop);
    return row;
}

QLayout* CataloguePage::make_paper()
{
    auto* preview = new QPushButton(icon(u"document-print-preview"_s), u"&Preview"_s);
    preview->setObjectName(u"preview"_s);
    preview->setToolTip(u"Enter, Ctrl+P"_s);
    connect(preview, &QPushButton::clicked, this, &CataloguePage::open_chosen);
    m_paper->setObjectName(u"paper"_s);
    m_paper->addItems({u"A4"_s, u"Letter"_s});
    m_paper->setCurrentIndex(std::clamp(m_desk.remembered.value(paper_key, 0).toInt(), 0, m_paper->count() - 1));
    connect(m_paper, &QComboBox::currentIndexChanged, this, [this](int paper) {
        m_desk.remembered.keep(paper_key, paper);
        show_chosen();
    });
    auto* caption = new QLabel(u"P&aper"_s);
    caption->setBuddy(m_paper);
    auto* row = new QHBoxLayout;
    row->setSpacing(space::field);
    row->addWidget(preview);
    row->addSpacing(space::group);
    row->addWidget(caption);
    row->addWidget(m_paper);
    row->addStretch(1);
    return row;
}

void CataloguePage::show_people()
{
    const bool tagging = std::exchange(m_tagging_wanted, false) || m_people->currentIndex() == from_tagging;
    m_chosen = m_desk.chosen;
    m_everybody = people::active_families(*m_desk.office.session);
    m_people->clear();
    m_people->addItem(u"Everybody"_s);
    if (m_chosen)
        m_people->addItem(
            u"The people chosen in Tagging (%1)"_s.arg(QLocale().toString(qsizetype(m_chosen->list.members.size()))));
    m_people->setCurrentIndex(m_chosen && tagging ? from_tagging : 0);
}

const ChosenPeople* CataloguePage::chosen_people() const
{
    return m_people->currentIndex() == from_tagging ? m_chosen.get() : nullptr;
}

output::RunOptions CataloguePage::options() const
{
    auto options = chosen_people() ? chosen_people()->options : output::RunOptions();
    options.paper = static_cast<pages::Paper>(m_paper->currentIndex());
    return options;
}

void CataloguePage::show_chosen()
{
    const auto* report = m_tree->chosen();
    m_leaf->setText(report ? report->leaf : QString());
    m_description->setText(report ? report->description : u"Choose a report."_s);
    const auto* chosen = chosen_people();
    m_scope->setText(chosen ? chosen->list.criteria : u"The living people of the active families."_s);
    m_drawing->show_report(report, chosen ? chosen->list : m_everybody, options());
}

void CataloguePage::open_chosen()
{
    const auto* report = m_tree->chosen_or_told(m_desk.office.dialogue);
    if (!report)
        return;
    const auto* chosen = chosen_people();
    open_report(m_desk, *report, chosen ? chosen->list : people::active_families(*m_desk.office.session), options());
}

void CataloguePage::entered()
{
    m_tree->reload();
    show_people();
    set_status(m_tree->reports() == 1 ? u"1 report"_s : u"%1 reports"_s.arg(m_tree->reports()));
    show_chosen();
    find();
}

void CataloguePage::find()
{
    m_tree->setFocus(Qt::OtherFocusReason);
}

} // namespace kindrel::desktop
