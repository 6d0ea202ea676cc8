#include "desktop/output/report_tree.h"

#include <QKeyEvent>
#include <QTreeWidgetItemIterator>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

constexpr int place_role = Qt::UserRole;

} // namespace

ReportTree::ReportTree(const core::Office& office, QWidget* parent) : QTreeWidget(parent), m_office(office)
{
    setObjectName(u"catalogue"_s);
    setAccessibleName(u"Reports"_s);
    setHeaderHidden(true);
    connect(this, &QTreeWidget::currentItemChanged, this, &ReportTree::chosen_changed);
    connect(this, &QTreeWidget::itemDoubleClicked, this, [this](const QTreeWidgetItem* item) {
        if (item->data(0, place_role).isValid())
            Q_EMIT wanted();
    });
}

void ReportTree::reload()
{
    const bool first_time = m_choices.empty();
    const auto* before = chosen();
    const QString key = before ? before->key : QString();
    fill();
    choose(first_time && !m_choices.empty() ? m_choices.front().key : key);
}

void ReportTree::fill()
{
    const QSignalBlocker quiet(this);
    clear();
    m_choices = output::report_choices(m_office);
    QTreeWidgetItem* family = nullptr;
    for (std::size_t place = 0; place < m_choices.size(); ++place) {
        const auto& choice = m_choices[place];
        if (!family || family->text(0) != choice.family)
            family = new QTreeWidgetItem(this, {choice.family});
        auto* leaf = new QTreeWidgetItem(family, {choice.leaf});
        leaf->setData(0, place_role, int(place));
    }
    for (const char* own : output::own_families) {
        const auto name = QString::fromLatin1(own);
        if (findItems(name, Qt::MatchExactly).isEmpty())
            new QTreeWidgetItem(this, {name});
    }
}

void ReportTree::choose(const QString& key)
{
    for (QTreeWidgetItemIterator item(this); *item; ++item) {
        const auto place = (*item)->data(0, place_role);
        if (place.isValid() && m_choices[place.toUInt()].key == key)
            return setCurrentItem(*item);
    }
}

const output::ReportChoice* ReportTree::chosen() const
{
    const auto* item = currentItem();
    const auto place = item ? item->data(0, place_role) : QVariant();
    return place.isValid() ? &m_choices[place.toUInt()] : nullptr;
}

const output::ReportChoice* ReportTree::chosen_or_told(core::Dialogue& dialogue) const
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
