#include "desktop/registers/figure_grid.h"

#include "desktop/shell/list_view.h"

#include <QKeyEvent>
#include <QLineEdit>

#include <algorithm>

namespace kindrel::desktop {

namespace {

/// How many rows the key goes on by when a cell is left with it; 0 when it does not leave the cell.
int rows_of(const QKeyEvent& key)
{
    switch (key.key()) {
    case Qt::Key_Return:
    case Qt::Key_Enter:
    case Qt::Key_Down:
        return 1;
    case Qt::Key_Up:
        return -1;
    default:
        return 0;
    }
}

} // namespace

FigureCells::FigureCells(QAbstractItemView& view) : InPlaceEditing(view) {}

QWidget* FigureCells::createEditor(QWidget* parent, const QStyleOptionViewItem& option, const QModelIndex& index) const
{
    auto* cell = InPlaceEditing::createEditor(parent, option, index);
    if (auto* line = qobject_cast<QLineEdit*>(cell)) {
        line->setObjectName(index.data(field_name_role).toString());
        line->setAlignment(Qt::AlignRight);
        connect(line, &QLineEdit::textEdited, this, &FigureCells::edited);
    }
    return cell;
}

bool FigureCells::eventFilter(QObject* target, QEvent* event)
{
    const bool pressed = event->type() == QEvent::KeyPress && qobject_cast<QLineEdit*>(target);
    const int rows = pressed ? rows_of(*static_cast<QKeyEvent*>(event)) : 0;
    if (rows == 0)
        return InPlaceEditing::eventFilter(target, event);
    if (finish())
        Q_EMIT left(rows);
    return true;
}

FigureGrid::FigureGrid(QWidget* parent) : QTableView(parent), m_cells(new FigureCells(*this))
{
    make_row_list(*this);
    setSelectionBehavior(SelectItems);
    setEditTriggers(AnyKeyPressed | DoubleClicked);
    connect(m_cells, &FigureCells::left, this, &FigureGrid::go);
    connect(m_cells, &FigureCells::edited, this, &FigureGrid::edited);
}

QModelIndex FigureGrid::figure_cell(int row) const
{
    for (int column = 0; column < model()->columnCount(); ++column) {
        const QModelIndex cell = model()->index(row, column);
        if (cell.flags() & Qt::ItemIsEditable)
            return cell;
    }
    return model()->index(row, 0);
}

void FigureGrid::start()
{
    if (model()->rowCount() > 0)
        setCurrentIndex(figure_cell(0));
    setFocus();
}

void FigureGrid::go(int rows)
{
    const int last = model()->rowCount() - 1;
    if (last >= 0)
        setCurrentIndex(figure_cell(std::clamp(currentIndex().row() + rows, 0, last)));
}

QModelIndex FigureGrid::moveCursor(CursorAction action, Qt::KeyboardModifiers modifiers)
{
    const int row = currentIndex().row();
    const int last = model()->rowCount() - 1;
    switch (action) {
    case MoveNext:
        return row < last ? figure_cell(row + 1) : QModelIndex();
    case MovePrevious:
        return row > 0 ? figure_cell(row - 1) : QModelIndex();
    case MoveLeft:
    case MoveRight:
        return currentIndex();
    case MoveHome:
        return figure_cell(0);
    case MoveEnd:
        return figure_cell(last);
    default: {
        const QModelIndex cell = QTableView::moveCursor(action, modifiers);
        return cell.isValid() ? figure_cell(cell.row()) : cell;
    }
    }
}

void FigureGrid::currentChanged(const QModelIndex& current, const QModelIndex& previous)
{
    QTableView::currentChanged(current, previous);
    if (!current.isValid())
        return;
    const QModelIndex cell = figure_cell(current.row());
    if (cell != current)
        QMetaObject::invokeMethod(
            this, [this, wanted = QPersistentModelIndex(cell)] { setCurrentIndex(wanted); }, Qt::QueuedConnection);
}

void FigureGrid::clear_cell()
{
    const QModelIndex cell = currentIndex();
    if (cell.isValid() && model()->setData(cell, QString()))
        Q_EMIT edited();
}

void FigureGrid::keyPressEvent(QKeyEvent* event)
{
    const bool enter = event->key() == Qt::Key_Return || event->key() == Qt::Key_Enter;
    if (enter && event->modifiers() == Qt::NoModifier)
        go(1);
    else if (event->key() == Qt::Key_Delete)
        clear_cell();
    else
        QTableView::keyPressEvent(event);
}

} // namespace kindrel::desktop
