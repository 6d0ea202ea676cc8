#include "desktop/shell/in_place_editing.h"

#include <QAbstractItemView>
#include <QFocusEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QScopedValueRollback>

namespace kindrel::desktop {

InPlaceEditing::InPlaceEditing(QAbstractItemView& view) : QStyledItemDelegate(&view), m_view(view)
{
    view.setItemDelegate(this);
}

QWidget* InPlaceEditing::createEditor(QWidget* parent, const QStyleOptionViewItem&, const QModelIndex& index) const
{
    m_cell = new QLineEdit(parent);
    m_cell->setObjectName(QStringLiteral("cell"));
    m_cell->setAccessibleName(index.model()->headerData(index.column(), Qt::Horizontal).toString());
    m_index = index;
    return m_cell;
}

bool InPlaceEditing::altered() const
{
    return m_cell && m_index.isValid() && m_cell->text() != m_index.data(Qt::EditRole).toString();
}

bool InPlaceEditing::hand_over()
{
    if (!altered())
        return true;
    const QScopedValueRollback asking(m_handing_over, true);
    return m_view.model()->setData(m_index, m_cell->text());
}

bool InPlaceEditing::finish()
{
    if (!hand_over()) {
        come_back(m_cell->text());
        return false;
    }
    give_up();
    return true;
}

void InPlaceEditing::give_up()
{
    if (m_cell)
        Q_EMIT closeEditor(m_cell);
    m_cell = nullptr;
}

void InPlaceEditing::come_back(const QString& refused)
{
    if (!m_cell && m_index.isValid()) {
        m_view.setCurrentIndex(m_index);
        m_view.edit(m_index);
    }
    if (!m_cell)
        return;
    m_cell->setText(refused);
    m_cell->setFocus();
    m_cell->selectAll();
}

bool InPlaceEditing::left_by(const QEvent& event) const
{
    if (event.type() == QEvent::KeyPress) {
        const int key = static_cast<const QKeyEvent&>(event).key();
        return key == Qt::Key_Return || key == Qt::Key_Enter || key == Qt::Key_Tab || key == Qt::Key_Backtab;
    }
    return event.type() == QEvent::FocusOut;
}

bool InPlaceEditing::eventFilter(QObject* target, QEvent* event)
{
    if (target != m_cell)
        return QStyledItemDelegate::eventFilter(target, event);
    if (event->type() == QEvent::FocusOut) {
        const auto reason = static_cast<QFocusEvent*>(event)->reason();
        if (m_handing_over || reason == Qt::ActiveWindowFocusReason || reason == Qt::PopupFocusReason)
            return false; // The cell stays open behind a box, a menu or another window.
    }
    if (left_by(*event) && !hand_over()) {
        // After the click that led out of the cell, for the view may close it.
        QMetaObject::invokeMethod(
            this, [this, refused = m_cell->text()] { come_back(refused); }, Qt::QueuedConnection);
        return event->type() != QEvent::FocusOut;
    }
    return QStyledItemDelegate::eventFilter(target, event);
}

} // namespace kindrel::desktop
