#include "desktop/output/report_tree.h"

#include <QKeyEvent>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int key_role = Qt::UserRole;

} // namespace

ReportTree::ReportTree(QWidget* parent) : QTreeWidget(parent)
{
    setObjectName(u"catalogue"_s);
    setAccessibleName(u"Reports"_s);
    setHeaderHidden(true);
    connect(this, &QTreeWidget::currentItemChanged, this, &ReportTree::chosen_changed);
    connect(this, &QTreeWidget::itemDoubleClicked, this, &ReportTree::wanted);
    fill();
}

void ReportTree::fill()
{
    QTreeWidgetItem* family = nullptr;
    for (const auto& report : output::catalogue()) {
        const QString family_name = QString::fromLatin1(report.family);
        if (!family || family->text(0) != family_name)
            family = new QTreeWidgetItem(this, {family_name});
        auto* leaf = new QTreeWidgetItem(family, {QString::fromLatin1(report.leaf)});
        leaf->setData(0, key_role, QString::fromLatin1(report.key));
        if (++m_reports == 1)
            setCurrentItem(leaf);
    }
    expandAll();
}

const output::ReportDefinition* ReportTree::chosen() const
{
    const auto* item = currentItem();
    return item ? output::find_report(item->data(0, key_role).toString()) : nullptr;
}

const output::ReportDefinition* ReportTree::chosen_or_told(core::Dialogue& dialogue) const
{
    const auto* report = chosen();
    if (!report)
        dialogue.show({u"Please choose a report"_s});
    return report;
}

void ReportTree::keyPressEvent(QKeyEvent* event)
{
    if (event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter)
        Q_EMIT wanted();
    else
        QTreeWidget::keyPressEvent(event);
}

} // namespace kindrel::desktop
