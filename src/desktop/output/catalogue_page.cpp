#include "desktop/output/catalogue_page.h"

#include "desktop/output/preview_window.h"
#include "desktop/shell/icons.h"
#include "desktop/shell/look.h"
#include "desktop/shell/value_form.h"
#include "output/catalogue.h"

#include <QHBoxLayout>
#include <QKeyEvent>
#include <QLabel>
#include <QPushButton>
#include <QTreeWidget>

#include <memory>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int key_role = Qt::UserRole;
constexpr int tree_width = 320;

} // namespace

CataloguePage::CataloguePage(Desk& desk)
    : Page(u"Create Reports and Data Analysis"_s), m_desk(desk), m_tree(new QTreeWidget), m_leaf(make_heading({})),
      m_description(make_value())
{
    setObjectName(u"reports"_s);
    m_tree->setObjectName(u"catalogue"_s);
    m_tree->setAccessibleName(u"Reports"_s);
    m_tree->setHeaderHidden(true);
    keep_width(*m_tree, tree_width);
    m_tree->installEventFilter(this);
    connect(m_tree, &QTreeWidget::currentItemChanged, this, &CataloguePage::show_chosen);
    connect(m_tree, &QTreeWidget::itemDoubleClicked, this, &CataloguePage::open_chosen);
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
    fill_tree();
}

void CataloguePage::fill_tree()
{
    QTreeWidgetItem* family = nullptr;
    int count = 0;
    for (const auto& report : output::catalogue()) {
        const QString family_name = QString::fromLatin1(report.family);
        if (!family || family->text(0) != family_name)
            family = new QTreeWidgetItem(m_tree, {family_name});
        auto* leaf = new QTreeWidgetItem(family, {QString::fromLatin1(report.leaf)});
        leaf->setData(0, key_role, QString::fromLatin1(report.key));
        if (++count == 1)
            m_tree->setCurrentItem(leaf);
    }
    m_tree->expandAll();
    set_status(count == 1 ? u"1 report"_s : u"%1 reports"_s.arg(count));
}

QString CataloguePage::chosen_key() const
{
    const auto* item = m_tree->currentItem();
    return item ? item->data(0, key_role).toString() : QString();
}

void CataloguePage::show_chosen()
{
    const auto* report = output::find_report(chosen_key());
    m_leaf->setText(report ? QString::fromLatin1(report->leaf) : QString());
    m_description->setText(report ? QString::fromLatin1(report->description) : QString());
}

void CataloguePage::open_chosen()
{
    const auto* report = output::find_report(chosen_key());
    if (!report) {
        m_desk.office.dialogue.show({u"Please choose a report"_s});
        return;
    }
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

bool CataloguePage::eventFilter(QObject* target, QEvent* event)
{
    if (target == m_tree && event->type() == QEvent::KeyPress) {
        const int key = static_cast<QKeyEvent*>(event)->key();
        if (key == Qt::Key_Return || key == Qt::Key_Enter) {
            open_chosen();
            return true;
        }
    }
    return Page::eventFilter(target, event);
}

} // namespace kindrel::desktop
