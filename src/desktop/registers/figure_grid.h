#pragma once

#include "desktop/shell/in_place_editing.h"

#include <QTableView>

namespace kindrel::desktop {

/// Of a cell's data: the name of the field that it is typed in.
inline constexpr int field_name_role = Qt::UserRole;

/// Cells that are typed one below the other: Enter, Up and Down hand over what was typed and go on.
class FigureCells : public InPlaceEditing
{
    Q_OBJECT

public:
    explicit FigureCells(QAbstractItemView& view);

    QWidget* createEditor(QWidget* parent, const QStyleOptionViewItem& option, const QModelIndex& index) const override;

Q_SIGNALS:
    /// By so many rows; the text of the cell was taken.
    void left(int rows);
    void edited();

protected:
    bool eventFilter(QObject* target, QEvent* event) override;
};

/// A table with one cell to a row that can be typed into, which may stand in different columns. The cursor is always
/// in such a cell: typing replaces its text, a double click opens it.
class FigureGrid : public QTableView
{
    Q_OBJECT

public:
    explicit FigureGrid(QWidget* parent = nullptr);

    [[nodiscard]] FigureCells& cells() { return *m_cells; }
    /// The cursor goes to the first row.
    void start();

Q_SIGNALS:
    /// Something is being typed.
    void edited();

protected:
    QModelIndex moveCursor(CursorAction action, Qt::KeyboardModifiers modifiers) override;
    void currentChanged(const QModelIndex& current, const QModelIndex& previous) override;
    void keyPressEvent(QKeyEvent* event) override;

private:
    /// The cell of the row that is typed into; the first one where there is none.
    [[nodiscard]] QModelIndex figure_cell(int row) const;
    void go(int rows);
    void clear_cell();

    FigureCells* m_cells;
};

} // namespace kindrel::desktop
