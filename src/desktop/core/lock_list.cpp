#include "desktop/core/lock_list.h"

#include "desktop/shell/empty_panel.h"
#include "desktop/shell/list_view.h"

#include <QFocusEvent>
#include <QHeaderView>
#include <QVBoxLayout>

namespace kindrel::desktop {

using namespace Qt::StringLiterals;

namespace {

const QString not_known = u"not known"_s;

QString where(const core::HeldLock& lock)
{
    const QString name = lock.holder.workstation.isEmpty() ? not_known : lock.holder.workstation;
    if (lock.stale)
        return u"%1 (this workstation, left behind)"_s.arg(name);
    return lock.holder.this_workstation ? u"%1 (this workstation)"_s.arg(name) : name;
}

QString since(const core::HeldLock& lock, core::DayOrder order)
{
    const QDateTime& taken = lock.holder.since;
    if (!taken.isValid())
        return not_known;
    return u"%1 on %2"_s.arg(taken.toString(u"HH:mm"), core::Date::from(taken.date()).shown(order));
}

} // namespace

LockList::LockList() : QTableWidget(0, 3), m_nothing(new EmptyPanel)
{
    setObjectName(u"locks"_s);
    setAccessibleName(u"What is locked"_s);
    setHorizontalHeaderLabels({u"What is locked"_s, u"Where"_s, u"Since"_s});
    make_row_list(*this);
    m_nothing->say(u"Nothing is locked"_s, u"Nobody keeps others out of any part of this church."_s);
    auto* over = new QVBoxLayout(viewport());
    over->setContentsMargins(0, 0, 0, 0);
    over->addWidget(m_nothing);
}

void LockList::show_locks(const std::vector<core::HeldLock>& locks, core::DayOrder order)
{
    clearSelection();
    setRowCount(static_cast<int>(locks.size()));
    for (int row = 0; row < rowCount(); ++row) {
        const core::HeldLock& lock = locks[static_cast<std::size_t>(row)];
        const QStringList words{lock.what, where(lock), since(lock, order)};
        for (int column = 0; column < columnCount(); ++column) {
            auto* cell = new QTableWidgetItem(words[column]);
            cell->setToolTip(words[column]);
            setItem(row, column, cell);
        }
    }
    m_nothing->setVisible(locks.empty());
}

std::optional<int> LockList::chosen() const
{
    const auto rows = selectionModel()->selectedRows();
    return rows.isEmpty() ? std::nullopt : std::optional(rows.first().row());
}

void LockList::focusInEvent(QFocusEvent* event)
{
    QTableWidget::focusInEvent(event);
    if (!chosen() && event->reason() != Qt::MouseFocusReason && event->reason() != Qt::ActiveWindowFocusReason)
        selectRow(0);
}

} // namespace kindrel::desktop
